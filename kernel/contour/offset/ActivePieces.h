// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/contour/offset/PieceList.h"
#include "kernel/curves/BoxLevels.h"

namespace gmkernel_detail {

/// Some pieces that follow each other in the active list. Pieces come in the order of the source,
/// so the pieces of a run lie near to each other.
struct PieceRun {
    PieceList pieces;
    /// Every piece is far enough from the elements of the span, see Piece::clearOfSpan.
    bool settled = true;
};

/// The active list: pieces that are still cut by and tested against new ones, in runs, each with a
/// box about all of its pieces, so that what is out of reach is passed over. Order is that of one
/// long list.
class ActivePieces {
public:
    PieceRun& run(std::size_t index) { return m_runs[index]; }

    /// Calls visit(index) for the runs that a box reaches, in order. No piece may be appended
    /// meanwhile.
    template <class Visit>
    void visitReached(CurveBox const& box, Visit const& visit) {
        m_reach.visitUntil(box, m_first, [&](std::size_t index) {
            visit(index);
            return false;
        });
    }

    /// Appends a piece; answers the index of its run.
    std::size_t append(Piece piece);
    /// Says that a piece of a run has changed or is new.
    void changed(std::size_t index, Piece const& piece);
    /// The runs with pieces that changed since the last call.
    std::vector<std::size_t> takeUnsettled();
    /// Measures a run anew that has lost pieces.
    void shrink(std::size_t index);

    /// Moves the pieces up to a source index to another list.
    void retire(long long lastSource, PieceList& retired);
    void retireAll(PieceList& retired);

private:
    static constexpr std::size_t kRunSize = 24;

    std::vector<PieceRun> m_runs;
    BoxLevels m_reach;                     ///< the boxes of the runs
    std::size_t m_first = 0;               ///< runs before this one are retired
    std::vector<std::size_t> m_unsettled;  ///< runs that are not settled
};

}  // namespace gmkernel_detail
