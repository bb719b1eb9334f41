// SPDX-License-Identifier: MIT
/// @file
/// Clusters with a bounded diameter.
///
/// Uniting whatever is near would let a chain of near points collapse into one node far from most
/// of them; so a node keeps its place. Nodes are found by cells of the width of the tolerance,
/// hashed into as many slots as there are points: what is within the tolerance lies in the cell of
/// a point or in one of the eight about it, and as nodes lie apart, a cell holds few of them.
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
    const double column = std::floor(p.x / m_tolerance);
    const double row = std::floor(p.y / m_tolerance);
    Index first = kNone;
    for (const double aside : {-1.0, 0.0, 1.0}) {
        for (const double above : {-1.0, 0.0, 1.0}) {
            const std::size_t slot = slotOf(column + aside, row + above);
            for (Index node = m_latest[slot]; node != kNone; node = m_before[node]) {
                const Vec2 away = m_nodes[node] - p;
                if (dot(away, away) <= m_tolerance * m_tolerance) first = std::min(first, node);
            }
        }
    }
    return first;
}

void NodeClusters::beginNode(Vec2 p) {
    const std::size_t slot = slotOf(std::floor(p.x / m_tolerance), std::floor(p.y / m_tolerance));
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
