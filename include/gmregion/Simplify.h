// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "gmregion/export.h"

namespace gmregion {

/// How far a simplified path may be from its source, and what of it stays.
struct SimplifyOptions {
    /// The largest distance of a result from its source and of the source from its result, in
    /// length units. 0 only makes one of neighbours that lie on one line or one circle up to
    /// rounding, which is a 2^-44th of the largest coordinate.
    double tolerance = 0.0;
    /// The tangent of half the angle from which on a jump of the direction is a corner, above 0 and
    /// up to 1, a right angle. 0.3 are 33.4 degrees: squares, hexagons and octagons keep their
    /// corners, and polygons of eleven and more corners may be circles.
    double corner = 0.3;
    /// The tangent of half the angle up to which a jump beside an arc counts as none, from 0 to
    /// `corner`. 2^-11 are 0.056 degrees: what arcs have whose ends were rounded for a drawing.
    double smooth = 1.0 / 2048.0;
};

/// The elements of a source path that an element of a result stands for: those from `first` on
/// to `last`, both counted from 0 in their path. On closed paths `last` may be below `first`; the
/// range then runs over the end of the path. Neighbours share an element that they divide.
struct SourceRange {
    std::uint32_t first = 0;
    std::uint32_t last = 0;
};

/// What simplify gives: paths, or a refusal and no paths.
struct Simplified {
    /// A path for each of the source, in the same order, open or closed like it, with its id.
    Paths paths;
    /// One for each element of `paths`, path after path.
    std::vector<SourceRange> sources;
    Refusal refusal;
};

/// Replaces paths by paths of few elements that stay within a tolerance, both ways: no point of a
/// result is farther from its source than that, and no point of a source from its result.
///
/// Neighbours on one line or one circle become one element on that line or circle, of three
/// quarters of a turn at the most, and a closed circle two half circles. Runs of short elements
/// become arcs, or segments where those do. Elements of which nothing is made stay bit by bit, and
/// so do the ends of open paths.
///
/// Corners stay: vertices where the direction jumps by more than the angle of the options, both
/// between the elements that meet there and between the points four tolerances before and behind
/// them, so that noise of up to half the tolerance makes no corners. Other vertices may vanish. A
/// vertex beside an arc where the direction jumps by no more than `smooth` is tangent; where a
/// result has a vertex there, or inside an element of its source, it jumps by no more either.
/// Segments are never tangent to each other: between arcs that stand for runs of segments jumps
/// remain, each arc within half the angle of corners of the direction of its source. A result has
/// no more elements than its source.
///
/// Closed paths start at a corner if they have one, else where it suits. Elements shorter than
/// rounding, whatever their bulge, are passed over; a path of nothing else has no elements. Gaps
/// up to the tolerance are closed and leave that much less of it near by; a larger gap is refused.
/// Circles of a radius below twice the tolerance stay as they are.
///
/// Refused are numbers that are not finite or above 1e12, options out of their ranges, and a
/// tolerance other than 0 below a 2^-44th of the largest coordinate.
///
/// Cost: n log n. Method: greedy, the longest run that one arc stands for, or two where tangents
/// are given, by doubling and halving.
/// @param paths what is to be replaced
/// @param options tolerance and angles
/// @param result gets the result; its memory is used again; must not hold the source
/// @return whether there is a result
GMREGION_EXPORT bool simplify(const Paths& paths, const SimplifyOptions& options,
                              Simplified& result);

/// A point of a curve and its direction of travel there. The length of the tangent does not count,
/// but must not be 0.
struct TangentPoint {
    Point at;
    Point tangent;
};

/// Arcs for a curve that is given by points and tangents, as ellipses and splines are: few, tangent
/// to each other, through some of the points, ends among them, and within the tolerance of the
/// curve, both ways.
///
/// The curve is taken to bend in one sense more and more, or less and less, between two points:
/// points belong where its curvature is largest or smallest. Then it lies in the lens between the
/// arc that leaves the first point along its tangent to the second and the arc that reaches the
/// second along its tangent; the width of the lens, half the chord times the difference of both
/// bulges, is what is not known, and goes off the tolerance there. Eight times less with points
/// twice as dense. A lens wider than the tolerance is refused (kTolerance, with its place), and so
/// is a tangent that is a right angle or more off the chord.
///
/// Two points of the same place with different tangents make a corner where `corner` says so.
/// Other options, refusals and cost as for paths; the one path of the result has the number 0, and
/// element i of the source is the piece of the curve from point i to the next.
/// @param points the first of the points
/// @param count how many there are, two at least
/// @param closed whether the curve goes on from the last point to the first
/// @param options tolerance and angles
/// @param result gets the result; its memory is used again
/// @return whether there is a result
GMREGION_EXPORT bool simplifyCurve(const TangentPoint* points, std::size_t count, bool closed,
                                   const SimplifyOptions& options, Simplified& result);

}  // namespace gmregion
