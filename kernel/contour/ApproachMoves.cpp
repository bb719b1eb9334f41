// SPDX-License-Identifier: MIT
/// @file
/// Contours that lead onto a curve and off it.
///
/// Every kind of move is built once, from the free point to the curve: a departure is the approach
/// to the curve's end against its tangent, and is reversed at last. Leads go over one auxiliary
/// point; the arcs touch the curve because their centre lies on its normal. Nothing is tested
/// against the rest of the curve: a move may cross it. Constant cost.
#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmApprDepData.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "kernel/values/Constants.h"

namespace {

enum Kind { kStraight = 0, kPerpendicular, kTangential, kArcOfAngle, kArcFromTangent, kAutomatic };

/// The curve's end that the move leads to, seen in the sense in which the move is built: from the
/// free point to the curve. A departure is built backwards.
struct Target {
    GmPoint q;
    GmDir tangent;
    int side;
    GmDir normal;
};

Target targetOf(GmApprDepData const& data) {
    const bool departs = data.nEnd == 1;
    Target target;
    target.q = departs ? data.pCurve->EP() : data.pCurve->SP();
    target.tangent = departs ? data.pCurve->TangEP().Inverted() : data.pCurve->TangSP();
    target.side = departs ? -data.nSide : data.nSide;
    target.normal = target.tangent.Normalized(target.side == 1 ? GmBase::eRotCW : GmBase::eRotCCW);
    return target;
}

void append(GmContour& move, GmCurve const& element) {
    move.AddElement(element, false, 0);
}

void appendSegment(GmContour& move, GmPoint const& from, GmPoint const& to) {
    if (!(from == to)) append(move, GmStretch(from, to));
}

/// From P over the auxiliary point `m` to the curve.
void buildLead(GmContour& move, GmPoint const& p, GmPoint const& m, Target const& target) {
    appendSegment(move, p, m);
    append(move, GmStretch(m, target.q));
}

void buildArcOfAngle(GmContour& move, GmApprDepData const& data, Target const& target) {
    const GmPoint centre(target.q + data.dRadius * GmVec(target.normal));
    const double turn = data.dAngle * target.side * gmkernel_detail::kPi / 180.0;
    const GmPoint m(centre + (target.q - centre).Rotated(GmAngle(turn, true)));
    appendSegment(move, data.Point, m);
    const GmCircle circle(centre, data.dRadius, true);
    append(move, GmArc(circle, m, target.q, target.side == 1 ? GmBase::eRotCW : GmBase::eRotCCW));
}

void buildArcFromTangent(GmContour& move, GmPoint const& p, double radius, Target const& target) {
    const double side = target.side == 0 ? -1.0 : target.side;
    const GmVec toP = p - target.q;
    const bool onRight = target.tangent.Angle(GmDir(toP)) < GmAngle(0.0, false);
    const GmVec toCentre = radius * side * GmVec(target.normal);
    const GmPoint centre(onRight ? target.q + toCentre : target.q - toCentre);
    const GmCircle circle(centre, radius, true);
    const GmLine tangent(p, circle, onRight);
    if (!tangent.CreationOK()) return;
    const GmPoint m = tangent.SP();
    appendSegment(move, p, m);
    if (m == target.q) return;
    append(move, GmArc(circle, m, target.q, onRight ? GmBase::eRotCW : GmBase::eRotCCW));
}

bool liesOnChosenSide(GmPoint const& p, Target const& target) {
    return std::fabs(GmDir(target.q, p).DAngle(target.normal)) <= 90.0;
}

void buildMove(GmContour& move, GmApprDepData const& data, Target const& target) {
    const GmPoint& p = data.Point;
    switch (data.nType) {
        case kStraight:
            append(move, GmStretch(p, target.q));
            break;
        case kPerpendicular:
            buildLead(move, p, GmPoint(target.q + data.dLength * GmVec(target.normal)), target);
            break;
        case kTangential:
            buildLead(move, p, GmPoint(target.q - data.dLength * GmVec(target.tangent)), target);
            break;
        case kArcOfAngle:
            buildArcOfAngle(move, data, target);
            break;
        case kArcFromTangent:
            buildArcFromTangent(move, p, data.dRadius, target);
            break;
        case kAutomatic:
            if (liesOnChosenSide(p, target))
                append(move, GmStretch(p, target.q));
            else
                buildArcFromTangent(move, p, data.dAutoRadius, target);
            break;
        default:
            break;
    }
}

}  // namespace

GmContour::GmContour(GmApprDepData const& data) : GmContour() {
    m_bCreationOK = false;
    if (!data.pCurve) return;
    const Target target = targetOf(data);
    if (!data.Point.CreationOK() || !target.q.CreationOK()) return;
    if (data.Point == target.q) {
        m_bCreationOK = true;
        return;
    }
    buildMove(*this, data, target);
    if (data.nEnd == 1) Invert();
    m_bCreationOK = ElementCount() > 0;
}
