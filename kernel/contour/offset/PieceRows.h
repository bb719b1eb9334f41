// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <vector>

#include "kernel/contour/offset/Piece.h"

namespace gmkernel_detail {

/// Where a piece stands in the array of its rows.
using PiecePlace = std::uint32_t;
constexpr PiecePlace kNoPiece = std::numeric_limits<PiecePlace>::max();

/// A row of pieces, linked in both directions.
struct PieceRow {
    PiecePlace first = kNoPiece;
    PiecePlace last = kNoPiece;
    std::size_t size = 0;
};

/// The pieces of many rows in one array of blocks, linked by their places, so that none of them
/// needs memory of its own. The place of a piece that was removed goes to the next one that comes.
/// Pieces stay where they are.
class PieceRows {
public:
    Piece& operator[](PiecePlace place) { return node(place).piece; }
    Piece const& operator[](PiecePlace place) const { return node(place).piece; }
    /// The place after this one in its row, kNoPiece behind the last.
    PiecePlace after(PiecePlace place) const { return node(place).next; }

    PiecePlace append(PieceRow& row, Piece const& piece);
    /// Puts a piece in front of one of the row.
    PiecePlace insert(PieceRow& row, PiecePlace before, Piece const& piece);
    void remove(PieceRow& row, PiecePlace place);

    /// Moves the first piece of a row to the end of another.
    void moveFirst(PieceRow& from, PieceRow& to);
    /// Moves all pieces of a row to the end of another.
    void moveAll(PieceRow& from, PieceRow& to);

private:
    struct Node {
        Piece piece;
        PiecePlace previous;
        PiecePlace next;
    };

    static constexpr unsigned kBits = 6;  ///< a block has two to that power places

    Node& node(PiecePlace place) { return m_blocks[place >> kBits][place & kInBlock]; }
    Node const& node(PiecePlace place) const { return m_blocks[place >> kBits][place & kInBlock]; }
    PiecePlace newNode(Piece const& piece);
    void link(PieceRow& row, PiecePlace previous, PiecePlace next);

    static constexpr PiecePlace kInBlock = (PiecePlace{1} << kBits) - 1;

    std::vector<std::vector<Node>> m_blocks;
    PiecePlace m_free = kNoPiece;  ///< the first free place; the others follow as in a row
};

}  // namespace gmkernel_detail
