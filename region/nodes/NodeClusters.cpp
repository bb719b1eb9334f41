// SPDX-License-Identifier: MIT
/// @file
/// Clusters with a bounded diameter.
///
/// Uniting whatever is near would let a chain of near points collapse into one node far from most
/// of them; so a node keeps its place. Nodes are found by cells some tolerances wide,
/// hashed into as many slots as there are points: what is within the tolerance lies in the cell of
/// a point or in one beside it, and as nodes lie apart, a cell holds few of them.
#include "region/nodes/NodeClusters.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <numeric>

namespace gmregion {

namespace {

std::uint64_t bitsOf(double value) {
    value += 0.0;  // one zero
    std::uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    return bits;
}

}  // namespace

void NodeClusters::assign(const std::vector<Vec2>& points, double tolerance, std::size_t settled) {
    m_tolerance = tolerance;
    m_nodes.clear();
    m_before.clear();
    m_nodeOf.assign(points.size(), kNone);
    m_latest.assign(points.size() + 1, kNone);
    for (std::size_t i = 0; i < settled; ++i)
        take(i, points[i]);
    m_order.resize(points.size() - settled);
    std::iota(m_order.begin(), m_order.end(), static_cast<Index>(settled));
    std::sort(m_order.begin(), m_order.end(), [&](Index a, Index b) {
        return points[a] < points[b] || (points[a] == points[b] && a < b);
    });
    for (const Index index : m_order)
        take(index, points[index]);
}

void NodeClusters::take(std::size_t index, Vec2 p) {
    Index node = findNode(p);
    if (node == kNone) {
        node = static_cast<Index>(m_nodes.size());
        beginNode(p);
    }
    m_nodeOf[index] = node;
}

/// The node that was begun first of those within the tolerance.
Index NodeClusters::findNode(Vec2 p) const {
    const double firstColumn = columnOf(p.x - m_tolerance);
    const double firstRow = columnOf(p.y - m_tolerance);
    const int columns = columnOf(p.x + m_tolerance) > firstColumn ? 2 : 1;
    const int rows = columnOf(p.y + m_tolerance) > firstRow ? 2 : 1;
    Index first = kNone;
    for (int i = 0; i < columns; ++i) {
        for (int j = 0; j < rows; ++j) {
            const std::size_t slot = slotOf(firstColumn + i, firstRow + j);
            for (Index node = m_latest[slot]; node != kNone; node = m_before[node]) {
                const Vec2 away = m_nodes[node] - p;
                if (dot(away, away) <= m_tolerance * m_tolerance) first = std::min(first, node);
            }
        }
    }
    return first;
}

/// Cells are eight tolerances wide: few points are near the border of one.
double NodeClusters::columnOf(double coordinate) const {
    return std::floor(coordinate * (0.125 / m_tolerance));
}

void NodeClusters::beginNode(Vec2 p) {
    const std::size_t slot = slotOf(columnOf(p.x), columnOf(p.y));
    m_before.push_back(m_latest[slot]);
    m_latest[slot] = static_cast<Index>(m_nodes.size());
    m_nodes.push_back(p);
}

std::size_t NodeClusters::slotOf(double column, double row) const {
    constexpr std::uint64_t kOdd = 0x9e3779b97f4a7c15u;
    std::uint64_t mixed = bitsOf(column) * kOdd;
    mixed = (mixed ^ (mixed >> 32) ^ bitsOf(row)) * kOdd;
    mixed ^= mixed >> 29;
    return static_cast<std::size_t>(mixed % m_latest.size());
}

}  // namespace gmregion
