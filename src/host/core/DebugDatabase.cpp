// The debug settings table.
#include "host/core/DebugDatabase.h"

namespace orvcore::debug {

DebugDatabase& DebugDatabase::Instance() {
    static DebugDatabase instance;
    return instance;
}

std::string DebugDatabase::GetEntry(std::string const& section, std::string const& key) const {
    std::lock_guard<std::mutex> lock(mutex_);
    auto it = entries_.find({section, key});
    return it == entries_.end() ? std::string() : it->second;
}

void DebugDatabase::SetEntry(std::string const& section, std::string const& key, std::string value) {
    std::lock_guard<std::mutex> lock(mutex_);
    entries_[{section, key}] = std::move(value);
}

void DebugDatabase::RemoveEntry(std::string const& section, std::string const& key) {
    std::lock_guard<std::mutex> lock(mutex_);
    entries_.erase({section, key});
}

void DebugDatabase::Clear() {
    std::lock_guard<std::mutex> lock(mutex_);
    entries_.clear();
}

} // namespace orvcore::debug
