// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/ActivePieces.h"

namespace gmkernel_detail {

std::size_t ActivePieces::append(Piece const& piece) {
    if (m_first == m_runs.size() || m_runs.back().row.size >= kRunSize) {
        m_runs.emplace_back();
        m_reach.append(CurveBox::empty());
    }
    const std::size_t last = m_runs.size() - 1;
    m_pieces.append(m_runs[last].row, piece);
    changed(last, piece);
    return last;
}

void ActivePieces::insert(std::size_t index, PiecePlace before, Piece const& piece) {
    m_pieces.insert(m_runs[index].row, before, piece);
    changed(index, piece);
}

void ActivePieces::changed(std::size_t index, Piece const& piece) {
    m_reach.include(index, piece.reach());
    if (m_runs[index].settled) m_unsettled.push_back(index);
    m_runs[index].settled = false;
}

void ActivePieces::settle() {
    for (const std::size_t index : m_unsettled)
        m_runs[index].settled = true;
    m_unsettled.clear();
}

void ActivePieces::shrink(std::size_t index) {
    CurveBox reach = CurveBox::empty();
    PieceRow const& row = m_runs[index].row;
    for (PiecePlace place = row.first; place != kNoPiece; place = m_pieces.after(place))
        reach.include(m_pieces[place].reach());
    m_reach.replace(index, reach);
}

void ActivePieces::retire(long long lastSource) {
    for (; m_first < m_runs.size(); ++m_first) {
        PieceRow& row = m_runs[m_first].row;
        while (row.size > 0 && m_pieces[row.first].source() <= lastSource)
            m_pieces.moveFirst(row, m_retired);
        if (row.size > 0) return;
    }
}

void ActivePieces::retireAll() {
    for (; m_first < m_runs.size(); ++m_first)
        m_pieces.moveAll(m_runs[m_first].row, m_retired);
}

}  // namespace gmkernel_detail
