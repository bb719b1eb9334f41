// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "tests/support/RegionShapes.h"

/// Parts as people draw them, of lines and arcs that join tangentially, about the origin and some
/// tens of units large.
namespace gmregion::shapes {

struct DrawnPart {
    std::string name;
    std::vector<Elements> loops;  ///< outline and holes; what is covered goes by even and odd
    std::vector<double> lengths;  ///< its radii and half widths: distances where something happens
};

/// A polygon with arcs of that radius in its corners, tangent to its sides.
Elements rounded(const std::vector<Vec2>& corners, double r);

std::vector<DrawnPart> drawnParts();
/// Of regular polygons with that many corners.
DrawnPart regularPolygon(int corners);

/// How a part stands in a drawing.
struct Drawing {
    double degrees = 0.0;   ///< by which it is turned
    int decimals = 0;       ///< to which its coordinates are rounded
    std::size_t start = 0;  ///< number of the element at which its loops begin
};

/// The farthest that rounding takes a point of a part from where it was: both ends of an element
/// move by half a unit in x and y, and those of arcs up to a half circle carry it along.
double roundingOf(const Drawing& drawing);

std::vector<Elements> drawn(const DrawnPart& part, const Drawing& drawing);

/// The number of elements of the largest loop.
std::size_t startsOf(const DrawnPart& part);

}  // namespace gmregion::shapes
