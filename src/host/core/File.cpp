// Files: names and times.
#include "host/core/File.h"

#include "host/core/FileTimes.h"

#include <sys/stat.h>

namespace orvcore::filesupport {

namespace fs = std::filesystem;

File::File(Dir const& dir, std::u16string const& name)
    : path_(dir.Path() / ToPath(name)) {}

File::File(std::u16string const& path)
    : path_(ToPath(path)) {}

std::u16string File::FullPath() const {
    return FromPath(path_);
}

std::u16string File::GetName() const {
    return FromPath(path_.filename());
}

std::u16string File::GetExtension() const {
    return FromPath(path_.extension());
}

bool File::Exists() const {
    std::error_code ec;
    return fs::is_regular_file(path_, ec);
}

boost::posix_time::ptime File::Modified() const {
    // stat rather than std::filesystem: the standard's file clock has no conversion to calendar
    // time before C++20, and the manager compares these times as text, so they must be exact.
    struct stat info {};
    if (::stat(path_.c_str(), &info) != 0) {
        return boost::posix_time::not_a_date_time;
    }
    return FromFileTime(info.st_mtim.tv_sec, info.st_mtim.tv_nsec);
}

} // namespace orvcore::filesupport
