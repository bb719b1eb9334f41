// SPDX-License-Identifier: MIT
/// @file
/// Moves onto a cut and off it, as long as the room allows.
///
/// The kernel builds the move, on the waste side, to a segment that stands for the end of the cut.
/// A lead that comes too near to a contour is halved, a few times; it is not turned, nor is another
/// start of the cut sought.

#include "machining/leads/Leads.h"

#include "gmbridge/Curves.h"
#include "gmkernel/GmApprDepData.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"

namespace gmmachining {

using gmbridge::kernelPoint;
using gmbridge::planePoint;
using gmpart::Path;
using gmregion::Element;
using gmregion::Vec2;

namespace {

constexpr int kHalvings = 6;

int kernelKind(LeadKind kind) {
    constexpr int kPerpendicularMove = 1;
    constexpr int kTangentialMove = 2;
    constexpr int kArcMove = 3;
    switch (kind) {
        case LeadKind::kPerpendicular:
            return kPerpendicularMove;
        case LeadKind::kArc:
            return kArcMove;
        default:
            return kTangentialMove;
    }
}

/// A segment that starts or ends like the cut. It stands for the element there, which can be too
/// short for the kernel.
GmStretch tangentSegment(const Path& cut, LeadEnd end) {
    if (end == LeadEnd::kApproach) {
        const Element& first = cut.elements.front();
        return {kernelPoint(first.sp), kernelPoint(first.sp + tangentStart(first))};
    }
    const Element& last = cut.elements.back();
    return {kernelPoint(last.ep - tangentEnd(last)), kernelPoint(last.ep)};
}

GmApprDepData moveData(GmCurve* curve, LeadEnd end, const LeadShape& shape, PartSide part) {
    GmApprDepData data;
    data.pCurve = curve;
    data.nEnd = end == LeadEnd::kDeparture ? 1 : 0;
    data.nType = kernelKind(shape.kind);
    data.dLength = shape.length;
    data.dRadius = shape.radius;
    data.dAngle = shape.angle;
    data.nSide = part == PartSide::kRight ? -1 : 1;
    return data;
}

/// The element of the move that touches the cut, run in the tool's direction.
const GmCurve* leadOf(const GmContour& move, LeadEnd end) {
    const long last = move.ElementCount() - 1;
    return move.GetElement(end == LeadEnd::kApproach ? static_cast<int>(last) : 0);
}

Element elementFrom(const GmCurve& curve) {
    const Vec2 sp = planePoint(curve.SP());
    const Vec2 ep = planePoint(curve.EP());
    if (!curve.IsArc()) return {sp, ep};
    return arcThrough(sp, planePoint(static_cast<const GmArc&>(curve).HP()), ep);
}

Element joined(const Element& lead, const Path& cut, LeadEnd end) {
    if (end == LeadEnd::kApproach) return withEnds(lead, lead.sp, cut.elements.front().sp);
    return withEnds(lead, cut.elements.back().ep, lead.ep);
}

/// The lead alone, without a move from elsewhere to its far end: the move is built once from a
/// point beside the cut to learn where the far end lies, then from that end.
Path leadPath(const Path& cut, LeadEnd end, const LeadShape& shape, PartSide part) {
    GmStretch tangent = tangentSegment(cut, end);
    if (!tangent.CreationOK()) return {};
    GmApprDepData data = moveData(&tangent, end, shape, part);
    data.Point = end == LeadEnd::kApproach ? tangent.EP() : tangent.SP();
    const GmContour probe(data);
    if (!probe.CreationOK()) return {};
    const GmCurve* lead = leadOf(probe, end);
    data.Point = end == LeadEnd::kApproach ? lead->SP() : lead->EP();
    const GmContour move(data);
    if (!move.CreationOK() || move.ElementCount() != 1) return {};
    return {{joined(elementFrom(*move.GetElement(0)), cut, end)}, false, cut.layer};
}

LeadShape halved(LeadShape shape) {
    shape.length *= 0.5;
    shape.radius *= 0.5;
    return shape;
}

}  // namespace

Lead clearLead(const Path& cut, LeadEnd end, const LeadShape& shape, PartSide part,
               const Obstacles& obstacles, double clearance) {
    if (shape.kind == LeadKind::kNone) return {};
    LeadShape tried = shape;
    for (int halving = 0; halving <= kHalvings; ++halving) {
        const Path path = leadPath(cut, end, tried, part);
        if (path.elements.empty()) return {{}, 0.0, false, halving == 0};
        if (obstacles.keepClear(path, clearance)) {
            const double size = shape.kind == LeadKind::kArc ? tried.radius : tried.length;
            return {path, size, halving > 0};
        }
        tried = halved(tried);
    }
    return {};
}

}  // namespace gmmachining
