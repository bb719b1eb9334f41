// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/ActivePieces.h"

#include <utility>

namespace gmkernel_detail {

std::size_t ActivePieces::append(Piece piece) {
    if (m_first == m_runs.size() || m_runs.back().pieces.size() >= kRunSize) {
        m_runs.emplace_back();
        m_reach.append(CurveBox::empty());
    }
    const std::size_t last = m_runs.size() - 1;
    m_runs[last].pieces.push_back(std::move(piece));
    changed(last, m_runs[last].pieces.back());
    return last;
}

void ActivePieces::changed(std::size_t index, Piece const& piece) {
    m_reach.include(index, piece.reach);
    if (m_runs[index].settled) m_unsettled.push_back(index);
    m_runs[index].settled = false;
}

std::vector<std::size_t> ActivePieces::takeUnsettled() {
    return std::exchange(m_unsettled, {});
}

void ActivePieces::shrink(std::size_t index) {
    CurveBox reach = CurveBox::empty();
    for (Piece const& piece : m_runs[index].pieces)
        reach.include(piece.reach);
    m_reach.replace(index, reach);
}

void ActivePieces::retire(long long lastSource, PieceList& retired) {
    for (; m_first < m_runs.size(); ++m_first) {
        PieceList& pieces = m_runs[m_first].pieces;
        while (!pieces.empty() && pieces.front().element.source() <= lastSource)
            retired.splice(retired.end(), pieces, pieces.begin());
        if (!pieces.empty()) return;
    }
}

void ActivePieces::retireAll(PieceList& retired) {
    for (; m_first < m_runs.size(); ++m_first)
        retired.splice(retired.end(), m_runs[m_first].pieces);
}

}  // namespace gmkernel_detail
