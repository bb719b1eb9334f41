// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "region/model/Index.h"
#include "region/model/Vec2.h"

namespace gmregion {

/// Points that lie within a tolerance of each other, drawn together to one node each.
///
/// The points are taken in the order of x, then y. Each goes to the node that was begun first among
/// those within the tolerance, or begins a node in its own place. So a node is one of the points,
/// no point moves by more than the tolerance however long a chain of near points is, nodes lie
/// farther apart than the tolerance, and the order in which points are given does not matter.
class NodeClusters {
public:
    /// Takes the points in place of those before; all must be finite. Cost: that of sorting them.
    /// @param tolerance in length units, positive; points at exactly this distance belong together
    /// @param settled so many of the first points, each at the place of another of them or farther
    /// than the tolerance from it, begin their nodes before the others
    void assign(const std::vector<Vec2>& points, double tolerance, std::size_t settled = 0);

    /// The nodes, in the order in which they were begun.
    const std::vector<Vec2>& nodes() const { return m_nodes; }
    /// The number of the node that a point went to.
    Index nodeOf(std::size_t point) const { return m_nodeOf[point]; }

private:
    Index findNode(Vec2 p) const;
    double columnOf(double coordinate) const;
    void beginNode(Vec2 p);
    std::size_t slotOf(double column, double row) const;

    void take(std::size_t index, Vec2 p);

    double m_tolerance = 0.0;
    std::vector<Vec2> m_nodes;
    std::vector<Index> m_nodeOf;
    std::vector<Index> m_order;
    // The nodes by the cell of the plane in which they lie: the latest of each slot, and the one
    // before it in the same slot.
    std::vector<Index> m_latest;
    std::vector<Index> m_before;
};

}  // namespace gmregion
