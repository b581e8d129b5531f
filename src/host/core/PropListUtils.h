// Reading and writing property lists as XML: fragments held in strings, and whole document files.
// Malformed, truncated or hostile input raises MalformedPropList (or CannotReadFile) naming the
// document and the problem, and leaves the target list as it was.
#pragma once

#include "host/core/PropList.h"

#include <cstddef>
#include <string>

namespace orvcore::proplist::utils {

// Documents larger than this are refused before reading, so a runaway file cannot exhaust memory:
// the parsed element tree can be some twenty times the size of a document of tiny elements. Saved
// workspaces are a few hundred kilobytes.
inline constexpr std::size_t MaxDocumentBytes = std::size_t(32) << 20;
// Lists nested deeper than this are refused; no document of the library comes near it.
inline constexpr int MaxNestingDepth = 256;

// Replaces list with the list that text describes: a prop.list fragment as OutputAsXMLFragment
// writes it, or a whole document.
void ReadPropList(std::string const& text, PropList& list);

// The whole document text of a list: the XML declaration, prop.map, the list, CR LF line ends.
std::string DocumentText(PropList const& list);

// Replaces list with the list of a whole document held in text; sourceName names the document in
// error messages.
void ParseDocument(std::string text, PropList& list, std::u16string const& sourceName);

// Writes list as a document file through a temporary file and a rename, so a failed write leaves
// the previous file whole. Raises CannotWriteFile on failure.
void SavePropList(std::u16string const& path, PropList const& list);

// Replaces list with the document in the file. With raiseErrors, a missing, unreadable, oversized
// or malformed file raises its error; without, it returns false. Either way list is unchanged on
// failure. Returns true on success.
bool LoadPropList(std::u16string const& path, PropList& list, bool raiseErrors);

} // namespace orvcore::proplist::utils
