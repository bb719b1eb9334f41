// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/model/Index.h"

namespace gmregion {

/// What the elements are made of that make up an offset: by their tags.
struct MadeOf {
    std::vector<Index> sources;  ///< the numbers of elements of the source
    std::vector<Index> owners;   ///< the owners of these
    std::vector<OriginKind> kinds;

    void clear() {
        sources.clear();
        owners.clear();
        kinds.clear();
    }
    /// A new tag.
    Index add(Index source, Index owner, OriginKind kind) {
        sources.push_back(source);
        owners.push_back(owner);
        kinds.push_back(kind);
        return static_cast<Index>(owners.size() - 1);
    }
};

}  // namespace gmregion
