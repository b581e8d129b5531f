// File operations over std::filesystem, and the temporary-file-and-rename writes that keep the
// previous file whole when a write fails.
#include "host/core/FileUtils.h"

#include "host/core/Dir.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/TextConversion.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <dirent.h>
#include <fcntl.h>
#include <fstream>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

namespace orvcore::utility {

namespace fs = std::filesystem;
using filesupport::FromPath;
using filesupport::ToPath;

bool FileUtils::ContainedFiles(std::u16string const& folder, std::vector<std::u16string>& list) {
    list.clear();
    // Read with readdir rather than a directory iterator: the manager lists its folders at every
    // start, and the iterator's path objects cost more than the listing itself.
    std::string base = UTF16to8(folder);
    DIR* dir = base.empty() ? nullptr : ::opendir(base.c_str());
    if (!dir) {
        return false;
    }
    if (base.back() != '/') {
        base += '/';
    }
    std::vector<std::string> names;
    bool failed = false;
    for (;;) {
        errno = 0;
        dirent const* entry = ::readdir(dir);
        if (!entry) {
            failed = errno != 0;
            break;
        }
        bool regular = entry->d_type == DT_REG;
        if (entry->d_type == DT_LNK || entry->d_type == DT_UNKNOWN) {
            // A link counts by what it leads to; some file systems give no type at all.
            struct stat info {};
            regular = ::fstatat(::dirfd(dir), entry->d_name, &info, 0) == 0 && S_ISREG(info.st_mode);
        }
        if (regular) {
            names.emplace_back(entry->d_name);
        }
    }
    ::closedir(dir);
    if (failed) {
        return false;
    }
    std::sort(names.begin(), names.end());
    list.reserve(names.size());
    for (std::string const& name : names) {
        list.push_back(UTF8to16(base + name));
    }
    return true;
}

std::u16string FileUtils::UniqueFileName(std::u16string const& folder, std::u16string const& base,
                                         std::u16string const& extension) {
    // A name counts as taken when anything at all is there, a dangling link included, or when the
    // folder cannot say; the search gives up (empty result) rather than loop for ever.
    for (unsigned long n = 1; n <= 100000; ++n) {
        std::u16string path;
        BuildPathSpec(folder, base + AsciiToUTF16(std::to_string(n)) + extension, path);
        std::error_code ec;
        fs::file_status status = fs::symlink_status(ToPath(path), ec);
        if (status.type() == fs::file_type::not_found) {
            return path;
        }
    }
    return {};
}

bool FileUtils::CreateNewFile(std::u16string const& path) {
    int fd = ::open(ToPath(path).c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (fd < 0) {
        return false;
    }
    ::close(fd);
    return true;
}

bool FileUtils::RemoveFile(std::u16string const& path) {
    if (!FileExists(path)) {
        return false;
    }
    std::error_code ec;
    return fs::remove(ToPath(path), ec) && !ec;
}

namespace {

// The mode a new file gets from open(..., 0666): read and write as the process's umask allows.
mode_t NewFileMode() {
    static mode_t const mode = [] {
        mode_t mask = ::umask(0);
        ::umask(mask);
        return static_cast<mode_t>(0666 & ~mask);
    }();
    return mode;
}

// An open temporary file beside a target; removed on destruction unless it was renamed over the
// target.
class TempFile {
public:
    explicit TempFile(fs::path const& target) {
        std::string pattern =
            (target.parent_path() / ("." + target.filename().string() + ".tmp-XXXXXX")).string();
        name_.assign(pattern.begin(), pattern.end());
        name_.push_back('\0');
        fd_ = ::mkstemp(name_.data());
        created_ = fd_ >= 0;
        if (!created_) {
            error_ = errno;
        }
    }
    ~TempFile() {
        Close();
        if (created_ && !committed_) {
            ::unlink(name_.data());
        }
    }
    TempFile(TempFile const&) = delete;
    TempFile& operator=(TempFile const&) = delete;

    bool IsOpen() const { return fd_ >= 0; }
    int Error() const { return error_; }

    bool Write(std::string_view bytes) {
        std::size_t done = 0;
        while (done < bytes.size()) {
            ssize_t n = ::write(fd_, bytes.data() + done, bytes.size() - done);
            if (n < 0 && errno == EINTR) {
                continue;
            }
            if (n <= 0) {
                error_ = n < 0 ? errno : EIO;
                return false;
            }
            done += static_cast<std::size_t>(n);
        }
        return true;
    }

    // Flushes to disk, gives the file the target's permissions (or the usual ones) and renames it
    // over the target.
    bool Commit(fs::path const& target) {
        struct stat old {};
        mode_t mode = ::stat(target.c_str(), &old) == 0 ? (old.st_mode & 07777) : NewFileMode();
        if (::fchmod(fd_, mode) != 0 || ::fsync(fd_) != 0) {
            error_ = errno;
            return false;
        }
        Close();
        if (::rename(name_.data(), target.c_str()) != 0) {
            error_ = errno;
            return false;
        }
        committed_ = true;
        return true;
    }

private:
    void Close() {
        if (fd_ >= 0) {
            ::close(fd_);
            fd_ = -1;
        }
    }

    std::vector<char> name_;
    int fd_ = -1;
    int error_ = 0;
    bool created_ = false;
    bool committed_ = false;
};

std::string Reason(int error) {
    return std::strerror(error);
}

} // namespace

bool FileUtils::Copy(std::u16string const& from, std::u16string const& to) {
    if (!FileExists(from)) {
        return false;
    }
    // POSIX reads rather than a stream: a stream cannot tell a read error from the end of the file,
    // and would rename a truncated copy over the target as if all went well.
    int in = ::open(ToPath(from).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (in < 0) {
        return false;
    }
    struct Closer {
        int fd;
        ~Closer() { ::close(fd); }
    } closer{in};
    fs::path target = ToPath(to);
    TempFile temp(target);
    if (!temp.IsOpen()) {
        return false;
    }
    std::string buffer(64 * 1024, '\0');
    for (;;) {
        ssize_t n = ::read(in, buffer.data(), buffer.size());
        if (n < 0 && errno == EINTR) {
            continue;
        }
        if (n < 0) {
            return false;
        }
        if (n == 0) {
            break;
        }
        if (!temp.Write(std::string_view(buffer.data(), static_cast<std::size_t>(n)))) {
            return false;
        }
    }
    return temp.Commit(target);
}

bool FileUtils::FileExists(std::u16string const& path) {
    std::error_code ec;
    return fs::is_regular_file(ToPath(path), ec);
}

bool FileUtils::DirectoryExists(std::u16string const& path) {
    std::error_code ec;
    return fs::is_directory(ToPath(path), ec);
}

void FileUtils::BuildPathSpec(std::u16string const& folder, std::u16string const& name, std::u16string& out) {
    out = FromPath(ToPath(folder) / ToPath(name));
}

bool FileUtils::RemoveReadOnlyAttribute(std::u16string const& path) {
    std::error_code ec;
    fs::permissions(ToPath(path), fs::perms::owner_write, fs::perm_options::add, ec);
    return !ec && FileExists(path);
}

std::string FileUtils::ReadWholeFile(std::u16string const& path, std::size_t maxBytes) {
    using config::errors::CannotReadFile;
    fs::path p = ToPath(path);
    // Non-blocking, so a FIFO in the file's place cannot stall the open; it is refused below.
    int fd = ::open(p.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (fd < 0) {
        config::ThrowError(CannotReadFile, path, Reason(errno));
    }
    struct Closer {
        int fd;
        ~Closer() { ::close(fd); }
    } closer{fd};
    struct stat info {};
    if (::fstat(fd, &info) != 0) {
        config::ThrowError(CannotReadFile, path, Reason(errno));
    }
    if (!S_ISREG(info.st_mode)) {
        config::ThrowError(CannotReadFile, path, "not a regular file");
    }
    if (static_cast<unsigned long long>(info.st_size) > maxBytes) {
        config::ThrowError(CannotReadFile, path,
                           "it is " + std::to_string(info.st_size) + " bytes, more than the limit of " +
                               std::to_string(maxBytes));
    }
    std::string bytes(static_cast<std::size_t>(info.st_size), '\0');
    std::size_t done = 0;
    while (done < bytes.size()) {
        ssize_t n = ::read(fd, bytes.data() + done, bytes.size() - done);
        if (n < 0 && errno == EINTR) {
            continue;
        }
        if (n < 0) {
            config::ThrowError(CannotReadFile, path, Reason(errno));
        }
        if (n == 0) { // the file shrank while we read it
            bytes.resize(done);
            break;
        }
        done += static_cast<std::size_t>(n);
    }
    return bytes;
}

void FileUtils::WriteFileAtomically(std::u16string const& path, std::string const& bytes) {
    using config::errors::CannotWriteFile;
    fs::path target = ToPath(path);
    TempFile temp(target);
    if (!temp.IsOpen()) {
        config::ThrowError(CannotWriteFile, path, Reason(temp.Error()));
    }
    if (!temp.Write(bytes) || !temp.Commit(target)) {
        config::ThrowError(CannotWriteFile, path, Reason(temp.Error()));
    }
}

} // namespace orvcore::utility
