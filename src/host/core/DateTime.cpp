// ISO text of date-times.
#include "host/core/DateTime.h"

#include <boost/date_time/posix_time/time_formatters.hpp>

namespace orvcore::utility {

std::string ToIsoString(boost::posix_time::ptime const& time) {
    std::string text = boost::posix_time::to_iso_string(time);
    if (time.is_special()) {
        return text;
    }
    std::size_t dot = text.find('.');
    if (dot != std::string::npos) {
        text[dot] = ',';
    }
    return text;
}

} // namespace orvcore::utility
