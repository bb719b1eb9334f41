// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/model/Box.h"

namespace gmregion {

/// Elements in nested boxes, for asking whether any comes near a point. The elements of a path
/// follow each other in space too, so each box is that of a run of them. Cost of a question: the
/// logarithm of the number of elements where few are near.
class ElementTree {
public:
    explicit ElementTree(std::vector<Element> elements);

    /// True when some element comes nearer to p than r.
    bool comesNearer(Vec2 p, double r) const;

    /// The distance from p to the nearest element, at most `farthest`.
    double distanceWithin(Vec2 p, double farthest) const;

    /// The box of all elements.
    Box box() const;

private:
    /// The box of a run of elements. The boxes of its halves are the next node and `second`; short
    /// runs are not halved.
    struct Node {
        Box box;
        std::size_t first;
        std::size_t last;    ///< behind the run
        std::size_t second;  ///< 0 for a run that is not halved
    };

    void build(std::size_t first, std::size_t last);
    bool comesNearer(std::size_t index, Vec2 p, double r) const;
    double distanceWithin(std::size_t index, Vec2 p, double farthest) const;

    std::vector<Element> m_elements;
    std::vector<Node> m_nodes;
};

}  // namespace gmregion
