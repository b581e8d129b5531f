// UTF-8/UTF-16 conversion by hand: the standard's codecvt facets are deprecated and throw on bad
// input, while the library must turn any bytes into something displayable.
#include "host/core/TextConversion.h"

#include <charconv>
#include <limits>

namespace orvcore::utility {

namespace {

constexpr char32_t Replacement = 0xFFFD;

void AppendUTF16(std::u16string& out, char32_t cp) {
    if (cp < 0x10000) {
        out.push_back(static_cast<char16_t>(cp));
    } else {
        cp -= 0x10000;
        out.push_back(static_cast<char16_t>(0xD800 + (cp >> 10)));
        out.push_back(static_cast<char16_t>(0xDC00 + (cp & 0x3FF)));
    }
}

// Decodes one code point at text[i], advancing i past it. An invalid sequence (bad lead byte,
// missing continuation, overlong form, surrogate, beyond U+10FFFF) consumes just its lead byte and
// yields U+FFFD, so the following valid characters survive.
char32_t DecodeUTF8(std::string const& text, std::size_t& i) {
    auto byte = [&](std::size_t k) { return static_cast<unsigned char>(text[k]); };
    unsigned char lead = byte(i);
    if (lead < 0x80) {
        ++i;
        return lead;
    }
    int extra;
    char32_t cp;
    char32_t minimum;
    if ((lead & 0xE0) == 0xC0) {
        extra = 1, cp = lead & 0x1F, minimum = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        extra = 2, cp = lead & 0x0F, minimum = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        extra = 3, cp = lead & 0x07, minimum = 0x10000;
    } else {
        ++i;
        return Replacement;
    }
    if (i + extra >= text.size()) {
        ++i;
        return Replacement;
    }
    for (int k = 1; k <= extra; ++k) {
        unsigned char c = byte(i + k);
        if ((c & 0xC0) != 0x80) {
            ++i;
            return Replacement;
        }
        cp = (cp << 6) | (c & 0x3F);
    }
    if (cp < minimum || cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
        ++i;
        return Replacement;
    }
    i += extra + 1;
    return cp;
}

template <typename Char> bool IsSpace(Char c) {
    return c == Char(' ') || c == Char('\t');
}

} // namespace

void AppendUTF8(std::string& out, char32_t cp) {
    if (cp < 0x80) {
        out.push_back(static_cast<char>(cp));
    } else if (cp < 0x800) {
        out.push_back(static_cast<char>(0xC0 | (cp >> 6)));
        out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    } else if (cp < 0x10000) {
        out.push_back(static_cast<char>(0xE0 | (cp >> 12)));
        out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
        out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    } else {
        out.push_back(static_cast<char>(0xF0 | (cp >> 18)));
        out.push_back(static_cast<char>(0x80 | ((cp >> 12) & 0x3F)));
        out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
        out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    }
}

std::u16string UTF8to16(std::string const& utf8) {
    std::u16string out;
    out.reserve(utf8.size());
    std::size_t i = 0;
    while (i < utf8.size()) {
        // Runs of ASCII (most paths, keys and names are nothing else) are copied without decoding.
        std::size_t run = i;
        while (run < utf8.size() && static_cast<unsigned char>(utf8[run]) < 0x80) {
            ++run;
        }
        out.append(utf8.begin() + std::ptrdiff_t(i), utf8.begin() + std::ptrdiff_t(run));
        i = run;
        if (i < utf8.size()) {
            AppendUTF16(out, DecodeUTF8(utf8, i));
        }
    }
    return out;
}

std::string UTF16to8(std::u16string const& utf16) {
    std::string out;
    out.reserve(utf16.size());
    for (std::size_t i = 0; i < utf16.size(); ++i) {
        char32_t c = utf16[i];
        if (c < 0x80) {
            out.push_back(char(c));
            continue;
        }
        if (c >= 0xD800 && c <= 0xDBFF && i + 1 < utf16.size() && utf16[i + 1] >= 0xDC00 &&
            utf16[i + 1] <= 0xDFFF) {
            c = 0x10000 + ((c - 0xD800) << 10) + (utf16[i + 1] - 0xDC00);
            ++i;
        } else if (c >= 0xD800 && c <= 0xDFFF) {
            c = Replacement;
        }
        AppendUTF8(out, c);
    }
    return out;
}

std::u16string AsciiToUTF16(std::string const& ascii) {
    std::u16string out;
    out.reserve(ascii.size());
    for (char c : ascii) {
        unsigned char b = static_cast<unsigned char>(c);
        out.push_back(b < 0x80 ? char16_t(b) : char16_t(Replacement));
    }
    return out;
}

bool StringToNumber(long& out, std::string const& text, unsigned flags) {
    std::size_t begin = 0, end = text.size();
    if (flags & StringToNumberAllowSpace) {
        while (begin < end && IsSpace(text[begin])) {
            ++begin;
        }
        while (end > begin && IsSpace(text[end - 1])) {
            --end;
        }
    }
    bool negative = false;
    if (begin < end && (text[begin] == '-' || text[begin] == '+')) {
        negative = text[begin] == '-';
        ++begin;
    }
    int base = 10;
    if ((flags & StringToNumberAllowHex) && end - begin > 2 && text[begin] == '0' &&
        (text[begin + 1] == 'x' || text[begin + 1] == 'X')) {
        base = 16;
        begin += 2;
    }
    // Another sign after the one consumed is malformed; from_chars would accept a '-'.
    if (begin == end || text[begin] == '-' || text[begin] == '+') {
        return false;
    }
    // Parse the magnitude unsigned so that the most negative long is reachable.
    unsigned long magnitude = 0;
    auto result = std::from_chars(text.data() + begin, text.data() + end, magnitude, base);
    if (result.ec != std::errc() || result.ptr != text.data() + end) {
        return false;
    }
    constexpr unsigned long maxPositive = static_cast<unsigned long>(std::numeric_limits<long>::max());
    if (negative) {
        if (magnitude > maxPositive + 1) {
            return false;
        }
        out = magnitude == maxPositive + 1 ? std::numeric_limits<long>::min() : -static_cast<long>(magnitude);
    } else {
        if (magnitude > maxPositive) {
            return false;
        }
        out = static_cast<long>(magnitude);
    }
    return true;
}

bool StringToNumber(long& out, std::u16string const& text, unsigned flags) {
    // Only ASCII can form a number; anything else makes the text fail as it should.
    std::string narrow;
    narrow.reserve(text.size());
    for (char16_t c : text) {
        if (c >= 0x80) {
            return false;
        }
        narrow.push_back(static_cast<char>(c));
    }
    return StringToNumber(out, narrow, flags);
}

} // namespace orvcore::utility
