// SPDX-License-Identifier: MIT
/// @file
/// From loose pieces to the chain of one result.
///
/// Pieces that bound one result start where others end, up to rounding, so a chain grows by the
/// piece that starts at its end. Where several do, one that leads on is preferred to a dead end;
/// the choice is never taken back, so that where results touch each other a piece may go to the
/// wrong one. A chain starts at the smallest identifier, for results in the order of the source.
///
/// Pieces are found by two indexes made once, by identifier and by the cell of the start point;
/// what has been taken is passed over. Where many pieces start at one point, each joint there looks
/// at all of them.
#include "kernel/contour/offset/Chaining.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace gmkernel_detail {

namespace {

/// The end of a chain and the start of the next piece lie nearer than this, in length units.
double jointGap() {
    constexpr double kTolerances = 3.0;
    return kTolerances * GmBase::m_scdPrec;
}

/// Pieces below this length are left out of the results, in length units.
constexpr double kShortestPiece = 0.001;

}  // namespace

Chaining::Chaining(PieceList pieces)
    : m_pieces(std::move(pieces)), m_taken(m_pieces.size(), false), m_starts(jointGap()) {
    for (auto place = m_pieces.begin(); place != m_pieces.end(); ++place) {
        m_starts.add(place->element.curve().SP(), m_places.size());
        m_places.push_back(place);
        m_ids.push_back(place->element.id());
    }
    m_starts.order();
    m_byId.resize(m_places.size());
    std::iota(m_byId.begin(), m_byId.end(), std::size_t{0});
    std::stable_sort(m_byId.begin(), m_byId.end(),
                     [this](std::size_t a, std::size_t b) { return m_ids[a] < m_ids[b]; });
}

PieceList Chaining::takeChain() {
    PieceList chain;
    begin(chain);
    growBackward(chain);
    growForward(chain);
    chain.remove_if(
        [](Piece const& piece) { return piece.element.curve().Length() < kShortestPiece; });
    return chain;
}

void Chaining::take(PieceList& chain, PieceList::iterator before, std::size_t number) {
    chain.splice(before, m_pieces, m_places[number]);
    m_taken[number] = true;
}

/// The piece with the smallest identifier, the first of equals, alone in a new chain.
void Chaining::begin(PieceList& chain) {
    while (m_taken[m_byId[m_first]])
        ++m_first;
    take(chain, chain.end(), m_byId[m_first]);
}

/// One walk through the pieces with the identifier of the first one.
void Chaining::growBackward(PieceList& chain) {
    const int id = chain.front().element.id();
    for (std::size_t i = m_first; i < m_byId.size() && m_ids[m_byId[i]] == id; ++i) {
        const std::size_t number = m_byId[i];
        if (m_taken[number]) continue;
        if (piece(number).element.curve().EP() == chain.front().element.curve().SP()) {
            take(chain, chain.begin(), number);
        }
    }
}

/// Goes on by the only piece that starts at the end, or of several by the first that leads on to
/// another piece, else by the first.
void Chaining::growForward(PieceList& chain) {
    while (true) {
        collectStartsAt(chain.back().element.curve().EP(), m_next);
        if (m_next.empty()) return;
        std::size_t next = m_next.front();
        if (m_next.size() > 1) {
            const auto found = std::find_if(m_next.begin(), m_next.end(),
                                            [this](std::size_t number) { return leadsOn(number); });
            if (found != m_next.end()) next = *found;
        }
        take(chain, chain.end(), next);
    }
}

bool Chaining::startsAt(std::size_t number, GmPoint const& p, CurveBox const& box) const {
    return !m_taken[number] && box.overlaps(piece(number).reach) &&
           piece(number).element.curve().SP().Dist(p) < jointGap();
}

/// The pieces left that start at a point, in the order of the list.
void Chaining::collectStartsAt(GmPoint const& p, Numbers& numbers) const {
    m_starts.collectNear(p, numbers);
    const CurveBox box = boxOf(p);
    const auto isElsewhere = [&](std::size_t number) { return !startsAt(number, p, box); };
    numbers.erase(std::remove_if(numbers.begin(), numbers.end(), isElsewhere), numbers.end());
}

bool Chaining::leadsOn(std::size_t number) {
    collectStartsAt(piece(number).element.curve().EP(), m_further);
    return !m_further.empty();
}

}  // namespace gmkernel_detail
