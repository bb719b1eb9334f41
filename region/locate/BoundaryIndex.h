// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/model/Index.h"
#include "region/plane/Carrier.h"
#include "region/search/BoxRow.h"

namespace gmregion {

/// Loops as plain arrays, of which nothing is asked.
struct LoopsView {
    const std::vector<Element>* elements = nullptr;
    const std::vector<Index>* loopEnds = nullptr;  ///< behind the last element of each loop
};

/// A piece of a boundary that turns by half a turn at the most.
struct BoundaryPiece : Element {
    Carrier carrier;
    Index element = 0;  ///< the element that it is, or that it is half of
    Index loop = 0;
};

/// The pieces of loops with their boxes: windings about points, and what is nearest to them.
class BoundaryIndex {
public:
    /// What is nearest to a point.
    struct Near {
        Vec2 at;
        double distance = 0.0;
        Index piece = kNone;  ///< kNone when nothing is nearer than the limit
    };

    void take(const RegionSet& set);
    void take(const LoopsView& view);

    const std::vector<BoundaryPiece>& pieces() const { return m_pieces; }
    const BoxRow& boxes() const { return m_boxes; }

    /// How often the loops run round a point. Every point is on one side of every element: the sums
    /// are whole for points right on the boundary, too.
    int windingAbout(Vec2 p) const;
    /// Calls visit(loop, winding) for every piece that has a part in the winding about a point.
    template <class Visit>
    void visitWindings(Vec2 p, const Visit& visit) const;

    /// The nearest point that is not farther off than a limit, of equally near ones that of the
    /// lowest piece.
    Near nearest(Vec2 p, double limit) const;

    /// Whether a piece is not farther off than a limit.
    bool isNear(std::size_t piece, Vec2 p, double limit) const;
    bool isAnyNear(Vec2 p, double limit) const;

private:
    void append(const Element& e, Index element, Index loop);
    int pieceWinding(std::size_t piece, Vec2 p) const;
    void index();

    std::vector<BoundaryPiece> m_pieces;
    BoxRow m_boxes;
};

template <class Visit>
void BoundaryIndex::visitWindings(Vec2 p, const Visit& visit) const {
    m_boxes.visitOverlapping({{-HUGE_VAL, p.y}, p}, [&](std::size_t i) {
        const int winding = pieceWinding(i, p);
        if (winding != 0) visit(m_pieces[i].loop, winding);
    });
}

}  // namespace gmregion
