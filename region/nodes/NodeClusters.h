// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

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
    /// @param tolerance in length units, positive; points at exactly this distance belong together
    explicit NodeClusters(double tolerance) : m_tolerance(tolerance) {}

    /// Takes the points in place of those before; all must be finite. Cost: that of sorting them.
    void assign(const std::vector<Vec2>& points);

    /// The nodes, in the order in which they were begun.
    const std::vector<Vec2>& nodes() const { return m_nodes; }
    /// The number of the node that a point went to.
    std::size_t nodeOf(std::size_t point) const { return m_nodeOf[point]; }

private:
    static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

    std::size_t findNode(Vec2 p) const;
    void beginNode(Vec2 p);
    std::size_t slotOf(double column, double row) const;

    double m_tolerance;
    std::vector<Vec2> m_nodes;
    std::vector<std::size_t> m_nodeOf;
    // The nodes by the cell of the plane in which they lie: the latest of each slot, and the one
    // before it in the same slot.
    std::vector<std::size_t> m_latest;
    std::vector<std::size_t> m_before;
};

}  // namespace gmregion
