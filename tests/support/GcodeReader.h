// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "region/model/Vec2.h"

/// A move of a program, with positions as the machine takes them.
struct GcodeMove {
    int kind = 0;  ///< 0 rapid, 1 straight, 2 clockwise, 3 counter-clockwise
    gmregion::Vec2 from, to, centre;
    double fromZ = 0.0, toZ = 0.0;

    bool cuts() const { return kind != 0 && !(from == to); }
    /// Points along the move, both ends included, at most `step` apart.
    std::vector<gmregion::Vec2> points(double step) const;
};

/// What a machine makes of a program, and what it would object to.
struct GcodeProgram {
    std::vector<GcodeMove> moves;
    std::vector<std::string> faults;  ///< each with the line
    bool inches = false;
};

/// Runs a program in the head. Faults are: words that the machine does not know, moves before the
/// modes and the spindle are set or behind the end, going down from where the machine stands, arcs
/// whose ends lie at radii that differ by more than 1e-5 or that turn by more than half a circle,
/// rapid moves in x and y below the safe height or downwards, feeds sideways above the surface or
/// without a speed, minus zeros, and an end below the safe height or with the spindle on.
GcodeProgram readGcode(const std::string& text, double safeZ);
