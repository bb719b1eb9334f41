#include "region/model/Placement.h"

#include <cmath>

namespace gmpath {

namespace {

/// Scale factors that differ by less, in relation, count as equal.
constexpr double kUniformTolerance = 1e-6;

/// The scale with both factors of exactly one size; nothing when they differ or are 0.
std::optional<Vec2> uniform(Vec2 scale) {
    const double size = std::abs(scale.x);
    if (size == 0.0 || std::abs(std::abs(scale.y) - size) > kUniformTolerance * size) {
        return std::nullopt;
    }
    return Vec2{scale.x, std::copysign(size, scale.y)};
}

}  // namespace

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

std::optional<Placement> Placement::ofReference(const BlockReference& reference, Vec2 base,
                                                int column, int row) {
    const std::optional<Vec2> scale = uniform(reference.scale);
    if (!scale) return std::nullopt;
    const Vec2 along{std::cos(reference.angle), std::sin(reference.angle)};
    const Vec2 across{-along.y, along.x};
    Placement placement;
    placement.m_xAxis = scale->x * along;
    placement.m_yAxis = scale->y * across;
    placement.m_origin = reference.at + (column * reference.spacing.x) * along +
                         (row * reference.spacing.y) * across;
    placement.m_origin = placement.apply(Vec2{-base.x, -base.y});
    if (!reference.mirrored) return placement;
    Placement mirror;
    mirror.m_xAxis = {-1.0, 0.0};
    return mirror.after(placement);
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

}  // namespace gmpath
