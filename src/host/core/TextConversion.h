// Conversions between UTF-8 (std::string), UTF-16 (std::u16string) and numbers. Malformed input
// never fails a conversion: each invalid sequence becomes U+FFFD, the replacement character.
#pragma once

#include <string>

namespace orvcore::utility {

std::u16string UTF8to16(std::string const& utf8);
// Unpaired surrogates become U+FFFD.
std::string UTF16to8(std::u16string const& utf16);
// Appends the UTF-8 form of a code point (at most U+10FFFF).
void AppendUTF8(std::string& out, char32_t codePoint);

// Bytes above 0x7F are not ASCII and become U+FFFD.
std::u16string AsciiToUTF16(std::string const& ascii);

// Bits of StringToNumber's flags.
enum StringToNumberFlags : unsigned {
    // Plain decimal, optionally signed, nothing else.
    StringToNumberDecimal = 0,
    // Also accept "0x" or "0X" followed by hexadecimal digits (after an optional sign).
    StringToNumberAllowHex = 1,
    // Ignore spaces and tabs before and after the number.
    StringToNumberAllowSpace = 2,
};

// Parses the whole text as a number. False, with out unchanged, when the text is empty, holds
// anything but the number, or does not fit a long.
bool StringToNumber(long& out, std::string const& text, unsigned flags = StringToNumberDecimal);
bool StringToNumber(long& out, std::u16string const& text, unsigned flags = StringToNumberDecimal);

} // namespace orvcore::utility
