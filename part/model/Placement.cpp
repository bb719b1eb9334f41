// SPDX-License-Identifier: MIT
#include "part/model/Placement.h"

#include <cmath>

namespace gmpart {

Placement Placement::scaling(double factor) {
    Placement placement;
    placement.m_xAxis = {factor, 0.0};
    placement.m_yAxis = {0.0, factor};
    return placement;
}

Placement Placement::turning(double angle, Vec2 about) {
    Placement placement;
    placement.m_xAxis = {std::cos(angle), std::sin(angle)};
    placement.m_yAxis = {-placement.m_xAxis.y, placement.m_xAxis.x};
    placement.m_origin = about - placement.apply(about);
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

Path Placement::apply(const Path& path) const {
    const double turn = cross(m_xAxis, m_yAxis) < 0.0 ? -1.0 : 1.0;
    Path placed = path;
    for (Element& e : placed.elements)
        e = {apply(e.sp), apply(e.ep), turn * e.bulge};
    return placed;
}

}  // namespace gmpart
