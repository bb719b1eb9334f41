// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/contour/offset/PieceList.h"
#include "kernel/contour/offset/StartCells.h"

namespace gmkernel_detail {

/// Loose pieces, from which the chains of the results are taken one by one.
class Chaining {
public:
    /// The order of the pieces decides among equals. Cost: that of sorting them.
    explicit Chaining(PieceList pieces);

    /// No piece is left.
    bool done() const { return m_pieces.empty(); }

    /// Takes the pieces of one result, end to start; there must be pieces left.
    ///
    /// The chain begins with the smallest identifier, grows backwards through pieces of that
    /// identifier in one walk, then forwards through any piece that starts within three length
    /// tolerances of its end. Pieces shorter than 0.001 leave it at last, so that the chain may be
    /// empty. Cost: a logarithm for every piece of the chain, and the pieces that start beside its
    /// joints.
    PieceList takeChain();

private:
    /// Numbers of pieces, by their place in the list.
    using Numbers = std::vector<std::size_t>;

    /// A piece that is left; those that were taken may be gone.
    Piece const& piece(std::size_t number) const { return *m_places[number]; }
    void take(PieceList& chain, PieceList::iterator before, std::size_t number);
    void begin(PieceList& chain);
    void growBackward(PieceList& chain);
    void growForward(PieceList& chain);
    bool startsAt(std::size_t number, GmPoint const& p, CurveBox const& box) const;
    void collectStartsAt(GmPoint const& p, Numbers& numbers) const;
    bool leadsOn(std::size_t number);

    PieceList m_pieces;  ///< those left
    std::vector<PieceList::iterator> m_places;
    std::vector<int> m_ids;
    std::vector<bool> m_taken;
    Numbers m_byId;           ///< all pieces by identifier, then by place
    std::size_t m_first = 0;  ///< in that order, the first that may be left
    StartCells m_starts;
    Numbers m_next;  ///< scratch: pieces that start at the end of the chain
    Numbers m_further;
};

}  // namespace gmkernel_detail
