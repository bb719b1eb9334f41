// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

/// A segment in plain numbers: what GmStretch holds and answers, without the object.
struct PlainSegment {
    Vec3 sp;
    Vec3 ep;
    Vec3 dir;  ///< unit direction; it may be older than the ends when these are equal as points
};

/// The foot of a point on the supporting line.
Vec3 footOn(PlainSegment const& segment, Vec3 const& p);

/// Does a point `q` of the supporting line lie on the segment? Decided by the parameter along the
/// dominant axis of the direction, in 0..1; the ends count within the length tolerance.
bool isBetweenEnds(PlainSegment const& segment, Vec3 const& q);

/// Does a point lie on the segment, its foot between the ends and nearer than `eps`?
bool isOn(PlainSegment const& segment, Vec3 const& p, double eps);

/// The distance from the nearest point: the foot where it lies on the segment, else an end.
double distanceTo(PlainSegment const& segment, Vec3 const& p);

/// Moves an end; the direction follows unless the ends are now equal as points.
void moveStart(PlainSegment& segment, Vec3 const& p);
void moveEnd(PlainSegment& segment, Vec3 const& p);

}  // namespace gmkernel_detail
