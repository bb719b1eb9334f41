#pragma once

#include "contour/offset/PieceList.h"
#include "gmkernel/GmContour.h"

namespace gmkernel_detail {

/// Removes every piece whose halving point lies nearer to an element of the span than |d| less the
/// calculation tolerance.
///
/// A piece that passed before and was not split since is tested against the newest element alone:
/// the others can only have left the span.
/// @param active the pieces
/// @param span the most recent source elements
/// @param spanGrew whether the last element of the span is new since the previous call
/// @param d the offset distance
void removeNearPieces(PieceList& active, GmContour const& span, bool spanGrew, double d);

}  // namespace gmkernel_detail
