// SPDX-License-Identifier: MIT
/// @file
/// Offsetting a contour at a constant distance.
///
/// A band construction: the points at distance |d| from the contour are bounded by the boundaries
/// of the elements' bands. All band pieces are cut at their mutual crossings, so that each
/// remaining piece lies wholly at the distance or wholly too near, and its halving point decides.
/// What keeps its distance on the chosen side is chained into the results.
///
/// The bands of single elements are exact, but caps touch the offsets of their neighbours, so the
/// distance test must not be strict: it leaves the calculation tolerance. Cost: a
/// logarithm for each element, and the pieces near it; quadratic where everything lies near
/// everything.
#include <cmath>
#include <memory>
#include <vector>

#include "gmkernel/GmContour.h"
#include "kernel/contour/GmContourArray.h"
#include "kernel/contour/offset/BandPieces.h"
#include "kernel/contour/offset/BandSweep.h"
#include "kernel/contour/offset/Chaining.h"
#include "kernel/contour/offset/ResultContour.h"

namespace {

using namespace gmkernel_detail;

/// The span that lets every element cut and test every piece.
constexpr int kWholeContour = 1000000;

/// The curves of a chain of pieces.
std::vector<GmOffsetElement> elementsOf(Chaining::Chain const& chain, GmContour const& source,
                                        double d) {
    std::vector<GmOffsetElement> elements;
    elements.reserve(chain.size());
    for (Piece const* piece : chain)
        elements.push_back(elementOf(*piece, *source.GetElement(piece->source()), d));
    return elements;
}

bool goesInside(GmBase::eRotDir sense, double d) {
    return (sense == GmBase::eRotCW && d > 0.0) || (sense == GmBase::eRotCCW && d < 0.0);
}

}  // namespace

int GmContour::Offsetting(double d, int nSpan, bool bKeepOpen) {
    if (std::fabs(d) < m_scdPrec) {
        CopyContourToSubContour();
        return m_pSubConts->GetCount();
    }
    if (!std::isfinite(d)) {
        RemoveAllSubConts();
        return 0;
    }
    const bool insideOnly = IsClosed() && !bKeepOpen && goesInside(Dir(GmPoint(0.0, 0.0, 0.0)), d);

    BandSweep sweep(d, insideOnly ? kWholeContour : nSpan);
    for (int i = 0; i < ElementCount(); ++i) {
        sweep.add(*GetContElement(i));
    }
    Chaining chaining(sweep.finish());

    RemoveAllSubConts();
    while (!chaining.done()) {
        const Chaining::Chain chain = chaining.takeChain();
        if (!hasOffset(chain)) continue;
        std::unique_ptr<GmContour> result = resultContour(elementsOf(chain, *this, d));
        if (insideOnly && !result->IsClosed()) continue;
        m_pSubConts->Take(std::move(result));
    }
    return m_pSubConts->GetCount();
}

int GmContour::ParallelContours(double d, bool /*unused*/, bool /*unused*/, bool /*unused*/) {
    return Offsetting(d, kWholeContour, false);
}
