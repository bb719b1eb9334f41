#include "contour/offset/BandSweep.h"

#include "contour/offset/BandPieces.h"
#include "contour/offset/Insertion.h"
#include "contour/offset/Removal.h"

namespace gmkernel_detail {

void BandSweep::add(GmContElement const& record) {
    ++m_index;
    const bool spanGrew = advanceSpan(*record.pCurve);
    for (GmOffsetElement& piece :
         bandPieces(*record.pCurve, m_index, static_cast<int>(record.lId), m_d)) {
        insertPiece(m_active, std::move(piece));
    }
    removeNearPieces(m_active, m_span, spanGrew, m_d);
    retire();
}

/// Appends an element to the span and lets the oldest one leave; true when the span ends with the
/// new element (one that does not join the span is not taken up).
bool BandSweep::advanceSpan(GmCurve const& element) {
    const bool appended = m_span.AddElement(&element, false, 0);
    if (m_index >= m_spanSize) m_span.RemoveElement(0);
    return appended && m_span.ElementCount() > 0;
}

/// Moves the pieces of elements that are leaving the span to the finished ones.
void BandSweep::retire() {
    const long long oldestKept = static_cast<long long>(m_index) - m_spanSize + 1;
    for (auto piece = m_active.begin(); piece != m_active.end();) {
        const auto current = piece++;
        if (current->element.source() > oldestKept) continue;
        m_finished.splice(m_finished.end(), m_active, current);
    }
}

PieceList BandSweep::finish() {
    m_finished.splice(m_finished.end(), m_active);
    m_finished.remove_if([](Piece const& piece) { return !piece.element.kept(); });
    return std::move(m_finished);
}

}  // namespace gmkernel_detail
