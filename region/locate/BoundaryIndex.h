// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/model/Index.h"
#include "region/plane/Carrier.h"
#include "region/plane/ElementWinding.h"
#include "region/search/BoxRow.h"
#include "region/search/ChainRow.h"

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
    Index loopOf(std::size_t piece) const { return m_loops.chainOf(piece); }
    const BoxRow& boxes() const { return m_boxes; }

    /// How often the loops run round a point. Every point is on one side of every element: the sums
    /// are whole for points right on the boundary, too.
    int windingAbout(Vec2 p) const;
    /// Calls visit(loop, winding) for pieces and ranges of pieces of a loop that have a part in its
    /// winding about a point.
    template <class Visit>
    void visitWindings(Vec2 p, const Visit& visit) const;

    /// The nearest point that is not farther off than a limit, of equally near ones that of the
    /// lowest piece.
    Near nearest(Vec2 p, double limit) const;

    /// Whether a piece is not farther off than a limit.
    bool isNear(std::size_t piece, Vec2 p, double limit) const;
    bool isAnyNear(Vec2 p, double limit) const;
    /// The same, asking first the piece that was near the last time.
    bool isAnyNear(Vec2 p, double limit, Index& guess) const;

private:
    void append(const Element& e, Index element);
    void index();

    std::vector<BoundaryPiece> m_pieces;
    ChainRow m_loops;
    BoxRow m_boxes;
};

template <class Visit>
void BoundaryIndex::visitWindings(Vec2 p, const Visit& visit) const {
    const auto ofPart = [&](Index loop, std::size_t first, std::size_t last) {
        const int winding = windingOfChain(m_pieces[first].sp, m_pieces[last - 1].ep, p);
        if (winding != 0) visit(loop, winding);
    };
    const auto ofRange = [&](std::size_t first, std::size_t last) {
        m_loops.visitParts(first, last, ofPart);
    };
    m_boxes.castLeft(p, ofRange, [&](std::size_t i) {
        const int winding = windingOf(m_pieces[i], p);
        if (winding != 0) visit(m_loops.chainOf(i), winding);
    });
}

}  // namespace gmregion
