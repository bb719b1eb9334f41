// SPDX-License-Identifier: MIT
#pragma once

#include "part/model/Path.h"

namespace gmpart {

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

    /// Takes the origin to `origin` and the unit points of the axes to `xAxis` and `yAxis` from
    /// there. The axes are as long as each other, not 0, and square to each other.
    static Placement toAxes(Vec2 origin, Vec2 xAxis, Vec2 yAxis);

    /// First `inner`, then this.
    Placement after(const Placement& inner) const;

    Vec2 apply(Vec2 p) const;
    Path apply(const Path& path) const;

private:
    Vec2 m_xAxis{1.0, 0.0};
    Vec2 m_yAxis{0.0, 1.0};
    Vec2 m_origin;
};

}  // namespace gmpart
