// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/model/Index.h"

namespace gmregion {

/// What the tags of elements mean: the numbers of elements of one set, then of a second, or the
/// numbers of origins in a list.
struct OriginSource {
    const RegionSet* first = nullptr;
    const RegionSet* second = nullptr;
    Index split = kNone;                             ///< the tag of the second set's first element
    const std::vector<Origin>* list = nullptr;       ///< where it is given, tags number its origins
    const std::vector<OriginKind>* kinds = nullptr;  ///< where given, for every tag; see `owners`
    const std::vector<Index>* owners = nullptr;      ///< with `kinds`, the element of each tag

    /// Appends the origins of a tag.
    void append(Index tag, std::vector<Origin>& to) const {
        if (list) {
            to.push_back((*list)[tag]);
            return;
        }
        const Index element = owners ? (*owners)[tag] : tag;
        const bool isFirst = element < split;
        for (Origin origin : isFirst ? first->origins(element) : second->origins(element - split)) {
            if (kinds) origin.kind = (*kinds)[tag];
            to.push_back(origin);
        }
    }
};

}  // namespace gmregion
