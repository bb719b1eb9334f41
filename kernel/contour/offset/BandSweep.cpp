// SPDX-License-Identifier: MIT
/// @file
/// The sweep along the source that makes, cuts and sorts out the pieces of all bands.
///
/// Each element's pieces are cut with all active ones, so that any two pieces which are active
/// together are cut by each other once. Then those too near to an element of the span are removed.
/// A piece whose element leaves the span is no longer cut nor tested: with a span shorter than the
/// contour, results are right only where the contour keeps away from what left the span.
#include "kernel/contour/offset/BandSweep.h"

#include "kernel/contour/offset/BandPieces.h"
#include "kernel/contour/offset/OwnBand.h"

namespace gmkernel_detail {

BandSweep::BandSweep(double d, int span)
    : m_d(d), m_spanSize(span), m_span(d), m_insertion(m_active), m_removal(m_active, m_span, d) {}

void BandSweep::add(GmContElement const& record) {
    ++m_index;
    const bool spanGrew = advanceSpan(*record.pCurve);
    m_band.clear();
    appendBandPieces(*record.pCurve, m_index, static_cast<int>(record.lId), m_d, m_band);
    const bool cutsOwnBand = cutsItself(*record.pCurve, m_d);
    for (Piece const& piece : m_band)
        m_insertion.insert(piece, cutsOwnBand);
    m_removal.removeNearPieces(spanGrew);
    retire();
}

/// Appends an element to the span, if it joins, and lets the oldest one leave. Answers whether the
/// last element is new.
bool BandSweep::advanceSpan(GmCurve const& element) {
    const bool appended = m_span.append(element);
    if (m_index >= m_spanSize && !m_span.isEmpty()) m_span.dropOldest();
    return appended && !m_span.isEmpty();
}

/// Retires the pieces of elements that are leaving the span.
void BandSweep::retire() {
    const long long oldestKept = static_cast<long long>(m_index) - m_spanSize + 1;
    if (oldestKept >= 0) m_active.retire(oldestKept);
}

std::vector<Piece const*> BandSweep::finish() {
    m_active.retireAll();
    PieceRows const& pieces = m_active.pieces();
    std::vector<Piece const*> kept;
    kept.reserve(m_active.retired().size);
    PiecePlace place = m_active.retired().first;
    for (; place != kNoPiece; place = pieces.after(place)) {
        if (isKept(pieces[place].role())) kept.push_back(&pieces[place]);
    }
    return kept;
}

}  // namespace gmkernel_detail
