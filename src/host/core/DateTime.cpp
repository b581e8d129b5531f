// ISO text of date-times.
#include "host/core/DateTime.h"

#include <boost/date_time/posix_time/time_formatters.hpp>

namespace orvcore::utility {

std::string ToIsoString(boost::posix_time::ptime const& time) {
    if (!time.is_special()) {
        // Formatted by hand: the manager formats one of these per cached file at every start, and
        // the library's stream-based formatter costs several times more. Same text: four-digit year,
        // month, day, 'T', hours, minutes, seconds, and ",ffffff" only for a non-zero fraction.
        auto date = time.date().year_month_day();
        auto clock = time.time_of_day();
        char buffer[32];
        char* end = buffer;
        auto put = [&end](long long value, int digits) {
            for (int i = digits - 1; i >= 0; --i, value /= 10) {
                end[i] = char('0' + value % 10);
            }
            end += digits;
        };
        put(date.year, 4);
        put(date.month, 2);
        put(date.day, 2);
        *end++ = 'T';
        put(clock.hours(), 2);
        put(clock.minutes(), 2);
        put(clock.seconds(), 2);
        if (long long fraction = clock.fractional_seconds(); fraction != 0) {
            *end++ = ',';
            put(fraction, int(boost::posix_time::time_duration::num_fractional_digits()));
        }
        return std::string(buffer, end);
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
