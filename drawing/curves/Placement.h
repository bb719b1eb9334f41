// SPDX-License-Identifier: MIT
#pragma once

#include "part/model/Path.h"

namespace gmdrawing {

/// An affine map of the plane: scale, turn, move, and possibly a mirroring. Under a similarity,
/// which scales alike in all directions, arcs stay arcs; other maps make ellipses of them.
class Placement {
public:
    /// Leaves everything where it is.
    Placement() = default;

    /// Scales about the origin by a factor, finite and not 0.
    static Placement scaling(double factor);

    /// Takes the origin to `origin` and the unit points of the axes to `xAxis` and `yAxis` from
    /// there, which are not parallel.
    static Placement toAxes(gmregion::Vec2 origin, gmregion::Vec2 xAxis, gmregion::Vec2 yAxis);

    /// First `inner`, then this.
    Placement after(const Placement& inner) const;

    /// Whether both axes are as long as each other and square, within a millionth.
    bool isSimilarity() const;

    gmregion::Vec2 apply(gmregion::Vec2 p) const;
    /// An element under a similarity, a segment under any map.
    gmregion::Element apply(const gmregion::Element& e) const;
    /// The same for all elements of a path.
    gmpart::Path apply(const gmpart::Path& path) const;

private:
    gmregion::Vec2 m_xAxis{1.0, 0.0};
    gmregion::Vec2 m_yAxis{0.0, 1.0};
    gmregion::Vec2 m_origin;
};

}  // namespace gmdrawing
