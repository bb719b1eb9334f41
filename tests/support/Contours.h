// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmPoint.h"

/// Contours to test with, and the variants under which a law about contours must go on holding.
namespace shapes {

/// The chain that words describe: a start point, then one element after another, with identifiers
/// from 1. "x y" is a segment to that point; "cw" or "ccw", centre and end are an arc.
GmContour Path(std::string const& words);

/// Counter-clockwise square from (0, 0) to (side, side), starting at the origin.
GmContour Square(double side);

/// Counter-clockwise slot: segments of length 8 from y = 0 and y = 6, half circles at the ends.
GmContour Slot();

/// Counter-clockwise rectangle from (0, 0) to (12, 9) with quarter circles of radius 2.
GmContour RoundedRectangle();

/// One corner of a star: its distance from the origin and the height of the arc over the side that
/// starts there, as a share of half the side; below 1e-3 a segment, positive bulges to the right of
/// the direction of travel, which is outwards.
struct StarCorner {
    double r;
    double bulge;
};

/// Counter-clockwise closed contour with its corners at equal angles about the origin.
GmContour Star(std::vector<StarCorner> const& corners);

/// A star without self-intersections made from the seed alone: 5 to 12 corners at radii from 6 to
/// 10, arcs up to a bulge of 0.15 where wanted. Every ray from the origin leaves it once, at
/// 3.5 or more.
GmContour RandomStar(unsigned seed, bool bWithArcs);

/// A contour changed in a way that keeps its shape up to a similarity.
struct Variant {
    std::string name;
    GmContour contour;
    GmMatrix map;    ///< takes points of the original to the variant
    double scale;    ///< factor of lengths
    bool bReversed;  ///< is the right side of the original on the left of the variant?

    GmPoint Map(GmPoint const& p) const { return GmPoint(map * p); }
    /// A signed distance beside the original, as it is beside the variant.
    double MapOffset(double d) const { return (bReversed ? -d : d) * scale; }
};

/// The contour itself; reversed, started at another element (if closed), mirrored at the y axis,
/// rotated, moved far, made larger and smaller.
std::vector<Variant> Variants(GmContour const& contour);

/// The closed contour with the given element first.
GmContour StartedAt(GmContour const& contour, int first);

/// A copy moved by (dx, dy).
GmContour Moved(GmContour contour, double dx, double dy);

/// The identifiers of the elements in order.
std::vector<long> Identifiers(GmContour const& contour);

/// Sum of the elements' lengths.
double ChainLength(GmContour const& contour);

/// Points on the contour, `perElement` on each element with both of its ends among them (at least
/// two).
std::vector<GmPoint> Samples(GmContour const& contour, int perElement);

}  // namespace shapes
