// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

#include "region/model/Box.h"

namespace gmdrawing {

/// An entity kind on a layer that is not in the result, and why.
struct SkippedKind {
    std::string kind;
    std::string layer;
    std::string reason;
};

inline bool operator<(const SkippedKind& a, const SkippedKind& b) {
    return std::tie(a.kind, a.layer, a.reason) < std::tie(b.kind, b.layer, b.reason);
}

/// How many entities of a kind.
using SkipCounts = std::map<SkippedKind, std::size_t>;

/// Number of entities in all counts.
inline std::size_t totalOf(const SkipCounts& counts) {
    std::size_t total = 0;
    for (const auto& entry : counts)
        total += entry.second;
    return total;
}

/// "2 TEXT on layer A: kind cannot be used".
std::string kindText(const SkippedKind& kind, std::size_t count);

/// All of them in one line: "2 TEXT on layer A: kind cannot be used; ...".
std::string kindsText(const SkipCounts& counts);

/// Something that was skipped and may belong to an outline.
struct SkippedPlace {
    std::string kind;
    std::string layer;
    gmregion::Box box;  ///< about it, empty where that is not known
};

/// Whether entities of a kind may belong to an outline: all but texts, dimensions, fillings,
/// pictures and the like.
bool isOutlineKind(std::string_view kind);

/// What was read of a drawing, and what was left out, how often.
struct ReadReport {
    std::map<std::string, std::size_t> used;  ///< entities in the result, by kind
    SkipCounts unusable;                      ///< entities that cannot be used
    SkipCounts leftOut;                ///< entities of layers that are not shown or not wanted
    std::vector<SkippedPlace> places;  ///< of what is unusable, where it may belong to an outline
    std::size_t shortElements = 0;     ///< elements below the least length
    std::size_t duplicates = 0;        ///< lines, arcs and polylines drawn again in the same place
    double lowest = 0.0;               ///< least height of a used entity
    double highest = 0.0;              ///< largest height of a used entity

    std::size_t unusableCount() const { return totalOf(unusable); }
};

}  // namespace gmdrawing
