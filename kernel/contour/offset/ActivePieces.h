// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <limits>
#include <vector>

#include "kernel/contour/offset/PieceList.h"

namespace gmkernel_detail {

/// Some pieces that follow each other in the active list, with a box about all of them. Pieces come
/// in the order of the source, so the pieces of a run lie near to each other.
struct PieceRun {
    PieceList pieces;
    CurveBox reach{std::numeric_limits<double>::max(), std::numeric_limits<double>::lowest(),
                   std::numeric_limits<double>::max(), std::numeric_limits<double>::lowest()};
    /// Every piece is far enough from the elements of the span, see Piece::clearOfSpan.
    bool settled = false;
};

/// The active list: pieces that are still cut by and tested against new ones, in runs, so that
/// whole runs can be passed over by their boxes. Order is that of one long list.
class ActivePieces {
public:
    std::vector<PieceRun>& runs() { return m_runs; }
    /// The run that takes the next piece at the end of the list.
    PieceRun& lastRun();
    /// Forgets runs without pieces.
    void dropEmptyRuns();

private:
    static constexpr std::size_t kRunSize = 24;

    std::vector<PieceRun> m_runs;
};

}  // namespace gmkernel_detail
