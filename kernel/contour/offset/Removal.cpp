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

/// Is a point nearer to one of the last `count` elements of the span than `threshold`? The newest
/// elements, which are the most likely ones, come first.
bool isNear(GmPoint const& p, SourceSpan const& span, int count, double threshold) {
    const CurveBox place = boxOf(p);
    const int size = static_cast<int>(span.nearby.size());
    for (int i = size - 1; i >= size - count; --i) {
        if (!place.overlaps(span.nearby[static_cast<std::size_t>(i)])) continue;
        if (Distance(p, *span.elements.GetElement(i)) < threshold) return true;
    }
    return false;
}

void removeFromRun(PieceRun& run, SourceSpan const& span, int newest, double threshold) {
    const int all = static_cast<int>(span.nearby.size());
    for (auto piece = run.pieces.begin(); piece != run.pieces.end();) {
        const int count = piece->clearOfSpan ? newest : all;
        if (isNear(piece->halving, span, count, threshold)) {
            piece = run.pieces.erase(piece);
        } else {
            piece->clearOfSpan = true;
            ++piece;
        }
    }
    run.settled = true;
}

}  // namespace

void removeNearPieces(ActivePieces& active, SourceSpan const& span, double d) {
    const double threshold = std::fabs(std::fabs(d) - GmBase::m_scdPrecCalc);
    const int newest = span.grew && !span.nearby.empty() ? 1 : 0;
    for (PieceRun& run : active.runs()) {
        const bool reached = newest > 0 && span.nearby.back().overlaps(run.reach);
        if (!run.settled || reached) removeFromRun(run, span, newest, threshold);
    }
}

}  // namespace gmkernel_detail
