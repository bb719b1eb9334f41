// SPDX-License-Identifier: MIT
#pragma once

#include "machining/moves/Toolpath.h"

namespace gmmachining {

/// Writes down the moves of a tool and knows where it is.
class MoveRecorder {
public:
    /// The tool rises to the safe height first. Where it stands is not known until it has gone to a
    /// point; up to then it counts as standing above the origin.
    explicit MoveRecorder(double safeZ);

    gmregion::Vec2 place() const { return m_place; }

    /// The moves that follow serve this contour.
    void serve(std::size_t contour) { m_contour = contour; }

    /// Goes to a point at the safe height, unless the tool stands there already at any height.
    void rapidTo(gmregion::Vec2 p);

    /// Goes straight down to z.
    void plungeTo(double z);

    /// Follows a path from where the tool is, at its height. Nothing for a path without elements.
    void follow(MoveKind kind, const gmpart::Path& path);

    /// Rises to the safe height, unless the tool is there.
    void lift();

    Toolpath takeMoves() { return std::move(m_moves); }

private:
    void moveTo(MoveKind kind, double z);

    double m_safeZ;
    gmregion::Vec2 m_place;
    bool m_placed = false;  ///< the tool has gone to a point
    double m_z = 0.0;
    std::size_t m_contour = 0;
    Toolpath m_moves;
};

}  // namespace gmmachining
