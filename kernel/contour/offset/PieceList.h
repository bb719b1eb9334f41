// SPDX-License-Identifier: MIT
#pragma once

#include <list>
#include <utility>

#include "kernel/contour/ContourElements.h"
#include "kernel/contour/offset/OffsetElement.h"
#include "kernel/curves/CurveBox.h"

namespace gmkernel_detail {

/// A band piece in a working list, with its box and its halving point computed once.
struct Piece {
    explicit Piece(GmOffsetElement source) : element(std::move(source)) { measure(); }

    /// To be called when the curve has changed.
    void measure() {
        reach = reachOf(element.curve());
        halving = middleOf(&element.curve());
        clearOfSpan = false;
    }

    GmOffsetElement element;
    /// Pieces whose boxes are apart cannot cross.
    CurveBox reach{};
    /// The point that stands for the piece when its distance from the source is judged.
    GmPoint halving;
    /// At its last test the piece was far enough from every element then in the span. A split takes
    /// this back, since the parts are judged by other points.
    bool clearOfSpan = false;
};

using PieceList = std::list<Piece>;

}  // namespace gmkernel_detail
