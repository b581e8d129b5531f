// Escaping and unescaping of property-list text.
#include "host/core/PropListXml.h"

#include "host/core/TextConversion.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <cstring>

namespace orvcore::proplist::detail {

namespace {

bool NeedsEscape(unsigned char c) {
    return c == '&' || c == '<' || c == '>' || (c < 0x20 && c != '\t');
}

} // namespace

void AppendEscaped(std::string_view text, std::string& out) {
    std::size_t start = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        unsigned char c = static_cast<unsigned char>(text[i]);
        if (!NeedsEscape(c)) {
            continue;
        }
        out.append(text.data() + start, i - start);
        switch (c) {
        case '&':
            out += "&amp;";
            break;
        case '<':
            out += "&lt;";
            break;
        case '>':
            out += "&gt;";
            break;
        default:
            out += "&#";
            out += std::to_string(c);
            out += ';';
        }
        start = i + 1;
    }
    out.append(text.data() + start, text.size() - start);
}

namespace {

// Decodes the reference whose name (between '&' and ';') is given, writing its UTF-8 bytes at dst.
// Returns the number of bytes written, or 0 when the name is no known reference.
std::size_t DecodeReference(std::string_view name, char* dst) {
    if (name.size() >= 2 && name[0] == '#' && name[1] != 'x' && name[1] != 'X' && name.size() <= 3) {
        // The common "&#9;", "&#10;" and "&#13;" without the general parser.
        unsigned cp = 0;
        for (std::size_t i = 1; i < name.size(); ++i) {
            if (name[i] < '0' || name[i] > '9') {
                return 0;
            }
            cp = cp * 10 + unsigned(name[i] - '0');
        }
        *dst = static_cast<char>(cp);
        return 1;
    }
    if (name.size() >= 2 && name[0] == '#') {
        bool hex = name[1] == 'x' || name[1] == 'X';
        std::string_view digits = name.substr(hex ? 2 : 1);
        std::uint32_t cp = 0;
        auto result = std::from_chars(digits.data(), digits.data() + digits.size(), cp, hex ? 16 : 10);
        if (digits.empty() || result.ec != std::errc() || result.ptr != digits.data() + digits.size() ||
            cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
            return 0;
        }
        std::string bytes;
        if (cp < 0x80) {
            *dst = static_cast<char>(cp);
            return 1;
        }
        utility::AppendUTF8(bytes, static_cast<char32_t>(cp));
        std::memcpy(dst, bytes.data(), bytes.size());
        return bytes.size();
    }
    char c = 0;
    if (name == "lt") {
        c = '<';
    } else if (name == "gt") {
        c = '>';
    } else if (name == "amp") {
        c = '&';
    } else if (name == "quot") {
        c = '"';
    } else if (name == "apos") {
        c = '\'';
    } else {
        return 0;
    }
    *dst = c;
    return 1;
}

// The number of bytes from src up to the next '&' (or end), testing eight bytes at a time.
std::size_t PlainRun(char const* src, char const* end) {
    constexpr std::uint64_t Ones = 0x0101010101010101ULL;
    constexpr std::uint64_t Highs = 0x8080808080808080ULL;
    constexpr std::uint64_t Amps = Ones * '&';
    char const* p = src;
    while (end - p >= 8) {
        std::uint64_t word;
        std::memcpy(&word, p, 8);
        std::uint64_t x = word ^ Amps;
        // Flags each zero byte of x, i.e. each '&'; the lowest flag is always exact.
        std::uint64_t found = (x - Ones) & ~x & Highs;
        if (found != 0) {
            return static_cast<std::size_t>(p - src) + static_cast<std::size_t>(__builtin_ctzll(found) >> 3);
        }
        p += 8;
    }
    while (p < end && *p != '&') {
        ++p;
    }
    return static_cast<std::size_t>(p - src);
}

} // namespace

bool Unescape(std::string_view text, std::string& out, std::string& problem) {
    char const* amp = static_cast<char const*>(std::memchr(text.data(), '&', text.size()));
    if (!amp) {
        out.append(text);
        return true;
    }
    // Every reference is longer than the bytes it stands for (a four-byte character needs at least
    // eight characters of reference), so the decoded text fits in the space of the escaped one.
    // Fragments stored as text are dense with short references, so this is one tight loop rather
    // than a search per reference.
    std::size_t base = out.size();
    out.resize(base + text.size());
    char* dst = out.data() + base;
    char const* src = text.data();
    char const* end = text.data() + text.size();
    while (src < end) {
        if (*src != '&') {
            std::size_t run = PlainRun(src, end);
            // dst never runs ahead of src (the output is as long as the input), so a fixed 16-byte
            // copy of a short run stays inside both; it compiles to two moves instead of a call.
            if (run <= 16 && end - src >= 16) {
                std::memcpy(dst, src, 16);
            } else {
                std::memcpy(dst, src, run);
            }
            dst += run;
            src += run;
            continue;
        }
        std::size_t left = static_cast<std::size_t>(end - src);
        // The references the writer produces most, without a search for the semicolon.
        if (left >= 4 && src[2] == 't' && src[3] == ';' && (src[1] == 'l' || src[1] == 'g')) {
            *dst++ = src[1] == 'l' ? '<' : '>';
            src += 4;
            continue;
        }
        if (left >= 5 && src[1] == '#' && src[2] == '1' && src[4] == ';' &&
            (src[3] == '0' || src[3] == '3')) {
            *dst++ = src[3] == '0' ? '\n' : '\r';
            src += 5;
            continue;
        }
        // A reference is short; a far or missing semicolon means this one is unterminated.
        char const* semi = static_cast<char const*>(std::memchr(src, ';', std::min<std::size_t>(left, 14)));
        if (!semi) {
            problem = "an '&' that starts no complete reference";
            out.resize(base);
            return false;
        }
        std::string_view name(src + 1, static_cast<std::size_t>(semi - src - 1));
        std::size_t written = DecodeReference(name, dst);
        if (written == 0) {
            problem = !name.empty() && name[0] == '#'
                          ? "the character reference '&" + std::string(name) + ";' names no character"
                          : "the unknown entity '&" + std::string(name) + ";'";
            out.resize(base);
            return false;
        }
        dst += written;
        src = semi + 1;
    }
    out.resize(static_cast<std::size_t>(dst - out.data()));
    return true;
}

} // namespace orvcore::proplist::detail
