// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmkernel/GmContour.h"
#include "kernel/contour/offset/ActivePieces.h"

namespace gmkernel_detail {

/// The most recent source elements, and for each the box of the points that may be nearer to it
/// than the distance.
struct SourceSpan {
    GmContour elements;
    BoxLevels nearby;
    std::vector<QuickDistance> quick;  ///< numbered like the boxes
    std::size_t oldest = 0;            ///< the box of the first element; those before have left
    /// The last element is new since the last removal.
    bool grew = false;

    bool isEmpty() const { return oldest == nearby.size(); }
    CurveBox const& newestNearby() const { return nearby[nearby.size() - 1]; }
};

/// Removes every piece whose halving point lies nearer to an element of the span than |d| less the
/// calculation tolerance.
///
/// A piece that passed before and was not split since is tested against the newest element alone:
/// the others can only have left the span. Elements out of whose boxes the point lies, and runs of
/// such pieces that the newest element's box does not reach, are passed over.
/// @param active the pieces
/// @param span the most recent source elements
/// @param d the offset distance
void removeNearPieces(ActivePieces& active, SourceSpan const& span, double d);

}  // namespace gmkernel_detail
