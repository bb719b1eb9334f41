// SPDX-License-Identifier: MIT
/// @file
/// Whether a run of pieces and an arc are within t of each other, both ways.
///
/// The arc turns by half a turn at the most and t is below its radius. Take the ring of all points
/// within t of its circle, and of that the sector between the normals at its ends. The nearest
/// point on the circle to a point of the sector lies on the arc; so pieces in the sector are within
/// t of the arc. And as they lead from one end of the arc to the other without a gap, their
/// nearest points, which change continuously, take every point of the arc: each point of the arc is
/// the nearest to some point of a piece, and within t of it. Nothing is asked about the way between
/// the ends; pieces may run back, as noise does.
///
/// Ring: with G as in Carrier.cpp, the distance is extreme at the ends of a piece and where G does
/// not change along it. The slope of G along a segment is linear; along an arc it is a sine of its
/// angle, as the gradient is k1/k2 of the normal of the arc plus a constant vector. So a piece of a
/// quarter turn at the most has one extreme between its ends if the slopes there differ in sign,
/// and none otherwise, and the direction at the extreme is the sum of those at the ends, each
/// weighted with the slope at the other.
///
/// Sector: that is between two half-planes, and segments are in it with their ends. An arc is if
/// its ends are and it advances throughout. How fast it does is also a sine plus a constant,
/// and extreme in the same points as G.
///
/// Rounding has a 2^-10th of the tolerance: the ring is narrower by it and the sector wider.
#include "region/simplify/Corridor.h"

#include <algorithm>
#include <cmath>

#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

constexpr double kMargin = 1.0 / 1024.0;
/// Arcs of a smaller bulge are parabolas: they differ from them by the bulge cubed.
constexpr double kFlatBulge = 1.0 / 8192.0;
/// The bulge of a quarter turn, rounded up.
constexpr double kQuarterBulge = 0.4142135624;

/// The point between the ends of a piece where the slope of G is 0; `before` and `behind` are the
/// slopes at the ends, of different signs.
Vec2 extremeOn(const Piece& piece, double before, double behind) {
    const Element& e = piece.e;
    const double a = std::fabs(before);
    const double b = std::fabs(behind);
    const Vec2 chord = e.ep - e.sp;
    const double share = a / (a + b);
    if (std::fabs(e.bulge) < kFlatBulge)
        return e.sp + share * chord + (2.0 * share * (1.0 - share) * e.bulge) * rightNormal(chord);
    const Vec2 sum = b * piece.startDir + a * piece.endDir;
    const Vec2 dir = (1.0 / lengthOf(sum)) * sum;
    const double q = 1.0 + e.bulge * e.bulge;
    const double radius = lengthOf(chord) * q / (4.0 * e.bulge);
    return e.sp + radius * rightNormal(dir - piece.startDir);
}

}  // namespace

bool Ring::holdsPart(const Piece& piece, double t, bool wantAlong) const {
    const Element& e = piece.e;
    const double reach = t * (1.0 - kMargin);
    if (!isWithin(m_carrier, e.sp, reach) || !isWithin(m_carrier, e.ep, reach)) return false;
    const Vec2 start = sideOf(m_carrier, e.sp).gradient;
    const Vec2 end = sideOf(m_carrier, e.ep).gradient;
    if (wantAlong && !(cross(piece.startDir, start) > 0.0 && cross(piece.endDir, end) > 0.0))
        return false;
    const double before = dot(start, piece.startDir);
    const double behind = dot(end, piece.endDir);
    if (before == 0.0 || behind == 0.0 || (before > 0.0) == (behind > 0.0)) return true;
    const Vec2 p = extremeOn(piece, before, behind);
    if (!isWithin(m_carrier, p, reach)) return false;
    if (!wantAlong || !isArc(e)) return true;
    const Vec2 there = sideOf(m_carrier, p).gradient;
    const Vec2 dir = std::fabs(behind) * piece.startDir + std::fabs(before) * piece.endDir;
    return cross(dir, there) > 0.0;
}

bool Ring::holds(const Piece& piece, double t) const {
    if (!(std::fabs(m_carrier.curvature) * t <= 0.5)) return false;
    if (std::fabs(piece.e.bulge) <= kQuarterBulge) return holdsPart(piece, t, false);
    const Parts parts = halved(piece.e);
    return holdsPart(pieceOf(parts.first, 0), t, false) &&
           holdsPart(pieceOf(parts.second, 0), t, false);
}

bool Ring::holdsAlong(const Piece& piece, double t) const {
    if (!(std::fabs(m_carrier.curvature) * t <= 0.5)) return false;
    if (std::fabs(piece.e.bulge) <= kQuarterBulge) return holdsPart(piece, t, true);
    const Parts parts = halved(piece.e);
    return holdsPart(pieceOf(parts.first, 0), t, true) &&
           holdsPart(pieceOf(parts.second, 0), t, true);
}

bool Corridor::holds(const Piece& piece, double t) const {
    const auto isOpposite = [&](Vec2 p) {
        return dot(p - m_arc.e.sp, m_arc.startDir) >= -t * kMargin &&
               dot(m_arc.e.ep - p, m_arc.endDir) >= -t * kMargin;
    };
    if (!isOpposite(piece.e.sp) || !isOpposite(piece.e.ep)) return false;
    return isArc(piece.e) ? m_ring.holdsAlong(piece, t) : m_ring.holds(piece, t);
}

}  // namespace gmregion
