// SPDX-License-Identifier: MIT
/// @file
/// The band of an element: all points within |d| of it, bounded by both offsets and two caps.
///
/// A cap is a half circle around an end. Where an arc's radius is not greater than |d|, the offset
/// towards its centre vanishes and the caps meet: each ends at the point in which the circles about
/// both ends of the arc cross. An arc wider by less than the length tolerance loses that offset
/// too, but keeps its full caps, which then end at most that tolerance apart.
#include "kernel/contour/offset/BandPieces.h"

#include <algorithm>
#include <cmath>
#include <memory>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

struct Cap {
    GmPoint from;
    GmPoint to;
    GmPoint centre;
};

/// From the other side around the back of the start to the offset side.
Cap startCap(GmCurve const& element, double d) {
    const GmPoint sp = element.SP();
    const GmVec toOffset = d * GmVec(element.TangSP().Normalized(GmBase::eRotCW));
    return {GmPoint(sp - toOffset), GmPoint(sp + toOffset), sp};
}

/// From the offset side around the front of the end to the other side.
Cap endCap(GmCurve const& element, double d) {
    const GmPoint ep = element.EP();
    const GmVec toOffset = d * GmVec(element.TangEP().Normalized(GmBase::eRotCW));
    return {GmPoint(ep + toOffset), GmPoint(ep - toOffset), ep};
}

/// Where the circles of radius |d| about both ends of the arc meet, on the side of the chord to
/// which the arc turns.
GmPoint meetingOfCaps(GmArc const& arc, double d) {
    const GmPoint sp = arc.SP();
    const GmVec chord = arc.EP() - sp;
    const double h = std::sqrt(std::max(0.0, d * d - chord.Norm() / 4.0));
    GmDir towards(sp, arc.EP());
    towards.Normalize(arc.Dir());
    return GmPoint(sp + chord / 2.0 + h * GmVec(towards));
}

/// Lets a cap of a tightly bent arc end where both caps meet.
void shortenCap(GmArc const& arc, double d, PieceRole role, Cap& cap) {
    if (!(arc.R() <= std::fabs(d))) return;
    const bool awayFromCentre =
        (d > 0.0 && arc.Dir() == GmBase::eRotCCW) || (d < 0.0 && arc.Dir() == GmBase::eRotCW);
    const bool beginsThere = awayFromCentre == (role == PieceRole::kStartCap);
    (beginsThere ? cap.from : cap.to) = meetingOfCaps(arc, d);
}

GmArc capOf(GmCurve const& element, double d, PieceRole role) {
    Cap cap = role == PieceRole::kStartCap ? startCap(element, d) : endCap(element, d);
    if (auto const* arc = curveAs<GmArc>(element)) shortenCap(*arc, d, role, cap);
    return GmArc(cap.from, cap.to, cap.centre, d > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW);
}

/// The offset of a stretch or an arc, on the other side reversed.
template <class Curve>
Curve offsetOf(Curve const& element, double d, PieceRole role) {
    if (role == PieceRole::kChosenSide) return Curve(element, d);
    Curve offset(element, -d);
    offset.Invert();
    return offset;
}

/// Calls visit(curve) with the curve that has a role in the band, unless it vanishes.
template <class Visit>
void visitBandCurve(GmCurve const& element, double d, PieceRole role, Visit const& visit) {
    if (role == PieceRole::kStartCap || role == PieceRole::kEndCap) {
        visit(capOf(element, d, role));
    } else if (auto const* stretch = curveAs<GmStretch>(element)) {
        const GmStretch offset = offsetOf(*stretch, d, role);
        if (offset.CreationOK()) visit(offset);
    } else if (auto const* arc = curveAs<GmArc>(element)) {
        const GmArc offset = offsetOf(*arc, d, role);
        if (offset.CreationOK()) visit(offset);
    }
}

/// Calls visit(role, curve) for the boundary of the band, in order.
template <class Visit>
void visitBand(GmCurve const& element, double d, Visit const& visit) {
    if (!isSegmentOrArc(element)) return;
    for (const PieceRole role : {PieceRole::kStartCap, PieceRole::kChosenSide, PieceRole::kEndCap,
                                 PieceRole::kOtherSide}) {
        visitBandCurve(element, d, role, [&](auto const& curve) { visit(role, curve); });
    }
}

}  // namespace

std::vector<GmOffsetElement> bandPieces(GmCurve const& element, int source, int id, double d) {
    std::vector<GmOffsetElement> pieces;
    visitBand(element, d, [&](PieceRole role, auto const& curve) {
        pieces.emplace_back(std::unique_ptr<GmCurve>(curve.Clone()), source, id, role);
    });
    return pieces;
}

void appendBandPieces(GmCurve const& element, int source, int id, double d,
                      std::vector<Piece>& pieces) {
    visitBand(element, d, [&](PieceRole role, auto const& curve) {
        pieces.emplace_back(plainOf(curve), source, id, role);
    });
}

GmOffsetElement elementOf(Piece const& piece, GmCurve const& element, double d) {
    std::unique_ptr<GmCurve> curve;
    visitBandCurve(element, d, piece.role(),
                   [&](auto const& offset) { curve.reset(offset.Clone()); });
    if (piece.startMoved()) curve->SetSP(pointOf(startOf(piece.curve())));
    if (piece.endMoved()) curve->SetEP(pointOf(endOf(piece.curve())));
    return {std::move(curve), piece.source(), piece.id(), piece.role()};
}

}  // namespace gmkernel_detail
