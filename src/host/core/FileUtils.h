// File operations the workspace manager and the property-list files need, on UTF-16 paths. None
// of them throws except the two whole-file helpers, whose callers want a reason for the failure.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace orvcore::utility {

class FileUtils {
public:
    // Replaces list with the full paths of the regular files directly inside folder, ordered by
    // file name byte by byte, so every scan of the same folder lists it the same way. False (and
    // an empty list) when the folder cannot be read.
    static bool ContainedFiles(std::u16string const& folder, std::vector<std::u16string>& list);

    // The full path of a file in folder that does not exist yet: base, a number from 1 upwards and
    // extension ("UserWorkspace1.xml", "UserWorkspace2.xml", ...). The file is not created. Empty
    // when no free name is found (the folder cannot be read, or a hundred thousand are taken).
    static std::u16string UniqueFileName(std::u16string const& folder, std::u16string const& base,
                                         std::u16string const& extension);

    // Creates an empty file; false when something of that name already exists or it cannot be made.
    static bool CreateNewFile(std::u16string const& path);
    // Removes a file (not a folder); false when there was none or it could not be removed.
    static bool RemoveFile(std::u16string const& path);
    // Copies a file over `to` through a temporary file beside it, so `to` is either the old file or a
    // complete copy, never a partial one.
    static bool Copy(std::u16string const& from, std::u16string const& to);
    static bool FileExists(std::u16string const& path);
    static bool DirectoryExists(std::u16string const& path);
    // out = folder joined with name.
    static void BuildPathSpec(std::u16string const& folder, std::u16string const& name, std::u16string& out);
    // Makes the file writable by its owner; false when it does not exist or cannot be changed.
    static bool RemoveReadOnlyAttribute(std::u16string const& path);

    // The whole content of a file. Raises CannotReadFile when it cannot be read or is larger than
    // maxBytes (checked before reading, so a huge file costs nothing).
    static std::string ReadWholeFile(std::u16string const& path, std::size_t maxBytes);
    // Writes bytes to a temporary file in the target's folder, flushes it to disk and renames it
    // over the target. Raises CannotWriteFile on failure, leaving any previous file untouched.
    static void WriteFileAtomically(std::u16string const& path, std::string const& bytes);
};

} // namespace orvcore::utility
