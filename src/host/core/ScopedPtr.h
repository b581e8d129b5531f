// The core library's single-owner pointer: deletes its object when reset or destroyed.
#pragma once

#include <memory>

namespace orvcore::utility {

// A plain alias: the standard owning pointer already has exactly the semantics the library wants
// (move-only, deletes on reset and destruction), so there is nothing to add.
template <typename T> using ScopedPtr = std::unique_ptr<T>;

} // namespace orvcore::utility
