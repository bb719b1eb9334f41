// SPDX-License-Identifier: MIT
#include "machining/obstacles/Obstacles.h"

#include <algorithm>

#include "part/regions/ContourRegions.h"

namespace gmmachining {

using gmpart::Path;
using gmregion::ClearanceIndex;
using gmregion::Element;
using gmregion::Paths;

namespace {

ClearanceIndex indexOf(const std::vector<Path>& contours) {
    Paths heap;
    for (const Path& contour : contours)
        heap.add(contour.elements, contour.closed);
    return ClearanceIndex(heap);
}

}  // namespace

Obstacles::Obstacles(const std::vector<Path>& contours)
    : m_contours(indexOf(contours)), m_slack(2.0 * gmpart::partTolerance(contours)) {}

bool Obstacles::keepClear(const Path& path, double clearance) const {
    const double limit = clearance - m_slack;
    return limit <= 0.0 ||
           std::none_of(path.elements.begin(), path.elements.end(),
                        [&](const Element& e) { return m_contours.of(e, limit).has_value(); });
}

}  // namespace gmmachining
