// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Element.h"

#include "region/model/Vec2.h"

namespace gmregion {

/// Points of the kernel count as equal, and curves as too short, below this length.
constexpr double kKernelTolerance = 1e-4;

inline bool isArc(const Element& e) {
    return e.bulge != 0.0;
}

/// Sweep in radians, positive counter-clockwise, 0 for a segment.
double sweep(const Element& e);

/// Radius of an arc; infinite for a segment.
double radius(const Element& e);

/// Centre of an arc. Undefined (not finite) for a segment.
Vec2 centre(const Element& e);

/// Point half way along the element.
Vec2 halvingPoint(const Element& e);

/// Point at the fraction t, 0..1, of the length.
Vec2 pointAt(const Element& e, double t);

/// Unit direction of travel at the fraction t, 0..1, of the length; zero for an element without
/// extent.
Vec2 tangentAt(const Element& e, double t);

/// Length along the element.
double length(const Element& e);

/// Unit direction of travel at the start; zero for an arc or segment without extent.
Vec2 tangentStart(const Element& e);

/// Unit direction of travel at the end; zero for an arc or segment without extent.
Vec2 tangentEnd(const Element& e);

/// The same element run the other way.
Element reversed(const Element& e);

/// Positive when p lies left of the line from the element's start to its end, negative when it
/// lies right, 0 on the line.
double sideOfChord(const Element& e, Vec2 p);

/// True when a point q of the arc's circle lies on the arc itself.
bool arcHolds(const Element& e, Vec2 q);

/// The point of the element nearest to p.
Vec2 nearestPoint(const Element& e, Vec2 p);

/// Distance from p to the nearest point of the element.
double distance(const Element& e, Vec2 p);

/// The element as a segment when it leaves its chord by less than a tenth of the kernel's
/// tolerance, otherwise unchanged.
Element straightened(const Element& e);

/// The arc from sp to ep through a third point; a segment when the three are in line, within a
/// tenth of the kernel's tolerance.
Element arcThrough(Vec2 sp, Vec2 through, Vec2 ep);

/// The element with its ends moved to sp and ep. The halving point of an arc stays where it is,
/// so that a small move of the ends moves no other point of the arc by more.
Element withEnds(const Element& e, Vec2 sp, Vec2 ep);

}  // namespace gmregion
