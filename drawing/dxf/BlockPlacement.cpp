// SPDX-License-Identifier: MIT
/// @file
/// The placement of a block: about its base point, scaled, turned, then moved to the cell of the
/// reference, and mirrored last where it is drawn on the back of the plane.
///
/// Scale factors of one size but different sign mirror, which keeps arcs arcs; factors of different
/// sizes make ellipses of them. Sizes that differ by rounding are made one.

#include "drawing/dxf/BlockPlacement.h"

#include <cmath>

namespace gmdrawing {

using gmregion::Vec2;

namespace {

/// Scale factors that differ by less, in relation, count as equal.
constexpr double kUniformTolerance = 1e-6;

/// The scale with both factors of exactly one size where they differ by rounding; nothing where one
/// of them is 0.
std::optional<Vec2> soundScale(Vec2 scale) {
    const double size = std::abs(scale.x);
    if (size == 0.0 || scale.y == 0.0) return std::nullopt;
    const bool uniform = std::abs(std::abs(scale.y) - size) <= kUniformTolerance * size;
    return uniform ? Vec2{scale.x, std::copysign(size, scale.y)} : scale;
}

}  // namespace

std::optional<Placement> blockPlacement(const BlockReference& reference, Vec2 base, int column,
                                        int row) {
    const std::optional<Vec2> scale = soundScale(reference.scale);
    if (!scale) return std::nullopt;
    const Vec2 along{std::cos(reference.angle), std::sin(reference.angle)};
    const Vec2 across{-along.y, along.x};
    const Vec2 xAxis = scale->x * along;
    const Vec2 yAxis = scale->y * across;
    const Vec2 cell = reference.at + (column * reference.spacing.x) * along +
                      (row * reference.spacing.y) * across;
    const Vec2 origin = Placement::toAxes(cell, xAxis, yAxis).apply(Vec2{-base.x, -base.y});
    const Placement placement = Placement::toAxes(origin, xAxis, yAxis);
    if (!reference.mirrored) return placement;
    return Placement::toAxes({}, {-1.0, 0.0}, {0.0, 1.0}).after(placement);
}

}  // namespace gmdrawing
