// The XML vocabulary of property lists, shared by the writer and the reader, and the escaping of
// text in both directions. Internal to the core library.
//
// The three list-valued kinds, which the document format leaves open, are written as
//     <array type='utf16'>, <array type='utf8'>: one <ustring> element per item;
//     <array type='int32'>: one <int type='signed' size='32'> element per item;
// each element on its own line like the rest of the document.
//
// Escaping: '&', '<' and '>' become entity references; CR, LF and the other control characters
// below 0x20 except tab become numeric references, so line-end normalisation cannot change a text
// and even NUL survives. Bytes from 0x80 up are written as they are.
#pragma once

#include <string>
#include <string_view>

namespace orvcore::proplist::detail {

inline constexpr char LineEnd[] = "\r\n";
inline constexpr char DocumentHead[] = "<?xml version='1.0'?>\r\n<prop.map version='4'>\r\n";
inline constexpr char DocumentTail[] = "</prop.map>\r\n";
inline constexpr char MapVersion[] = "4";

// Appends text with the escaping described above.
void AppendEscaped(std::string_view text, std::string& out);

// Turns the escaped text of a document back into the original text. Understands the five
// predefined entities and decimal and hexadecimal character references. Returns false, with a
// description in problem, for an unknown entity, an unterminated reference or a reference to a
// code point beyond U+10FFFF or in the surrogate range.
bool Unescape(std::string_view text, std::string& out, std::string& problem);

} // namespace orvcore::proplist::detail
