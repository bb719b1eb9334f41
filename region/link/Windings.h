// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/Fans.h"
#include "region/search/BoxRow.h"
#include "region/search/ChainRow.h"

namespace gmregion {

/// How often two sets run round what lies on either side of each run.
///
/// One ray for each connected part of the arrangement; from there the numbers are carried from run
/// to run about the nodes. A second ray from elsewhere has to give the same.
class Windings {
public:
    /// False when numbers that come by two ways to the same place differ, which tells that the
    /// arrangement is not sound; `conflict()` is a point near the place then. Sorts all fans.
    bool find(const Arrangement& arrangement, Fans& fans);

    /// On the right of the direction of a run.
    Weight onRight(Index run) const { return m_right[run]; }
    /// On its left.
    Weight onLeft(Index run) const { return m_right[run] + m_fans->weight(run); }
    Vec2 conflict() const { return m_conflict; }

private:
    bool findPart(Index run);
    Weight castFrom(Index run);
    bool spreadFrom(Index run);
    bool carryRound(Index node, Half known);
    bool carryTo(Half half, Weight clockwiseOfIt);
    void raiseBoxes();
    int windingOfStandIn(std::size_t piece, Vec2 p) const;

    const Arrangement* m_arrangement = nullptr;
    Fans* m_fans = nullptr;
    std::vector<Weight> m_right;
    std::vector<std::uint8_t> m_isKnown;
    std::vector<std::uint8_t> m_isDone;  ///< nodes that were gone round
    std::vector<Half> m_waiting;
    std::vector<Index> m_runOfPiece;
    ChainRow m_strands;
    BoxRow m_boxes;
    std::size_t m_casts = 0;
    Index m_longest = kNone;  ///< of the part in hand, the run with the longest piece
    double m_longestSquared = 0.0;
    Vec2 m_conflict;
};

}  // namespace gmregion
