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

/// Lets the caps of a tightly bent arc end where they meet.
void shortenCaps(GmArc const& arc, double d, Cap& start, Cap& end) {
    if (!(arc.R() <= std::fabs(d))) return;
    const GmPoint meeting = meetingOfCaps(arc, d);
    const bool awayFromCentre =
        (d > 0.0 && arc.Dir() == GmBase::eRotCCW) || (d < 0.0 && arc.Dir() == GmBase::eRotCW);
    if (awayFromCentre) {
        start.from = meeting;
        end.to = meeting;
    } else {
        start.to = meeting;
        end.from = meeting;
    }
}

/// The offset of a stretch or an arc, null when it vanishes.
std::unique_ptr<GmCurve> offsetOf(GmCurve const& element, double d) {
    std::unique_ptr<GmCurve> offset(element.GetParallel(d));
    if (!offset->CreationOK()) offset.reset();
    return offset;
}

}  // namespace

std::vector<GmOffsetElement> bandPieces(GmCurve const& element, int source, int id, double d) {
    std::vector<GmOffsetElement> pieces;
    if (!isSegmentOrArc(element)) return pieces;

    const auto add = [&](PieceRole role, std::unique_ptr<GmCurve> curve) {
        pieces.emplace_back(std::move(curve), source, id, role);
    };
    const GmBase::eRotDir rot = d > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    const auto arcOf = [rot](Cap const& cap) {
        return std::make_unique<GmArc>(cap.from, cap.to, cap.centre, rot);
    };
    Cap start = startCap(element, d);
    Cap end = endCap(element, d);
    if (auto const* arc = curveAs<GmArc>(element)) shortenCaps(*arc, d, start, end);

    add(PieceRole::kStartCap, arcOf(start));
    if (auto offset = offsetOf(element, d)) add(PieceRole::kChosenSide, std::move(offset));
    add(PieceRole::kEndCap, arcOf(end));
    if (auto other = offsetOf(element, -d)) {
        other->Invert();
        add(PieceRole::kOtherSide, std::move(other));
    }
    return pieces;
}

}  // namespace gmkernel_detail
