// SPDX-License-Identifier: MIT
/// @file
/// The sweep along the source that makes, cuts and sorts out the pieces of all bands.
///
/// Each element's pieces are cut with all active ones, so that any two pieces which are active
/// together are cut by each other once. Then those too near to an element of the span are removed.
/// A piece whose element leaves the span is no longer cut nor tested: with a span shorter than the
/// contour, results are right only where the contour keeps away from what left the span.
#include "kernel/contour/offset/BandSweep.h"

#include <cmath>
#include <limits>

#include "kernel/contour/offset/BandPieces.h"
#include "kernel/contour/offset/Insertion.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// The box of the points that may be nearer to a source element than |d|; everywhere for elements
/// that are neither segments nor arcs.
CurveBox nearbyOf(GmCurve const& element, double d) {
    constexpr double kEverywhere = std::numeric_limits<double>::max();
    if (!isSegmentOrArc(element)) return {-kEverywhere, kEverywhere, -kEverywhere, kEverywhere};
    return reachOf(element).grown(std::fabs(d));
}

}  // namespace

void BandSweep::add(GmContElement const& record) {
    ++m_index;
    advanceSpan(*record.pCurve);
    for (GmOffsetElement& piece :
         bandPieces(*record.pCurve, m_index, static_cast<int>(record.lId), m_d)) {
        insertPiece(m_active, std::move(piece));
    }
    removeNearPieces(m_active, m_span, m_d);
    retire();
}

/// Appends an element to the span, if it joins, and lets the oldest one leave.
void BandSweep::advanceSpan(GmCurve const& element) {
    const bool appended = m_span.elements.AddElement(&element, false, 0);
    if (appended) {
        m_span.nearby.append(nearbyOf(element, m_d));
        m_span.quick.emplace_back(element);
    }
    if (m_index >= m_spanSize && !m_span.isEmpty()) {
        m_span.elements.RemoveElement(0);
        ++m_span.oldest;
    }
    m_span.grew = appended && !m_span.isEmpty();
}

/// Moves the pieces of elements that are leaving the span to the finished ones.
void BandSweep::retire() {
    const long long oldestKept = static_cast<long long>(m_index) - m_spanSize + 1;
    if (oldestKept >= 0) m_active.retire(oldestKept, m_finished);
}

PieceList BandSweep::finish() {
    m_active.retireAll(m_finished);
    m_finished.remove_if([](Piece const& piece) { return !piece.element.kept(); });
    return std::move(m_finished);
}

}  // namespace gmkernel_detail
