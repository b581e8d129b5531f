// Modification times of many files at once, for callers that check a long list of files for
// changes (the workspace manager's cached records at every start).
#pragma once

#include <boost/date_time/posix_time/ptime.hpp>

#include <cstdint>
#include <string>
#include <vector>

namespace orvcore::filesupport {

// The modification time of each path, exactly as File::Modified gives it (not_a_date_time for a
// file that cannot be examined), in the order of the paths. Paths of one folder that follow one
// another are looked up relative to that folder, opened once, which spares walking the whole path
// for every file.
// A file system time (seconds and nanoseconds since the epoch, UTC) at the microsecond resolution
// the manager records.
boost::posix_time::ptime FromFileTime(std::int64_t seconds, long nanoseconds);

std::vector<boost::posix_time::ptime> ModifiedTimes(std::vector<std::u16string> const& paths);

} // namespace orvcore::filesupport
