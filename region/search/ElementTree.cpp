// SPDX-License-Identifier: MIT
/// @file
/// Nearest elements by nested boxes.
///
/// The boxes halve the row of elements, whose neighbours in the row are neighbours in space; a box
/// farther away than the best distance so far is passed over with all it holds. Building is linear
/// in the elements; a question takes the logarithm of their number where few are near, and up to
/// all of them where all are equally near, as at the centre of a circle. The tree is never
/// rebalanced: it serves one path that does not change.

#include "region/search/ElementTree.h"

#include <algorithm>

namespace gmregion {

namespace {

constexpr std::size_t kLongestRun = 4;

/// Distance from p to the nearest point of the box; infinite for an empty box.
double distance(const Box& box, Vec2 p) {
    const double dx = std::max({box.low.x - p.x, p.x - box.high.x, 0.0});
    const double dy = std::max({box.low.y - p.y, p.y - box.high.y, 0.0});
    return std::hypot(dx, dy);
}

}  // namespace

ElementTree::ElementTree(std::vector<Element> elements) : m_elements(std::move(elements)) {
    if (!m_elements.empty()) build(0, m_elements.size());
}

bool ElementTree::comesNearer(Vec2 p, double r) const {
    return !m_nodes.empty() && comesNearer(0, p, r);
}

double ElementTree::distanceWithin(Vec2 p, double farthest) const {
    return m_nodes.empty() ? farthest : distanceWithin(0, p, farthest);
}

Box ElementTree::box() const {
    return m_nodes.empty() ? Box() : m_nodes.front().box;
}

void ElementTree::build(std::size_t first, std::size_t last) {
    const std::size_t index = m_nodes.size();
    m_nodes.push_back({{}, first, last, 0});
    if (last - first > kLongestRun) {
        const std::size_t half = first + (last - first) / 2;
        build(first, half);
        m_nodes[index].second = m_nodes.size();
        build(half, last);
        m_nodes[index].box.include(m_nodes[index + 1].box);
        m_nodes[index].box.include(m_nodes[m_nodes[index].second].box);
        return;
    }
    for (std::size_t i = first; i < last; ++i)
        m_nodes[index].box.include(boundingBox(m_elements[i]));
}

bool ElementTree::comesNearer(std::size_t index, Vec2 p, double r) const {
    const Node& node = m_nodes[index];
    if (!(distance(node.box, p) < r)) return false;
    if (node.second != 0) return comesNearer(index + 1, p, r) || comesNearer(node.second, p, r);
    const auto isNearer = [&](const Element& e) { return distance(e, p) < r; };
    return std::any_of(m_elements.begin() + static_cast<std::ptrdiff_t>(node.first),
                       m_elements.begin() + static_cast<std::ptrdiff_t>(node.last), isNearer);
}

double ElementTree::distanceWithin(std::size_t index, Vec2 p, double farthest) const {
    const Node& node = m_nodes[index];
    if (!(distance(node.box, p) < farthest)) return farthest;
    if (node.second != 0) {
        return distanceWithin(node.second, p, distanceWithin(index + 1, p, farthest));
    }
    for (std::size_t i = node.first; i < node.last; ++i)
        farthest = std::min(farthest, distance(m_elements[i], p));
    return farthest;
}

}  // namespace gmregion
