// Filling placeholders in user-visible texts and shortening labels to fit.
#pragma once

#include <cstddef>
#include <string>

namespace orvcore::utility {

// Replaces every "@0".."@9" in the template by r0..r9, in one pass: a replacement that itself holds
// "@1" is not filled again. An "@" not followed by a digit stays as it is.
std::u16string ReplaceInString(std::u16string const& templ, std::u16string const& r0 = {},
                               std::u16string const& r1 = {}, std::u16string const& r2 = {},
                               std::u16string const& r3 = {}, std::u16string const& r4 = {},
                               std::u16string const& r5 = {}, std::u16string const& r6 = {},
                               std::u16string const& r7 = {}, std::u16string const& r8 = {},
                               std::u16string const& r9 = {});

// Shortens a label by cutting its middle. A text of at most `maximum` code units comes back as it is;
// a longer one becomes head + "…" (U+2026) + tail, exactly `maximum` code units long (one fewer when
// a cut would split a surrogate pair), never longer. `scale` (clamped to 0..1) is the share of the
// kept characters taken from the end: 0 keeps only the head, 1 only the tail, 0.25 a quarter from
// the end. A maximum of 0 gives an empty text.
std::u16string TruncateUIStringInMiddle(std::u16string const& text, std::size_t maximum, double scale);

} // namespace orvcore::utility
