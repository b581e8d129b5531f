// Placeholder filling and middle truncation of labels.
#include "host/core/StringUtils.h"

#include <algorithm>
#include <cmath>

namespace orvcore::utility {

std::u16string ReplaceInString(std::u16string const& templ, std::u16string const& r0,
                               std::u16string const& r1, std::u16string const& r2, std::u16string const& r3,
                               std::u16string const& r4, std::u16string const& r5, std::u16string const& r6,
                               std::u16string const& r7, std::u16string const& r8, std::u16string const& r9) {
    std::u16string const* values[10] = {&r0, &r1, &r2, &r3, &r4, &r5, &r6, &r7, &r8, &r9};
    std::u16string out;
    out.reserve(templ.size());
    for (std::size_t i = 0; i < templ.size(); ++i) {
        char16_t c = templ[i];
        if (c == u'@' && i + 1 < templ.size() && templ[i + 1] >= u'0' && templ[i + 1] <= u'9') {
            out += *values[templ[i + 1] - u'0'];
            ++i;
        } else {
            out.push_back(c);
        }
    }
    return out;
}

namespace {
bool IsHighSurrogate(char16_t c) {
    return c >= 0xD800 && c <= 0xDBFF;
}
bool IsLowSurrogate(char16_t c) {
    return c >= 0xDC00 && c <= 0xDFFF;
}
} // namespace

std::u16string TruncateUIStringInMiddle(std::u16string const& text, std::size_t maximum, double scale) {
    if (text.size() <= maximum) {
        return text;
    }
    if (maximum == 0) {
        return {};
    }
    if (!(scale >= 0.0)) { // also catches NaN
        scale = 0.0;
    }
    scale = std::min(scale, 1.0);
    std::size_t kept = maximum - 1;
    std::size_t tailLength = static_cast<std::size_t>(std::lround(static_cast<double>(kept) * scale));
    std::size_t headLength = kept - tailLength;
    // Never cut a character in two: drop the half of a pair that would be left alone.
    if (headLength > 0 && IsHighSurrogate(text[headLength - 1])) {
        --headLength;
    }
    std::size_t tailStart = text.size() - tailLength;
    if (tailLength > 0 && IsLowSurrogate(text[tailStart])) {
        ++tailStart;
    }
    return text.substr(0, headLength) + u'\u2026' + text.substr(tailStart);
}

} // namespace orvcore::utility
