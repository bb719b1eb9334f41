// SPDX-License-Identifier: MIT
/// @file
/// What a caller gives to build an approach or departure move.
#ifndef GMKERNEL_GMAPPRDEPDATA_H
#define GMKERNEL_GMAPPRDEPDATA_H

#include "gmkernel/GmPoint.h"

class GmCurve;

/// Describes a move from a free point P onto a curve, or off a curve to P; GmContour builds it.
///
/// An approach ends in the curve's start point Q along its tangent T there. A departure is built as
/// an approach to the curve's end point Q against its tangent, T = -TangEP(), and then reversed.
/// N is the unit normal of the curve at Q on the chosen side.
struct GmApprDepData {
    /// P: where an approach starts, where a departure ends.
    GmPoint Point;

    /// The curve that is approached or left; not owned.
    GmCurve* pCurve = nullptr;

    /// 1: departure from the curve's end. Any other value: approach to the curve's start.
    int nEnd = 0;

    /// The kind of move; any other value builds nothing.
    /// - 0: straight from P to Q.
    /// - 1: perpendicular lead, from P over Q + dLength N to Q.
    /// - 2: tangential lead, from P over Q - dLength T to Q.
    /// - 3: tangential arc of radius dRadius over the angle dAngle, after a segment from P to the
    ///   start of the arc.
    /// - 4: the tangent from P to a circle of radius dRadius that touches the curve at Q, then the
    ///   arc to Q. The circle lies on the side of T where P is.
    /// - 5: kind 0 when P lies on the chosen side (the direction to P within 90 degrees of N), else
    ///   kind 4 with dAutoRadius.
    /// A segment of kinds 1 to 4 from P is left out where its end is P itself.
    int nType = 0;

    /// Length of the lead of kinds 1 and 2, in length units.
    double dLength = 0.0;

    /// Radius of the arc of kinds 3 and 4, in length units.
    double dRadius = 0.0;

    /// Opening angle of the arc of kind 3, in degrees. Known limit: 0 gives a full circle.
    double dAngle = 0.0;

    /// Radius of the arc that kind 5 may choose, in length units.
    double dAutoRadius = 0.0;

    /// The side of the curve on which the move lies, seen along the curve: 1 right, -1 left.
    /// Any other value chooses the left-hand normal of an approach or departure run towards Q. It
    /// also scales the angle of kind 3 and, except for 0, which counts as -1, the distance of the
    /// centre in kind 4: then the arc misses Q and is left out.
    int nSide = 0;
};

#endif  // GMKERNEL_GMAPPRDEPDATA_H
