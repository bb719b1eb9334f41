// SPDX-License-Identifier: MIT
/// @file
/// Offsetting element by element, with neighbours trimmed to each other and nothing else cut.
///
/// Parallels of neighbours that cross do so at the corner of the parallel chain, so each is cut
/// back to that point. It fails where neighbours do not cross: at corners that open away from the
/// offset. It does not notice parts that run backwards or come nearer to the source than the
/// distance, and it does not trim the last element to the first. Linear in the elements.
#include <cmath>
#include <memory>
#include <vector>

#include "gmkernel/GmContElement.h"
#include "gmkernel/GmContour.h"
#include "kernel/contour/GmContourArray.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

struct OffsetCurve {
    std::unique_ptr<GmCurve> curve;
    long id;
};
using OffsetCurves = std::vector<OffsetCurve>;

/// The offsets of all segments and arcs that do not vanish.
OffsetCurves offsetElements(GmContour const& contour, double d) {
    OffsetCurves offsets;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmContElement const& record = *contour.GetContElement(i);
        if (!gmkernel_detail::isSegmentOrArc(*record.pCurve)) continue;
        std::unique_ptr<GmCurve> offset(record.pCurve->GetParallel(d));
        if (offset->CreationOK()) offsets.push_back({std::move(offset), record.lId});
    }
    return offsets;
}

/// Trims neighbours that do not meet; false when some do not cross.
bool trimNeighbours(OffsetCurves& offsets) {
    bool success = true;
    for (std::size_t i = 1; i < offsets.size(); ++i) {
        GmCurve& first = *offsets[i - 1].curve;
        GmCurve& second = *offsets[i].curve;
        if (second.SP() != first.EP() && !first.Trim(&second)) success = false;
    }
    return success;
}

}  // namespace

int GmContour::SimpleOffsetting(double d) {
    if (std::fabs(d) < m_scdPrec) {
        CopyContourToSubContour();
        return m_pSubConts->GetCount();
    }
    OffsetCurves offsets = offsetElements(*this, d);
    const bool success = std::isfinite(d) && trimNeighbours(offsets);
    RemoveAllSubConts();
    if (!success) return 0;

    auto result = std::make_unique<GmContour>();
    for (OffsetCurve const& offset : offsets) {
        result->AddElement(*offset.curve, false, offset.id);
    }
    m_pSubConts->Take(std::move(result));
    return 1;
}
