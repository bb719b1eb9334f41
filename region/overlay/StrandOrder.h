// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "region/nodes/Strands.h"

namespace gmregion {

/// Puts strands that lie in the plane in no order, such as the loops of a shuffled drawing, in an
/// order in which neighbours are near each other, as the search for pairs wants it. Strands of the
/// first set stay before those of the second. Memory is kept from one call to the next.
class StrandOrder {
public:
    /// Strands whose order serves stay as they are.
    /// @param split the number of the second set's first element, kNone for one set
    void improve(Strands& strands, Index split);

private:
    struct Place {
        std::uint64_t key;  ///< along the curve through the plane
        Index strand;
    };

    void place(const Strands& strands, Index first, Index last);

    std::vector<Place> m_places;
    std::vector<Vec2> m_centres;
    Strands m_ordered;
};

}  // namespace gmregion
