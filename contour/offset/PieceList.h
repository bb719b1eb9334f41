#pragma once

#include <list>

#include "contour/offset/OffsetElement.h"
#include "contour/offset/PieceBox.h"

namespace gmkernel_detail {

/// A band piece in a working list, with what spares it needless tests.
struct Piece {
    explicit Piece(GmOffsetElement element)
        : element(std::move(element)), reach(reachOf(this->element.curve())) {}

    GmOffsetElement element;
    /// Pieces whose boxes are apart cannot cross.
    PieceBox reach;
    /// The piece keeps its distance from every element of the span but the newest one. A split
    /// takes this back, since the halves are judged by other points.
    bool keepsDistance = false;
};

using PieceList = std::list<Piece>;

}  // namespace gmkernel_detail
