// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "gmkernel/GmContour.h"
#include "kernel/contour/offset/PieceList.h"

namespace gmkernel_detail {

/// The contour over a chain of pieces; gaps are bridged by segments that count as inserted.
std::unique_ptr<GmContour> resultContour(PieceList const& chain);

/// Is there a piece of the offset on the chosen side in the chain, and not only caps?
bool hasOffset(PieceList const& chain);

}  // namespace gmkernel_detail
