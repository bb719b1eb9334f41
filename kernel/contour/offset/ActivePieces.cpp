// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/ActivePieces.h"

#include <algorithm>

namespace gmkernel_detail {

PieceRun& ActivePieces::lastRun() {
    if (m_runs.empty() || m_runs.back().pieces.size() >= kRunSize) m_runs.emplace_back();
    return m_runs.back();
}

void ActivePieces::dropEmptyRuns() {
    const auto isEmpty = [](PieceRun const& run) { return run.pieces.empty(); };
    m_runs.erase(std::remove_if(m_runs.begin(), m_runs.end(), isEmpty), m_runs.end());
}

}  // namespace gmkernel_detail
