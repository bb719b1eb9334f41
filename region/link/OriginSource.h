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
    Index split = kNone;                        ///< the tag of the second set's first element
    const std::vector<Origin>* list = nullptr;  ///< where given, instead of sets
    const std::vector<Index>* ends = nullptr;  ///< with `list`, behind the last origin of each tag;
                                               ///< otherwise each tag has one
    const std::vector<Index>* owners = nullptr;      ///< where given, what to take for each tag
    const std::vector<OriginKind>* kinds = nullptr;  ///< where given, the kind for each tag

    /// Appends the origins of a tag.
    void append(Index tag, std::vector<Origin>& to) const {
        const std::size_t before = to.size();
        const Index element = owners ? (*owners)[tag] : tag;
        const Origins found = list ? listed(element) : ofSet(element);
        to.insert(to.end(), found.begin(), found.end());
        for (std::size_t i = before; kinds && i < to.size(); ++i)
            to[i].kind = (*kinds)[tag];
    }

private:
    Origins listed(Index element) const {
        if (!ends) return {list->data() + element, list->data() + element + 1};
        const Index from = element == 0 ? 0 : (*ends)[element - 1];
        return {list->data() + from, list->data() + (*ends)[element]};
    }
    Origins ofSet(Index element) const {
        return element < split ? first->origins(element) : second->origins(element - split);
    }
};

}  // namespace gmregion
