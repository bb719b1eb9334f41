#include "contour/offset/Removal.h"

#include <cmath>

#include "curves/dispatch/Distance.h"

namespace gmkernel_detail {

namespace {

/// Is a point nearer to one of the last `count` elements of the span than `threshold`? The newest
/// elements, which are the most likely ones, come first.
bool isNear(GmPoint const& p, GmContour const& span, int count, double threshold) {
    const int size = static_cast<int>(span.ElementCount());
    for (int i = size - 1; i >= size - count; --i) {
        if (Distance(p, *span.GetElement(i)) < threshold) return true;
    }
    return false;
}

}  // namespace

void removeNearPieces(PieceList& active, GmContour const& span, bool spanGrew, double d) {
    const double threshold = std::fabs(std::fabs(d) - GmBase::m_scdPrecCalc);
    const int all = static_cast<int>(span.ElementCount());
    const int newest = spanGrew && all > 0 ? 1 : 0;
    for (auto piece = active.begin(); piece != active.end();) {
        const int count = piece->keepsDistance ? newest : all;
        if (isNear(piece->halving, span, count, threshold)) {
            piece = active.erase(piece);
        } else {
            piece->keepsDistance = true;
            ++piece;
        }
    }
}

}  // namespace gmkernel_detail
