// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/contour/offset/PieceList.h"

namespace gmkernel_detail {

/// Takes the pieces of one result out of the list and returns them in order, end to start.
///
/// The chain begins with the smallest identifier, grows backwards through pieces of that identifier
/// in one walk, then forwards through any piece that starts within three length tolerances of its
/// end. Pieces shorter than 0.001 leave it at last, so that the chain may be empty.
/// @param pieces not empty
PieceList takeChain(PieceList& pieces);

}  // namespace gmkernel_detail
