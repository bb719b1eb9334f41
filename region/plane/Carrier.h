// SPDX-License-Identifier: MIT
/// @file
/// The line or circle that an element runs along, without a centre and without angles.
///
/// Written with sums, products, quotients and square roots alone, so that every compiler gives the
/// same bits.
#pragma once

#include <optional>

#include "region/model/Element.h"

namespace gmregion {

/// A line or circle by one of its points, the normal there and the curvature.
///
/// Lines are circles of curvature 0, and what lies between, arcs of huge radius, needs no case of
/// its own: no number in here is larger than the drawing.
struct Carrier {
    Vec2 at;                 ///< a point of it
    Vec2 normal;             ///< of length 1, to the left of the direction of travel at that point
    double curvature = 0.0;  ///< 1 / radius, positive counter-clockwise
};

/// The carrier of an element, through its start. The ends must differ, and the element must turn by
/// half a turn at the most.
Carrier carrierOf(const Element& e);

/// The carrier at the distance d to the right; nothing when it shrinks to its centre or beyond.
std::optional<Carrier> parallel(const Carrier& c, double d);

/// The signed distance of a point, positive on the left of the direction of travel. Cost: constant.
double signedDistance(const Carrier& c, Vec2 p);

/// Whether that distance, of whatever sign, is at most the limit. Cost: less than that of the
/// distance.
bool isWithin(const Carrier& c, Vec2 p, double limit);

/// The point of the carrier nearest to p. For the centre of a circle any of its points.
Vec2 footOn(const Carrier& c, Vec2 p);

/// The bulge of the arc of a carrier between two points of it, or a little beside it, that turns by
/// half a turn at the most; against its direction of travel where that is the shorter way.
double bulgeBetween(const Carrier& c, Vec2 from, Vec2 to);

/// The bulge of an arc that turns from one direction to another, given by vectors of any length
/// from its centre.
/// @param counterClockwise decides for directions that are opposite within rounding
double bulgeOfTurn(Vec2 from, Vec2 to, bool counterClockwise);

/// The value whose sign tells the side of a point, and its gradient: near the carrier the value is
/// the signed distance and the gradient has length 1.
struct Side {
    double value;
    Vec2 gradient;
};
Side sideOf(const Carrier& c, Vec2 p);

}  // namespace gmregion
