// Escaping and unescaping of property-list text.
#include "host/core/PropListXml.h"

#include "host/core/TextConversion.h"

#include <charconv>
#include <cstdint>
#include <cstring>

namespace orvcore::proplist::detail {

namespace {

bool NeedsEscape(unsigned char c) { return c == '&' || c == '<' || c == '>' || (c < 0x20 && c != '\t'); }

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

bool Unescape(std::string_view text, std::string& out, std::string& problem) {
    std::size_t amp = text.find('&');
    if (amp == std::string_view::npos) {
        out.append(text);
        return true;
    }
    std::size_t start = 0;
    while (amp != std::string_view::npos) {
        out.append(text.data() + start, amp - start);
        std::size_t semi = text.find(';', amp);
        // A reference is short; a far semicolon means this one is unterminated.
        if (semi == std::string_view::npos || semi - amp > 12) {
            problem = "an '&' that starts no complete reference";
            return false;
        }
        std::string_view name = text.substr(amp + 1, semi - amp - 1);
        if (name == "amp") {
            out.push_back('&');
        } else if (name == "lt") {
            out.push_back('<');
        } else if (name == "gt") {
            out.push_back('>');
        } else if (name == "quot") {
            out.push_back('"');
        } else if (name == "apos") {
            out.push_back('\'');
        } else if (name.size() >= 2 && name[0] == '#') {
            bool hex = name[1] == 'x' || name[1] == 'X';
            std::string_view digits = name.substr(hex ? 2 : 1);
            std::uint32_t cp = 0;
            auto result = std::from_chars(digits.data(), digits.data() + digits.size(), cp, hex ? 16 : 10);
            if (digits.empty() || result.ec != std::errc() || result.ptr != digits.data() + digits.size() ||
                cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
                problem = "the character reference '&" + std::string(name) + ";' names no character";
                return false;
            }
            utility::AppendUTF8(out, static_cast<char32_t>(cp));
        } else {
            problem = "the unknown entity '&" + std::string(name) + ";'";
            return false;
        }
        start = semi + 1;
        amp = text.find('&', start);
    }
    out.append(text.data() + start, text.size() - start);
    return true;
}

} // namespace orvcore::proplist::detail
