// Folders and the preferences folder.
#include "host/core/Dir.h"

#include "host/core/TextConversion.h"

#include <cstdlib>
#include <pwd.h>
#include <system_error>
#include <unistd.h>

namespace orvcore::filesupport {

namespace fs = std::filesystem;

fs::path ToPath(std::u16string const& path) {
    return fs::path(utility::UTF16to8(path));
}

std::u16string FromPath(fs::path const& path) {
    return utility::UTF8to16(path.string());
}

namespace {
std::string Environment(char const* name) {
    char const* value = std::getenv(name);
    return value ? std::string(value) : std::string();
}
} // namespace

Dir Dir::PrefDir() {
    fs::path path;
    if (std::string own = Environment("ORV_PREFS_DIR"); !own.empty()) {
        path = own;
    } else if (std::string xdg = Environment("XDG_CONFIG_HOME"); !xdg.empty()) {
        path = fs::path(xdg) / "orvworkspace";
    } else {
        std::string home = Environment("HOME");
        if (home.empty()) {
            struct passwd const* user = ::getpwuid(::getuid());
            home = user && user->pw_dir ? user->pw_dir : ".";
        }
        path = fs::path(home) / ".config" / "orvworkspace";
    }
    Dir dir = FromFilesystemPath(path);
    dir.Create();
    return dir;
}

Dir Dir::FromFilesystemPath(fs::path path) {
    Dir dir(std::u16string{});
    dir.path_ = std::move(path);
    return dir;
}

Dir::Dir(std::u16string const& path)
    : path_(ToPath(path)) {}

Dir::Dir(Dir const& parent, std::u16string const& name)
    : path_(parent.path_ / ToPath(name)) {}

bool Dir::Exists() const {
    std::error_code ec;
    return fs::is_directory(path_, ec);
}

bool Dir::Create() const {
    std::error_code ec;
    fs::create_directories(path_, ec);
    return Exists();
}

std::u16string Dir::FullPath() const {
    return FromPath(path_);
}

} // namespace orvcore::filesupport
