// SPDX-License-Identifier: MIT
/// @file
/// From a chain of pieces to a contour.
///
/// Ends that are equal as points become a joint as they are; wider gaps, which chaining allows up
/// to three length tolerances, get a segment of their own, so that the contour stays a chain.
/// Linear in the pieces.
#include "kernel/contour/offset/ResultContour.h"

#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/values/HandedOver.h"

namespace gmkernel_detail {

namespace {

void append(GmContour& contour, std::unique_ptr<GmCurve> curve, int id, bool inserted) {
    auto record = std::make_unique<GmContElement>();
    record->pCurve = curve.get();
    record->lId = id;
    record->lIndex = contour.ElementCount();
    record->bInserted = inserted;
    if (!contour.AddElement(record.get(), false)) return;
    handedOver(curve);
    handedOver(record);
}

void bridgeGap(GmContour& contour, GmPoint const& to, int id) {
    if (contour.ElementCount() == 0) return;
    const GmPoint from = chainEnd(contour);
    if (from != to) append(contour, std::make_unique<GmStretch>(from, to), id, true);
}

}  // namespace

std::unique_ptr<GmContour> resultContour(std::vector<GmOffsetElement> chain) {
    auto contour = std::make_unique<GmContour>();
    for (GmOffsetElement& element : chain) {
        bridgeGap(*contour, element.curve().SP(), element.id());
        append(*contour, element.takeCurve(), element.id(), element.auxiliary());
    }
    return contour;
}

}  // namespace gmkernel_detail
