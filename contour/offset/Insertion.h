#pragma once

#include "contour/offset/PieceList.h"

namespace gmkernel_detail {

/// Appends a piece to the active list and cuts it and the pieces there at all their mutual
/// crossings. Cost: one box test for each active piece, one intersection for each near one.
void insertPiece(PieceList& active, GmOffsetElement element);

}  // namespace gmkernel_detail
