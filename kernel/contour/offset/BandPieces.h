// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "kernel/contour/offset/OffsetElement.h"
#include "kernel/contour/offset/Piece.h"

namespace gmkernel_detail {

/// The closed boundary of an element's band of half-width |d|, in order: start cap, offset on the
/// chosen side, end cap, offset on the other side reversed.
///
/// Offsets that vanish are left out. A curve that is neither stretch nor arc has no band.
/// @param element the source element
/// @param source its index
/// @param id its identifier
/// @param d the offset distance, positive to the right of the direction of travel
std::vector<GmOffsetElement> bandPieces(GmCurve const& element, int source, int id, double d);

/// The same in plain numbers, appended to a list.
void appendBandPieces(GmCurve const& element, int source, int id, double d,
                      std::vector<Piece>& pieces);

/// The curve of a piece that splitting has left of a band.
/// @param piece the piece
/// @param element the source element of its band
/// @param d the offset distance for which the band was made
GmOffsetElement elementOf(Piece const& piece, GmCurve const& element, double d);

}  // namespace gmkernel_detail
