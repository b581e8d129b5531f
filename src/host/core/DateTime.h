// Date-time text in the ISO basic form the workspace manager stores to recognise unchanged files.
#pragma once

#include <boost/date_time/posix_time/ptime.hpp>
#include <string>

namespace orvcore::utility {

// "YYYYMMDDTHHMMSS", then "," and the fractional seconds only when they are not zero
// ("20260102T030405,123456"). This is Boost's to_iso_string form with the comma that older Boost
// releases wrote and that stored settings files hold; newer releases write a dot, which would make
// every cached time mismatch after a Boost upgrade. "not-a-date-time" for an invalid time.
std::string ToIsoString(boost::posix_time::ptime const& time);

} // namespace orvcore::utility
