// A file of the file system, named by a UTF-16 path: its name parts, existence and modification time.
#pragma once

#include "host/core/Dir.h"

#include <boost/date_time/posix_time/ptime.hpp>

namespace orvcore::filesupport {

class File {
public:
    File(Dir const& dir, std::u16string const& name);
    explicit File(std::u16string const& path);

    std::u16string FullPath() const;
    // The file name with its extension, without the folder.
    std::u16string GetName() const;
    // The extension with its dot (".xml"), empty when the name has none.
    std::u16string GetExtension() const;
    // True for an existing regular file (a folder of that name does not count).
    bool Exists() const;
    // The last modification time in UTC with microsecond resolution; not_a_date_time when the file
    // cannot be examined.
    boost::posix_time::ptime Modified() const;

private:
    std::filesystem::path path_;
};

} // namespace orvcore::filesupport
