// SPDX-License-Identifier: MIT
/// @file
/// From loose pieces to the chain of one result.
///
/// Pieces that bound one result start where others end, up to rounding, so a chain grows by the
/// piece that starts at its end. Where several do, one that leads on is preferred to a dead end;
/// the choice is never taken back, so that where results touch each other a piece may go to the
/// wrong one. A chain starts at the smallest identifier, for results in the order of the source.
/// Cost: the number of pieces left for each piece of the chain.
#include "kernel/contour/offset/Chaining.h"

#include <algorithm>

namespace gmkernel_detail {

namespace {

/// How far apart the end of a chain and the start of the next piece may lie, in length tolerances.
constexpr double kJointGap = 3.0;
/// Pieces below this length are left out of the results, in length units.
constexpr double kShortestPiece = 0.001;

/// Tells the pieces that start at a point, most of the others by their boxes.
class StartsAt {
public:
    explicit StartsAt(GmPoint const& p) : m_point(p), m_box(boxOf(p)) {}

    bool operator()(Piece const& piece) const {
        return m_box.overlaps(piece.reach) &&
               piece.element.curve().SP().Dist(m_point) < kJointGap * GmBase::m_scdPrec;
    }

private:
    GmPoint m_point;
    CurveBox m_box;
};

bool anyStartsAt(PieceList const& pieces, GmPoint const& p) {
    return std::any_of(pieces.begin(), pieces.end(), StartsAt(p));
}

/// The piece with the smallest identifier, the first of equals, alone in a new chain.
PieceList beginChain(PieceList& pieces) {
    const auto first = std::min_element(
        pieces.begin(), pieces.end(),
        [](Piece const& a, Piece const& b) { return a.element.id() < b.element.id(); });
    PieceList chain;
    chain.splice(chain.end(), pieces, first);
    return chain;
}

void growBackward(PieceList& chain, PieceList& pieces) {
    const int id = chain.front().element.id();
    for (auto piece = pieces.begin(); piece != pieces.end();) {
        const auto current = piece++;
        if (current->element.id() != id) continue;
        if (current->element.curve().EP() == chain.front().element.curve().SP()) {
            chain.splice(chain.begin(), pieces, current);
        }
    }
}

/// The piece that goes on at a point: the only one that starts there, or of several the first that
/// leads on to another piece, else the first. The end of the list when there is none.
PieceList::iterator nextPiece(PieceList& pieces, GmPoint const& end) {
    const StartsAt starts(end);
    const auto first = std::find_if(pieces.begin(), pieces.end(), starts);
    if (first == pieces.end()) return first;
    if (std::find_if(std::next(first), pieces.end(), starts) == pieces.end()) return first;

    const auto leadsOn = std::find_if(first, pieces.end(), [&](Piece const& piece) {
        return starts(piece) && anyStartsAt(pieces, piece.element.curve().EP());
    });
    return leadsOn != pieces.end() ? leadsOn : first;
}

void growForward(PieceList& chain, PieceList& pieces) {
    while (true) {
        const auto next = nextPiece(pieces, chain.back().element.curve().EP());
        if (next == pieces.end()) return;
        chain.splice(chain.end(), pieces, next);
    }
}

}  // namespace

PieceList takeChain(PieceList& pieces) {
    PieceList chain = beginChain(pieces);
    growBackward(chain, pieces);
    growForward(chain, pieces);
    chain.remove_if(
        [](Piece const& piece) { return piece.element.curve().Length() < kShortestPiece; });
    return chain;
}

}  // namespace gmkernel_detail
