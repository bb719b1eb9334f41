#pragma once

#include <optional>

#include "drawing/dxf/Drawing.h"

namespace gmpath {

/// A similarity of the plane: uniform scale, turn, move, and possibly a mirroring. Straight
/// segments and arcs keep their kind under it.
class Placement {
public:
    /// Leaves everything where it is.
    Placement() = default;

    /// Scales about the origin by a factor, finite and not 0.
    static Placement scaling(double factor);

    /// Turns counter-clockwise about a point by an angle in radians.
    static Placement turning(double angle, Vec2 about);

    /// Where a block with the given base point comes to lie by one cell of a reference, column and
    /// row counted from 0. Nothing when the scale is not uniform or 0, so that no similarity
    /// exists.
    static std::optional<Placement> ofReference(const BlockReference& reference, Vec2 base,
                                                int column, int row);

    /// First `inner`, then this.
    Placement after(const Placement& inner) const;

    Vec2 apply(Vec2 p) const;
    Path apply(const Path& path) const;

private:
    Vec2 m_xAxis{1.0, 0.0};
    Vec2 m_yAxis{0.0, 1.0};
    Vec2 m_origin;
};

}  // namespace gmpath
