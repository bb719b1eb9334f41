// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/contour/offset/Piece.h"
#include "kernel/contour/offset/StartCells.h"

namespace gmkernel_detail {

/// Loose pieces, from which the chains of the results are taken one by one.
class Chaining {
public:
    /// The pieces of one result, end to start.
    using Chain = std::vector<Piece const*>;

    /// The order of the pieces, which must outlive this object, decides among equals. Cost: that of
    /// sorting them.
    explicit Chaining(std::vector<Piece const*> pieces);

    /// No piece is left.
    bool done() const { return m_left == 0; }

    /// Takes the pieces of one result; there must be pieces left.
    ///
    /// The chain begins with the smallest identifier, grows backwards through pieces of that
    /// identifier in one walk, then forwards through any piece that starts within three length
    /// tolerances of its end. Pieces shorter than 0.001 leave it at last, so that the chain may be
    /// empty. Cost: a logarithm for every piece of the chain, and the pieces that start beside its
    /// joints.
    Chain takeChain();

private:
    /// Numbers of pieces, by their place in the list.
    using Numbers = std::vector<std::size_t>;

    PlainCurve const& curve(std::size_t number) const { return m_pieces[number]->curve(); }
    int id(std::size_t number) const { return m_pieces[number]->id(); }
    void take(std::size_t number);
    std::size_t takeFirst();
    Numbers growBackward(std::size_t first);
    void growForward(Numbers& chain);
    bool startsAt(std::size_t number, Vec3 const& p) const;
    void collectStartsAt(Vec3 const& p, Numbers& numbers) const;
    bool leadsOn(std::size_t number);

    std::vector<Piece const*> m_pieces;
    std::size_t m_left;  ///< how many are not taken
    std::vector<bool> m_taken;
    Numbers m_byId;           ///< all pieces by identifier, then by place
    std::size_t m_first = 0;  ///< in that order, the first that may be left
    StartCells m_starts;
    Numbers m_next;  ///< scratch: pieces that start at the end of the chain
    Numbers m_further;
};

/// Is there a piece of the offset on the chosen side in the chain, and not only caps?
bool hasOffset(Chaining::Chain const& chain);

}  // namespace gmkernel_detail
