#pragma once

#include <string>
#include <vector>

#include "gmkernel/GmContour.h"

/// What holds of the offsets of a contour, computed from plain formulas and none of the library's
/// own distances and intersections.
namespace offset_laws {

/// Distance of a point from the nearest segment or arc of a contour.
double DistanceFrom(GmContour const& contour, GmPoint const& p);

/// Area enclosed by a closed contour, positive when it runs counter-clockwise.
double Area(GmContour const& contour);

/// The offsets that a contour holds as sub-contours.
std::vector<GmContour const*> Results(GmContour const& source);

/// How a law came out.
struct Verdict {
    std::string fault;  ///< the first point at which the law fails, empty when it holds
    int checked = 0;    ///< the points that were looked at
    bool Holds() const { return fault.empty(); }
};

/// Every point of the results lies at the distance |d| from the source, on its right side for
/// positive d; sides are only told apart where the source is closed.
Verdict KeepsDistance(GmContour const& source, double d);

/// Every point of the offsets of single elements, and of the arcs about corners that open away from
/// the offset side, is on some result unless another part of the source comes nearer to it.
Verdict MissesNothing(GmContour const& source, double d);

/// Results are chains without gaps; those of a closed source are closed.
Verdict IsChained(GmContour const& source);

}  // namespace offset_laws
