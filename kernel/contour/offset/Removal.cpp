// SPDX-License-Identifier: MIT
/// @file
/// Removing the pieces that come too near to the source.
///
/// Pieces end at every crossing with the boundary of a band, so that a piece is wholly inside a
/// band or wholly not, and one point of it, the halving point, decides for all. Caps and offsets of
/// neighbours touch at exactly the distance; the calculation tolerance keeps rounding from removing
/// them. A crossing next to the end of a piece does not cut it: then the point may stand for a
/// piece of both kinds.
#include "kernel/contour/offset/Removal.h"

#include <cmath>

#include "kernel/curves/dispatch/Distance.h"

namespace gmkernel_detail {

namespace {

/// Is the halving point of a piece nearer than `threshold` to an element?
bool isNearTo(Piece& piece, SourceSpan const& span, std::size_t number, double threshold) {
    QuickDistance const& quick = span.quick(number);
    if (quick.z() == piece.height()) {
        if (const auto nearer = quick.isNearer(piece.quickHalving(), threshold)) return *nearer;
    }
    return Distance(pointOf(piece.halving()), span.element(number)) < threshold;
}

}  // namespace

Removal::Removal(ActivePieces& active, SourceSpan const& span, double d)
    : m_active(active),
      m_span(span),
      m_threshold(std::fabs(std::fabs(d) - GmBase::m_scdPrecCalc)) {}

void Removal::removeNearPieces(bool spanGrew) {
    m_untested = m_span.end() - (spanGrew ? 1 : 0);
    if (spanGrew) {
        m_active.visitReached(m_span.nearby()[m_untested], [&](std::size_t index) {
            if (m_active.run(index).settled) removeFromRun(index);
        });
    }
    for (const std::size_t index : m_active.unsettled())
        removeFromRun(index);
    m_active.settle();
}

void Removal::removeFromRun(std::size_t index) {
    PieceRows& pieces = m_active.pieces();
    PieceRow& row = m_active.run(index).row;
    const std::size_t before = row.size;
    for (PiecePlace place = row.first; place != kNoPiece;) {
        const PiecePlace next = pieces.after(place);
        Piece& piece = pieces[place];
        piece.clearOfSpan = !isNear(piece);
        if (!piece.clearOfSpan) pieces.remove(row, place);
        place = next;
    }
    if (row.size < before) m_active.shrink(index);
}

/// Is a piece nearer than the threshold to an element that it was not tested against? Which of them
/// it is does not matter, so boxes may choose the order.
bool Removal::isNear(Piece& piece) const {
    if (piece.clearOfSpan && !hasUntested()) return false;
    QuickPoint const& halving = piece.quickHalving();
    const CurveBox at = boxOf(halving.p).grown(halving.error);
    const auto isNearToNumber = [&](std::size_t number) {
        return isNearTo(piece, m_span, number, m_threshold);
    };
    if (piece.clearOfSpan) {
        return at.overlaps(m_span.nearby()[m_untested]) && isNearToNumber(m_untested);
    }
    return m_span.nearby().visitUntil(at, m_span.oldest(), isNearToNumber);
}

}  // namespace gmkernel_detail
