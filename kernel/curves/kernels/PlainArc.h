// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmBase.h"
#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

/// An arc in plain numbers: what GmArc holds and answers, without the object and without the axis.
struct PlainArc {
    Vec3 m;
    double r;
    Vec3 sp;
    Vec3 ep;
    double startDegrees;  ///< the stored angles, which snap to the axes
    double endDegrees;
    GmBase::eRotDir sense;
};

/// The polar angle in degrees of a point seen from the centre, as it is stored for an end that was
/// moved.
double angleOfEnd(PlainArc const& arc, Vec3 const& p);

/// The membership tolerance of arcs, in length units.
constexpr double kArcElementPrec = 0.01;

/// Does a point lie on the arc, in its sweep and nearer to the circle than `eps`? The ends count
/// within the length tolerance; equal ends count as a full circle.
bool isOn(PlainArc const& arc, Vec3 const& p, double eps);

/// The length along the arc from its start to a polar angle.
double lengthUpTo(PlainArc const& arc, double degrees);
/// The same to the direction of a point; 0 for one that is equal to the start.
double lengthUpTo(PlainArc const& arc, Vec3 const& p);

/// The sweep in radians, in [0, 2 pi): 0 for a full circle.
double sweepOf(PlainArc const& arc);
/// The point of the circle that the start reaches when it is turned counter-clockwise.
Vec3 pointAfter(PlainArc const& arc, double radians);
/// Are the ends equal within the calculation tolerance?
bool isFullCircle(PlainArc const& arc);
double lengthOf(PlainArc const& arc);
Vec3 halvingPointOf(PlainArc const& arc);

/// Moves an end and its stored angle; the circle stays.
void moveStart(PlainArc& arc, Vec3 const& p);
void moveEnd(PlainArc& arc, Vec3 const& p);

}  // namespace gmkernel_detail
