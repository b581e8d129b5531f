// Named debug settings, by section and key, set by the host or a test and read by the library
// (for instance "ORV_syncWindowEnablement").
#pragma once

#include <map>
#include <mutex>
#include <string>
#include <utility>

namespace orvcore::debug {

class DebugDatabase {
public:
    static DebugDatabase& Instance();

    // The setting's text, empty when unset.
    std::string GetEntry(std::string const& section, std::string const& key) const;
    void SetEntry(std::string const& section, std::string const& key, std::string value);
    void RemoveEntry(std::string const& section, std::string const& key);
    void Clear();

private:
    DebugDatabase() = default;

    mutable std::mutex mutex_;
    std::map<std::pair<std::string, std::string>, std::string> entries_;
};

} // namespace orvcore::debug
