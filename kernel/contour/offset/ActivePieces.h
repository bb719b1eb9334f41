// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/contour/offset/PieceRows.h"
#include "kernel/curves/BoxLevels.h"

namespace gmkernel_detail {

/// Some pieces that follow each other in the active list. Pieces come in the order of the source,
/// so the pieces of a run lie near to each other.
struct PieceRun {
    PieceRow row;
    /// Every piece is far enough from the elements of the span, see Piece::clearOfSpan.
    bool settled = true;
};

/// The active list: pieces that are still cut by and tested against new ones, in runs, each with a
/// box about all of its pieces, so that what is out of reach is passed over. Order is that of one
/// long list.
class ActivePieces {
public:
    PieceRun& run(std::size_t index) { return m_runs[index]; }
    PieceRows& pieces() { return m_pieces; }

    /// Calls visit(index) for the runs that a box reaches, in order. No piece may be appended
    /// meanwhile.
    template <class Visit>
    void visitReached(CurveBox const& box, Visit const& visit) {
        m_reach.visitUntil(box, m_first, [&](std::size_t index) {
            visit(index);
            return false;
        });
    }

    /// Appends a piece; answers the index of its run, of which it is the last.
    std::size_t append(Piece const& piece);
    /// Puts a piece in front of one of a run.
    void insert(std::size_t index, PiecePlace before, Piece const& piece);
    /// Says that a piece of a run has changed or is new.
    void changed(std::size_t index, Piece const& piece);
    /// The runs that are not settled, in the order in which that was said.
    std::vector<std::size_t> const& unsettled() const { return m_unsettled; }
    /// Says that the pieces of all runs were tested.
    void settle();
    /// Measures a run anew that has lost pieces.
    void shrink(std::size_t index);

    /// Retires the pieces up to a source index: they are no longer active.
    void retire(long long lastSource);
    void retireAll();
    /// The retired pieces, in the order in which they were retired.
    PieceRow const& retired() const { return m_retired; }

private:
    static constexpr std::size_t kRunSize = 24;

    PieceRows m_pieces;
    PieceRow m_retired;
    std::vector<PieceRun> m_runs;
    BoxLevels m_reach;                     ///< the boxes of the runs
    std::size_t m_first = 0;               ///< runs before this one are retired
    std::vector<std::size_t> m_unsettled;  ///< runs that are not settled
};

}  // namespace gmkernel_detail
