#pragma once

#include "gmkernel/GmCurve.h"

namespace gmkernel_detail {

/// An axis-parallel box, the quick answer to "can these two pieces meet at all?".
struct PieceBox {
    double left;
    double right;
    double bottom;
    double top;

    /// False also where a bound is no number.
    bool overlaps(PieceBox const& other) const {
        return left <= other.right && other.left <= right && bottom <= other.top &&
               other.bottom <= top;
    }
};

/// The box of every point that the membership tests of a piece can accept: its bounding rectangle,
/// grown by twice the loosest membership tolerance.
PieceBox reachOf(GmCurve const& piece);

}  // namespace gmkernel_detail
