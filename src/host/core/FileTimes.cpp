#include "host/core/FileTimes.h"

#include "host/core/TextConversion.h"

#include <algorithm>
#include <boost/date_time/posix_time/conversion.hpp>
#include <boost/date_time/posix_time/posix_time_duration.hpp>
#include <fcntl.h>
#include <sys/stat.h>
#include <system_error>
#include <thread>
#include <unistd.h>

namespace orvcore::filesupport {

boost::posix_time::ptime FromFileTime(std::int64_t seconds, long nanoseconds) {
    return boost::posix_time::from_time_t(std::time_t(seconds)) +
           boost::posix_time::microseconds(nanoseconds / 1000);
}

namespace {

// The folder most recently looked into, kept open while the paths stay in it.
class OpenFolder {
public:
    OpenFolder() = default;
    OpenFolder(OpenFolder const&) = delete;
    OpenFolder& operator=(OpenFolder const&) = delete;
    ~OpenFolder() { Close(); }

    // A descriptor for the folder that is path's first length bytes, or -1 when it cannot be
    // opened; the folder's name is only copied when it changes.
    int For(std::string const& path, std::size_t length) {
        if (!opened_ || name_.compare(0, std::string::npos, path, 0, length) != 0) {
            Close();
            opened_ = true;
            name_.assign(path, 0, length);
            fd_ = ::open(name_.empty() ? "/" : name_.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC);
        }
        return fd_;
    }

private:
    void Close() {
        if (fd_ >= 0) {
            ::close(fd_);
        }
        fd_ = -1;
    }
    bool opened_ = false;
    std::string name_;
    int fd_ = -1;
};

// Fills times[first, last) for paths[first, last).
void LookUp(std::vector<std::u16string> const& paths, std::vector<boost::posix_time::ptime>& times,
            std::size_t first, std::size_t last) {
    OpenFolder folder;
    for (std::size_t i = first; i < last; ++i) {
        std::string file = orvcore::utility::UTF16to8(paths[i]);
        std::size_t slash = file.rfind('/');
        struct stat info {};
        bool found = false;
        if (slash != std::string::npos && slash + 1 < file.size()) {
            int fd = folder.For(file, slash);
            found = fd >= 0 ? ::fstatat(fd, file.c_str() + slash + 1, &info, 0) == 0
                            : ::stat(file.c_str(), &info) == 0;
        } else {
            found = !file.empty() && ::stat(file.c_str(), &info) == 0;
        }
        if (found) {
            times[i] = FromFileTime(info.st_mtim.tv_sec, info.st_mtim.tv_nsec);
        }
    }
}

// Never throws: a stretch that cannot be finished (out of memory) keeps not_a_date_time, so its
// files count as changed and are read again, which loses nothing.
void LookUpQuietly(std::vector<std::u16string> const& paths, std::vector<boost::posix_time::ptime>& times,
                   std::size_t first, std::size_t last) noexcept {
    try {
        LookUp(paths, times, first, last);
    } catch (...) {
        for (std::size_t i = first; i < last; ++i) {
            times[i] = boost::posix_time::not_a_date_time;
        }
    }
}

} // namespace

std::vector<boost::posix_time::ptime> ModifiedTimes(std::vector<std::u16string> const& paths) {
    std::vector<boost::posix_time::ptime> times(paths.size(), boost::posix_time::not_a_date_time);
    // Each look is a system call that mostly waits on the kernel's path lookup; a long list is
    // shared among a few threads, each over its own stretch of the list (as version-control tools
    // look at their working files). A thread that cannot be started leaves its stretch to this one.
    constexpr std::size_t PerThread = 256;
    constexpr std::size_t MostThreads = 4;
    std::size_t wanted = std::min({std::size_t(std::max(1u, std::thread::hardware_concurrency())),
                                   MostThreads, std::max<std::size_t>(1, paths.size() / PerThread)});
    std::size_t stretch = (paths.size() + wanted - 1) / std::max<std::size_t>(wanted, 1);
    // Nothing may throw while a helper runs (a joinable thread that is destroyed ends the process):
    // the lists are reserved first, and every stretch is looked up quietly.
    std::vector<std::thread> helpers;
    std::vector<std::pair<std::size_t, std::size_t>> leftOver;
    helpers.reserve(wanted);
    leftOver.reserve(wanted);
    for (std::size_t first = stretch; first < paths.size(); first += stretch) {
        std::size_t last = std::min(paths.size(), first + stretch);
        try {
            helpers.emplace_back(
                [&paths, &times, first, last]() noexcept { LookUpQuietly(paths, times, first, last); });
        } catch (std::system_error const&) {
            leftOver.emplace_back(first, last);
        }
    }
    LookUpQuietly(paths, times, 0, std::min(stretch, paths.size()));
    for (auto const& range : leftOver) {
        LookUpQuietly(paths, times, range.first, range.second);
    }
    for (std::thread& helper : helpers) {
        helper.join();
    }
    return times;
}

} // namespace orvcore::filesupport
