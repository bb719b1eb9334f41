// SPDX-License-Identifier: MIT
#include "machining/obstacles/Obstacles.h"

#include <algorithm>

namespace gmmachining {

using gmpart::Path;
using gmregion::ClearanceIndex;
using gmregion::Element;
using gmregion::Paths;

namespace {

ClearanceIndex indexOf(const std::vector<Path>& edges) {
    Paths heap;
    for (const Path& edge : edges)
        heap.add(edge.elements, edge.closed);
    return ClearanceIndex(heap);
}

}  // namespace

Obstacles::Obstacles(const std::vector<Path>& edges, double tolerance)
    : m_edges(indexOf(edges)), m_slack(2.0 * tolerance) {}

bool Obstacles::keepClear(const Path& path, double clearance) const {
    const double limit = clearance - m_slack;
    return limit <= 0.0 ||
           std::none_of(path.elements.begin(), path.elements.end(),
                        [&](const Element& e) { return m_edges.of(e, limit).has_value(); });
}

}  // namespace gmmachining
