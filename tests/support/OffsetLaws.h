// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmkernel/GmContour.h"

/// What holds of the offsets of a contour, computed from plain formulas and none of the library's
/// own distances and intersections.
namespace offset_laws {

/// Distance of a point from the nearest segment or arc of a contour.
double DistanceFrom(GmContour const& contour, GmPoint const& p);

/// Area enclosed by a closed contour, positive when it runs counter-clockwise.
double Area(GmContour const& contour);

using Contours = std::vector<GmContour const*>;

/// The offsets that a contour holds as sub-contours.
Contours Results(GmContour const& source);

/// Expects of the offsets of a contour by d, positive to the right:
/// - every point lies at the distance |d| from the source, and on the right side where that is
///   closed;
/// - every point of the offsets of single elements, and of the arcs about corners that open away
///   from the offset side, is on some result unless another part of the source comes nearer to it;
/// - they are chains without gaps, closed where the source is.
/// @returns the number of points that were looked at
int ExpectOffsetLaws(GmContour const& source, Contours const& results, double d);
/// The same of the offsets that the contour holds.
int ExpectOffsetLaws(GmContour const& source, double d);

}  // namespace offset_laws
