// SPDX-License-Identifier: MIT
#pragma once

#include <list>
#include <optional>
#include <utility>

#include "kernel/contour/ContourElements.h"
#include "kernel/contour/offset/OffsetElement.h"
#include "kernel/contour/offset/QuickDistance.h"
#include "kernel/curves/CurveBox.h"

namespace gmkernel_detail {

/// A band piece in a working list, with its box.
struct Piece {
    explicit Piece(GmOffsetElement source) : element(std::move(source)) { measure(); }

    /// To be called when the curve has changed.
    void measure() {
        reach = reachOf(element.curve());
        height = heightOf(element.curve());
        m_halving.reset();
        m_quickHalving.reset();
        clearOfSpan = false;
    }

    /// The point that stands for the piece when its distance from the source is judged; computed
    /// when it is first asked for, as most pieces are split again before.
    GmPoint const& halving() {
        if (!m_halving) m_halving = middleOf(&element.curve());
        return *m_halving;
    }
    /// The same up to rounding.
    PlanePoint quickHalving() {
        if (!m_quickHalving) m_quickHalving = quickHalvingPoint(element.curve());
        if (!m_quickHalving) m_quickHalving = PlanePoint{halving().X(), halving().Y()};
        return *m_quickHalving;
    }

    GmOffsetElement element;
    /// Pieces whose boxes are apart cannot cross.
    CurveBox reach{};
    /// The z coordinate of its halving point, for pieces of one height; else not a number.
    double height = 0.0;
    /// At its last test the piece was far enough from every element then in the span. A split takes
    /// this back, since the parts are judged by other points.
    bool clearOfSpan = false;

private:
    std::optional<GmPoint> m_halving;
    std::optional<PlanePoint> m_quickHalving;
};

using PieceList = std::list<Piece>;

}  // namespace gmkernel_detail
