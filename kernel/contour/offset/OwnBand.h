// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/contour/offset/Piece.h"

namespace gmkernel_detail {

/// May pieces of an element's own band cut each other? False for segments of common sizes.
/// @param element the source element
/// @param d the offset distance, of either sign
bool cutsItself(GmCurve const& element, double d);

/// Are two pieces of one band, of an element that does not cut itself, without a point that counts?
/// @param added the later one in the order of the band
/// @param old the earlier one
bool onlyTouch(Piece const& added, Piece const& old);

}  // namespace gmkernel_detail
