// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/PieceRows.h"

#include <utility>

namespace gmkernel_detail {

PiecePlace PieceRows::newNode(Piece const& piece) {
    if (m_free != kNoPiece) {
        const PiecePlace place = m_free;
        m_free = node(place).next;
        node(place).piece = piece;
        return place;
    }
    if (m_blocks.empty() || m_blocks.back().size() > kInBlock) {
        m_blocks.emplace_back().reserve(kInBlock + 1);
    }
    m_blocks.back().push_back({piece, kNoPiece, kNoPiece});
    const std::size_t inBlock = m_blocks.back().size() - 1;
    return static_cast<PiecePlace>(((m_blocks.size() - 1) << kBits) + inBlock);
}

/// Lets two neighbours of a row follow each other; kNoPiece stands for its ends.
void PieceRows::link(PieceRow& row, PiecePlace previous, PiecePlace next) {
    (previous == kNoPiece ? row.first : node(previous).next) = next;
    (next == kNoPiece ? row.last : node(next).previous) = previous;
}

PiecePlace PieceRows::append(PieceRow& row, Piece const& piece) {
    return insert(row, kNoPiece, piece);
}

PiecePlace PieceRows::insert(PieceRow& row, PiecePlace before, Piece const& piece) {
    const PiecePlace place = newNode(piece);
    link(row, before == kNoPiece ? row.last : node(before).previous, place);
    link(row, place, before);
    ++row.size;
    return place;
}

void PieceRows::remove(PieceRow& row, PiecePlace place) {
    link(row, node(place).previous, node(place).next);
    --row.size;
    node(place).next = std::exchange(m_free, place);
}

void PieceRows::moveFirst(PieceRow& from, PieceRow& to) {
    const PiecePlace place = from.first;
    link(from, kNoPiece, node(place).next);
    --from.size;
    link(to, to.last, place);
    link(to, place, kNoPiece);
    ++to.size;
}

void PieceRows::moveAll(PieceRow& from, PieceRow& to) {
    if (from.size == 0) return;
    const PiecePlace last = from.last;
    link(to, to.last, from.first);
    link(to, last, kNoPiece);
    to.size += from.size;
    from = PieceRow();
}

}  // namespace gmkernel_detail
