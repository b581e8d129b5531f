// Runs a piece of code while the process may write no file larger than a limit, as on a full disk:
// writes past the limit fail with EFBIG instead of stopping the process.
#pragma once

#include <csignal>
#include <cstddef>
#include <functional>
#include <sys/resource.h>

namespace orvtest {

// Returns false when the limit could not be set (the code then did not run).
inline bool WithFileSizeLimit(std::size_t bytes, std::function<void()> const& run) {
    struct rlimit old {};
    if (::getrlimit(RLIMIT_FSIZE, &old) != 0) {
        return false;
    }
    auto oldHandler = std::signal(SIGXFSZ, SIG_IGN);
    struct rlimit limited = old;
    limited.rlim_cur = bytes;
    if (::setrlimit(RLIMIT_FSIZE, &limited) != 0) {
        std::signal(SIGXFSZ, oldHandler);
        return false;
    }
    run();
    ::setrlimit(RLIMIT_FSIZE, &old);
    std::signal(SIGXFSZ, oldHandler);
    return true;
}

} // namespace orvtest
