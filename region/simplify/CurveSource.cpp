// SPDX-License-Identifier: MIT
/// @file
/// A curve of points and tangents as a chain of arcs.
///
/// A curve that bends more and more, or less and less, between two points and does not turn far
/// lies in the lens between the two arcs over the chord of which the one has the tangent in the
/// first point and the other that in the second (A. Kurnosenko, Biarcs and bilens, Computer Aided
/// Geometric Design 30, 2013), and so do all biarcs with these tangents. The circles square to all
/// arcs over the chord cross the lens from one side to the other. On each of them there is a point
/// of the curve and one of the biarc, and the way between both is not longer than it is on the
/// straight one, half way along: half the chord times the difference of the bulges. That is how far
/// curve and biarc are apart at the most, both ways.
#include <algorithm>
#include <cmath>

#include "region/simplify/Biarc.h"
#include "region/simplify/Directions.h"
#include "region/simplify/Source.h"

namespace gmregion {

namespace {

Vec2 directionAt(const TangentPoint& point) {
    // Components of 1 at the most, so that no square is too large or too small.
    const double size = std::max(std::fabs(point.tangent.x), std::fabs(point.tangent.y));
    const Vec2 v{point.tangent.x / size, point.tangent.y / size};
    return (1.0 / lengthOf(v)) * v;
}

/// Appends the piece of the curve between two points; false if they are too far apart.
bool appendPiece(const TangentPoint& from, const TangentPoint& to, std::uint32_t number,
                 const Limits& limits, std::vector<Piece>& pieces) {
    const Vec2 chord = to.at - from.at;
    const Vec2 start = directionAt(from);
    const Vec2 end = directionAt(to);
    if (!(dot(start, chord) > 0.0 && dot(end, chord) > 0.0)) return false;
    const double leaving = bulgeLeaving(start, chord);
    const double reaching = bulgeReaching(chord, end);
    const double width = 0.5 * lengthOf(chord) * std::fabs(reaching - leaving);
    if (!(width <= std::max(limits.tolerance, limits.rounding))) return false;
    const auto biarc = biarcBetween({from.at, start, to.at, end});
    if (width <= limits.rounding || !biarc) {
        pieces.push_back(pieceOf({from.at, to.at, 0.5 * (leaving + reaching)}, number));
        pieces.back().slack = width;
        return true;
    }
    for (const Element& arc : *biarc) {
        pieces.push_back(pieceOf(arc, number));
        pieces.back().slack = width;
        pieces.back().part = Part::kShare;
    }
    return true;
}

}  // namespace

Refusal takeCurve(const TangentPoint* points, std::size_t count, bool closed, const Limits& limits,
                  Chain& chain) {
    chain.clear();
    chain.closed = closed;
    Vec2 at = points[0].at;
    for (std::size_t i = 0; i + (closed ? 0 : 1) < count; ++i) {
        const TangentPoint& next = points[(i + 1) % count];
        if (lengthOf(next.at - at) <= limits.rounding) continue;
        if (!appendPiece({at, points[i].tangent}, next, static_cast<std::uint32_t>(i), limits,
                         chain.pieces))
            return {Reason::kTolerance, at, 0};
        at = next.at;
    }
    if (!chain.pieces.empty()) endAt(closed ? points[0].at : points[count - 1].at, chain.pieces);
    return {};
}

Refusal measure(const TangentPoint* points, std::size_t count, double& largest) {
    largest = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        const Point at = points[i].at;
        const Point tangent = points[i].tangent;
        const bool isFinite = std::isfinite(tangent.x) && std::isfinite(tangent.y);
        const Reason reason = isFinite ? faultOf(at) : Reason::kNotFinite;
        if (reason != Reason::kNone)
            return {reason, faultOf(at) == Reason::kNone ? at : Point{}, 0};
        if (tangent == Point{}) return {Reason::kOutOfRange, at, 0};
        largest = std::max({largest, std::fabs(at.x), std::fabs(at.y)});
    }
    return {};
}

}  // namespace gmregion
