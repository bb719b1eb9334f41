// SPDX-License-Identifier: MIT
/// @file
/// How a curve's end and the next curve's start are brought together.
///
/// Trimming cuts both back to a crossing of the bounded curves. A bridge is a segment or an arc: an
/// arc leaves the curve tangentially when its centre lies on the normal there, and arrives
/// tangentially when it lies on the normal of the next curve too. So the normals are crossed, and
/// the arc is taken when that point is about equally far from both ends; else a segment has to do.
/// Constant cost.
#include "kernel/curves/Joining.h"

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

namespace {

/// The largest relative difference of the distances from the centre to the ends of a connecting
/// arc.
constexpr double kRadiusRatio = 0.05;

/// Can an arc about `centre` connect both points?
bool fitsRadius(GmPoint const& centre, GmPoint const& start, GmPoint const& end) {
    const double rStart = centre.Dist(start);
    const double rEnd = centre.Dist(end);
    const double ratio = rStart / rEnd;
    return 1.0 - kRadiusRatio < ratio && ratio < 1.0 + kRadiusRatio &&
           std::fabs(rStart - rEnd) < GmBase::m_scdPrec;
}

/// The centre of the tangential arc between two points with the given normals there; undefined when
/// none fits.
GmPoint connectingCentre(GmLine const& normalAtStart, GmPoint const& start,
                         GmLine const& normalAtEnd, GmPoint const& end) {
    if (normalAtStart == normalAtEnd) return GmPoint(start, end);
    if (normalAtStart.IntersectionWithLine(normalAtEnd) == 0) return GmPoint();
    const GmPoint centre = normalAtStart.GetSolution(0);
    return fitsRadius(centre, start, end) ? centre : GmPoint();
}

}  // namespace

GmPoint fartherSolution(GmCurve const& curve, GmPoint const& reference) {
    const GmPoint first = curve.GetSolution(0);
    if (curve.GetPtSol().size() < 2) return first;
    const GmPoint second = curve.GetSolution(1);
    return reference.Dist(first) < reference.Dist(second) ? second : first;
}

bool trimToCrossing(GmCurve& first, GmCurve* next) {
    if (next == nullptr) return false;
    if (first.EP() == next->SP()) return true;
    if (first.Intersection(next) <= 0) return false;
    joinAt(first, *next, fartherSolution(first, first.SP()));
    return true;
}

void joinAt(GmCurve& first, GmCurve const& next, GmPoint const& p) {
    first.SetEP(p);
    // The interface passes the next curve as constant and moves its start all the same.
    const_cast<GmCurve&>(next).SetSP(first.EP());
}

GmCurve* connectingCurve(GmCurve const& from, GmLine const& normalAtEnd, GmCurve const& next,
                         GmLine const& normalAtNext, int mode) {
    const GmPoint start = from.EP();
    const GmPoint end = next.SP();
    if (mode == 0) return new GmStretch(start, end);
    if (mode != 1 || !normalAtEnd.CreationOK() || !normalAtNext.CreationOK()) return nullptr;

    const GmPoint centre = connectingCentre(normalAtEnd, start, normalAtNext, end);
    if (!centre.CreationOK()) return new GmStretch(start, end);

    const GmBase::eRotDir rot = GmVec(centre, start).Angle().Rotation(from.TangEP().Angle());
    return new GmArc(GmCircle(centre, centre.Dist(start), false), start, end, rot);
}

}  // namespace gmkernel_detail
