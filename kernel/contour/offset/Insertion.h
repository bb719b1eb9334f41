// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/contour/offset/ActivePieces.h"

namespace gmkernel_detail {

/// Appends a piece to the active list and cuts it and the pieces there at all their mutual
/// crossings. Cost: the logarithm of the number of active pieces, one box test for each piece of a
/// near run, one intersection for each near piece.
void insertPiece(ActivePieces& active, GmOffsetElement element);

}  // namespace gmkernel_detail
