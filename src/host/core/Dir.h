// A folder of the file system, named by a UTF-16 path, and the per-user preferences folder.
#pragma once

#include <filesystem>
#include <string>

namespace orvcore::filesupport {

class Dir {
public:
    // The per-user preferences folder: $ORV_PREFS_DIR when set and not empty, else
    // $XDG_CONFIG_HOME/orvworkspace, else $HOME/.config/orvworkspace. Created when missing; the
    // environment is read on every call so a test or host can redirect it.
    static Dir PrefDir();

    explicit Dir(std::u16string const& path);
    // A folder named by a file-system path (bytes, as the system gives them).
    static Dir FromFilesystemPath(std::filesystem::path path);
    // The folder `name` inside `parent`.
    Dir(Dir const& parent, std::u16string const& name);

    bool Exists() const;
    // Creates the folder and any missing parents; true when it exists afterwards.
    bool Create() const;
    std::u16string FullPath() const;
    std::filesystem::path const& Path() const { return path_; }

private:
    std::filesystem::path path_;
};

// Path conversions at the edge between the library's UTF-16 paths and the file system's bytes.
std::filesystem::path ToPath(std::u16string const& path);
std::u16string FromPath(std::filesystem::path const& path);

} // namespace orvcore::filesupport
