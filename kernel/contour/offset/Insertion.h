// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "kernel/contour/offset/ActivePieces.h"

namespace gmkernel_detail {

/// Adds pieces to the active list.
class Insertion {
public:
    explicit Insertion(ActivePieces& active) : m_active(active) {}

    /// Appends a piece and cuts it and the pieces in the list at all their mutual crossings. Cost:
    /// the logarithm of the number of active pieces, one box test for each piece of a near run, one
    /// intersection for each near piece.
    /// @param added the piece
    /// @param cutsOwnBand false where pieces of its own source element cannot split it, nor it them
    void insert(Piece const& added, bool cutsOwnBand);

private:
    using Points = std::vector<Vec3>;
    struct Distance {
        double fromStart;
        std::size_t number;
    };

    void cutRun(std::size_t index, Piece const& added);
    void splitPiece(std::size_t index, PiecePlace place, Points& points);
    void sortAlong(PlainCurve const& curve, Points& points);

    ActivePieces& m_active;
    bool m_cutsOwnBand = true;
    Points m_ofAdded;  ///< the points at which the added piece is cut
    // Scratch.
    Points m_ofOld;
    Points m_unsorted;
    std::vector<Distance> m_distances;
};

}  // namespace gmkernel_detail
