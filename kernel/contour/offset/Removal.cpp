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
#include <vector>

#include "kernel/curves/dispatch/Distance.h"

namespace gmkernel_detail {

namespace {

/// Is the halving point of a piece nearer than `threshold` to an element of the span, from the one
/// with the number `first` on? Which of them it is does not matter, so boxes may choose the order.
bool isNear(Piece& piece, SourceSpan const& span, std::size_t first, double threshold) {
    const PlanePoint p = piece.quickHalving();
    const double z = piece.height;
    return span.nearby.visitUntil({p.x, p.x, p.y, p.y}, first, [&](std::size_t number) {
        QuickDistance const& quick = span.quick[number];
        if (quick.z() == z) {
            if (const auto nearer = quick.isNearer(p, threshold)) return *nearer;
        }
        const int index = static_cast<int>(number - span.oldest);
        return Distance(piece.halving(), *span.elements.GetElement(index)) < threshold;
    });
}

void removeFromRun(ActivePieces& active, std::size_t index, SourceSpan const& span,
                   double threshold) {
    PieceRun& run = active.run(index);
    const std::size_t before = run.pieces.size();
    const std::size_t newest = span.nearby.size() - (span.grew ? 1 : 0);
    run.pieces.remove_if([&](Piece& piece) {
        const std::size_t first = piece.clearOfSpan ? newest : span.oldest;
        if (isNear(piece, span, first, threshold)) return true;
        piece.clearOfSpan = true;
        return false;
    });
    run.settled = true;
    if (run.pieces.size() < before) active.shrink(index);
}

}  // namespace

void removeNearPieces(ActivePieces& active, SourceSpan const& span, double d) {
    const double threshold = std::fabs(std::fabs(d) - GmBase::m_scdPrecCalc);
    const std::vector<std::size_t> unsettled = active.takeUnsettled();
    if (span.grew && !span.isEmpty()) {
        active.visitReached(span.newestNearby(), [&](std::size_t index) {
            if (active.run(index).settled) removeFromRun(active, index, span, threshold);
        });
    }
    for (const std::size_t index : unsettled)
        removeFromRun(active, index, span, threshold);
}

}  // namespace gmkernel_detail
