// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <tuple>

namespace gmdrawing {

/// An entity kind on a layer that cannot be used, and why.
struct SkippedKind {
    std::string kind;
    std::string layer;
    std::string reason;
};

inline bool operator<(const SkippedKind& a, const SkippedKind& b) {
    return std::tie(a.kind, a.layer, a.reason) < std::tie(b.kind, b.layer, b.reason);
}

/// What was left out of a drawing, and how often.
struct SkipReport {
    std::map<SkippedKind, std::size_t> unusable;  ///< entities that cannot be used
    std::size_t shortElements = 0;                ///< elements below the kernel's tolerance
    std::size_t duplicates = 0;  ///< lines, arcs and polylines drawn again in the same place

    std::size_t unusableCount() const {
        std::size_t count = 0;
        for (const auto& entry : unusable)
            count += entry.second;
        return count;
    }
};

}  // namespace gmdrawing
