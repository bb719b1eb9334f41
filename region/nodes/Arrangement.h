// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/nodes/Meetings.h"
#include "region/nodes/NodeClusters.h"
#include "region/nodes/Strands.h"

namespace gmregion {

/// A stretch of a strand between two nodes, with nothing else on it: pieces of its elements.
struct Run {
    Index from;  ///< kNone for a strand that meets nothing, as is `to`
    Index to;
    Index first;  ///< number of its first piece
    Index last;   ///< behind its last piece
    Weight weight;
};

/// Strands cut at each other: nodes, and runs that meet at nodes alone.
///
/// Wherever elements cross, end on each other or come nearer than the tolerance, they share a node.
/// Nothing moves by more than the tolerance a round. Memory is kept from one use to the next.
class Arrangement {
public:
    /// The strands to be cut; to be filled before each use. They hold the pieces afterwards:
    /// strands as they were, cut at nodes.
    Strands& strands() { return m_in; }

    /// Lets the next calls compare so many pairs of elements altogether.
    void allow(std::uint64_t pairs) { m_meetings.allow(pairs); }
    /// Whether that many have been compared.
    bool isAtLimit() const { return m_meetings.isAtLimit(); }

    /// Cuts the strands. False when nodes have not come to rest after three rounds, or when there
    /// are more pairs than allowed.
    /// @param tolerance in length units, positive
    /// @param split where it is not kNone, elements before and from that number on are two clean
    /// sets, and those of one of them are not compared with each other
    /// @param care see Care
    bool settle(double tolerance, Index split = kNone, Care care = Care::kUsual);

    const std::vector<Vec2>& nodes() const { return m_clusters.nodes(); }
    /// Along each strand in their order.
    const std::vector<Run>& runs() const { return m_runs; }
    const std::vector<StrandElement>& pieces() const { return m_in.elements; }
    /// The strands as ranges of the pieces.
    const std::vector<Strand>& strandsCut() const { return m_in.strands; }
    double tolerance() const { return m_tolerance; }

private:
    void cutRound(bool first);
    void gatherPoints(bool first);
    void cutStrand(const Strand& strand);
    void cutFreeStrand(const Strand& strand);
    void cutElement(Index element, Index firstStop, Index lastStop);
    Index findStart(const Strand& strand) const;
    bool meetsNode(Index element) const;
    void advance(Index element, Vec2 to, Index node);
    void passNode(Index node);
    bool hasMoved(const StrandElement& e, Vec2 was, Vec2 node) const;

    Strands m_in;
    Strands m_out;
    double m_tolerance = 0.0;
    Meetings m_meetings;
    NodeClusters m_clusters;
    std::vector<Vec2> m_points;    ///< of the vertices that are nodes, then where elements meet
    std::vector<Index> m_pointOf;  ///< of each vertex, kNone where it is no node
    std::vector<std::uint8_t> m_settled;  ///< vertices that were nodes in the round before
    std::vector<std::uint8_t> m_moved;    ///< elements that were bent by more than half a tolerance
    std::vector<std::uint8_t> m_movedOut;
    std::vector<Run> m_runs;

    // The strand in hand.
    Weight m_weight;
    Vec2 m_at;
    Index m_node = kNone;
    Index m_runFirst = 0;
};

}  // namespace gmregion
