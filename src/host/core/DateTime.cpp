// ISO text of date-times.
#include "host/core/DateTime.h"

#include <boost/date_time/posix_time/time_formatters.hpp>
#include <cstdio>

namespace orvcore::utility {

std::string ToIsoString(boost::posix_time::ptime const& time) {
    if (!time.is_special()) {
        // Formatted by hand: the manager formats one of these per cached file at every start, and
        // the library's stream-based formatter costs several times more. Same text: four-digit year,
        // month, day, 'T', hours, minutes, seconds, and ",ffffff" only for a non-zero fraction.
        auto date = time.date().year_month_day();
        auto clock = time.time_of_day();
        char buffer[48];
        int n =
            std::snprintf(buffer, sizeof buffer, "%04d%02d%02dT%02d%02d%02d", int(date.year), int(date.month),
                          int(date.day), int(clock.hours()), int(clock.minutes()), int(clock.seconds()));
        std::string text(buffer, std::size_t(n));
        if (long long fraction = clock.fractional_seconds(); fraction != 0) {
            int digits = boost::posix_time::time_duration::num_fractional_digits();
            n = std::snprintf(buffer, sizeof buffer, ",%0*lld", digits, fraction);
            text.append(buffer, std::size_t(n));
        }
        return text;
    }
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
