// SPDX-License-Identifier: MIT
#include "drawing/curves/Placement.h"

#include <cmath>

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;
using gmregion::Vec2;

Placement Placement::scaling(double factor) {
    Placement placement;
    placement.m_xAxis = {factor, 0.0};
    placement.m_yAxis = {0.0, factor};
    return placement;
}

Placement Placement::toAxes(Vec2 origin, Vec2 xAxis, Vec2 yAxis) {
    Placement placement;
    placement.m_xAxis = xAxis;
    placement.m_yAxis = yAxis;
    placement.m_origin = origin;
    return placement;
}

Placement Placement::after(const Placement& inner) const {
    Placement both;
    both.m_origin = apply(inner.m_origin);
    both.m_xAxis = apply(inner.m_origin + inner.m_xAxis) - both.m_origin;
    both.m_yAxis = apply(inner.m_origin + inner.m_yAxis) - both.m_origin;
    return both;
}

Vec2 Placement::apply(Vec2 p) const {
    return m_origin + p.x * m_xAxis + p.y * m_yAxis;
}

bool Placement::isSimilarity() const {
    constexpr double kTolerance = 1e-6;
    const double size = dot(m_xAxis, m_xAxis);
    return std::abs(dot(m_yAxis, m_yAxis) - size) <= 2.0 * kTolerance * size &&
           std::abs(dot(m_xAxis, m_yAxis)) <= kTolerance * size;
}

Element Placement::apply(const Element& e) const {
    const double turn = cross(m_xAxis, m_yAxis) < 0.0 ? -1.0 : 1.0;
    return {apply(e.sp), apply(e.ep), turn * e.bulge};
}

Path Placement::apply(const Path& path) const {
    Path placed = path;
    for (Element& e : placed.elements)
        e = apply(e);
    return placed;
}

}  // namespace gmdrawing
