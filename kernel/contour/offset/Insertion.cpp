// SPDX-License-Identifier: MIT
/// @file
/// Cutting the pieces of bands at their mutual crossings.
///
/// A new piece is intersected with every active one whose box it reaches, and both are split at the
/// points. As every piece has gone through this when it came, any two have been cut by each other
/// once, and parts need not be cut again. A part takes everything but the curve from its piece.
/// Points are sorted along the curve before it is split, since each split leaves only the rest
/// behind it.
#include "kernel/contour/offset/Insertion.h"

#include <algorithm>

#include "kernel/contour/offset/OwnBand.h"

namespace gmkernel_detail {

void Insertion::insert(Piece const& added, bool cutsOwnBand) {
    m_cutsOwnBand = cutsOwnBand;
    m_ofAdded.clear();
    m_active.visitReached(added.reach(), [&](std::size_t run) { cutRun(run, added); });
    const std::size_t last = m_active.append(added);
    splitPiece(last, m_active.run(last).row.last, m_ofAdded);
}

/// Cuts the pieces of a run where they cross the added one, and collects the points.
void Insertion::cutRun(std::size_t index, Piece const& added) {
    PieceRows const& pieces = m_active.pieces();
    PiecePlace place = m_active.run(index).row.first;
    for (; place != kNoPiece; place = pieces.after(place)) {
        Piece const& old = pieces[place];
        if (!added.reach().overlaps(old.reach())) continue;
        if (!m_cutsOwnBand && onlyTouch(added, old)) continue;
        const Hits<2> points = crossings(added, old);
        m_ofOld.assign(points.begin(), points.end());
        m_ofAdded.insert(m_ofAdded.end(), points.begin(), points.end());
        splitPiece(index, place, m_ofOld);
    }
}

/// Splits a piece at points of its curve, taken in order along the curve. Points equal to an end
/// split nothing. The parts before each point are inserted before the piece, which keeps the rest.
void Insertion::splitPiece(std::size_t index, PiecePlace place, Points& points) {
    if (points.empty()) return;
    PieceRows& pieces = m_active.pieces();
    sortAlong(pieces[place].curve(), points);

    bool split = false;
    for (Vec3 const& p : points) {
        Piece& rest = pieces[place];
        if (isSamePoint(p, startOf(rest.curve())) || isSamePoint(p, endOf(rest.curve()))) continue;
        Piece part = rest;
        part.moveEnd(p);
        part.measure();
        rest.moveStart(p);
        m_active.insert(index, place, part);
        split = true;
    }
    if (!split) return;
    pieces[place].measure();
    m_active.changed(index, pieces[place]);
}

/// Brings points of a curve into their order along it; equal ones keep theirs.
void Insertion::sortAlong(PlainCurve const& curve, Points& points) {
    if (points.size() < 2) return;
    m_distances.clear();
    for (Vec3 const& p : points)
        m_distances.push_back({distanceFromStart(curve, p), m_distances.size()});
    std::sort(m_distances.begin(), m_distances.end(), [](Distance const& a, Distance const& b) {
        return a.fromStart < b.fromStart || (!(b.fromStart < a.fromStart) && a.number < b.number);
    });
    m_unsorted = points;
    std::transform(m_distances.begin(), m_distances.end(), points.begin(),
                   [&](Distance const& distance) { return m_unsorted[distance.number]; });
}

}  // namespace gmkernel_detail
