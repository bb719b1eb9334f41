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
#include <iterator>
#include <vector>

namespace gmkernel_detail {

namespace {

using Points = std::vector<GmPoint>;

/// Brings points of a curve into their order along it.
void sortAlong(GmCurve const& curve, Points& points) {
    if (points.size() < 2) return;
    struct Place {
        double fromStart;
        GmPoint point;
    };
    std::vector<Place> places;
    places.reserve(points.size());
    for (GmPoint const& p : points)
        places.push_back({curve.DistSP(p), p});
    std::stable_sort(places.begin(), places.end(),
                     [](Place const& a, Place const& b) { return a.fromStart < b.fromStart; });
    std::transform(places.begin(), places.end(), points.begin(),
                   [](Place const& place) { return place.point; });
}

/// Splits a piece at points of its curve, taken in order along the curve. Points equal to an end
/// split nothing. The parts before each point are inserted before the piece, which keeps the rest.
void splitPiece(ActivePieces& active, std::size_t index, PieceList::iterator piece,
                Points& points) {
    PieceRun& run = active.run(index);
    GmCurve& curve = piece->element.curve();
    sortAlong(curve, points);

    bool split = false;
    for (GmPoint const& p : points) {
        if (p == curve.SP() || p == curve.EP()) continue;
        GmOffsetElement part(piece->element);
        part.curve().SetEP(p);
        active.changed(index, *run.pieces.insert(piece, Piece(std::move(part))));
        curve.SetSP(p);
        split = true;
    }
    if (!split) return;
    piece->measure();
    active.changed(index, *piece);
}

/// Cuts the pieces of a run where they cross the added one, and collects the points.
void cutRun(ActivePieces& active, std::size_t index, Piece const& added, Points& ofAdded) {
    PieceRun& run = active.run(index);
    Points ofOld;
    for (auto old = run.pieces.begin(); old != run.pieces.end(); ++old) {
        if (!added.reach.overlaps(old->reach)) continue;
        ::Intersection(added.element.curve(), old->element.curve(), ofOld);
        ofAdded.insert(ofAdded.end(), ofOld.begin(), ofOld.end());
        splitPiece(active, index, old, ofOld);
    }
}

}  // namespace

void insertPiece(ActivePieces& active, GmOffsetElement element) {
    Piece added(std::move(element));
    Points ofAdded;
    active.visitReached(added.reach, [&](std::size_t run) { cutRun(active, run, added, ofAdded); });
    const std::size_t last = active.append(std::move(added));
    splitPiece(active, last, std::prev(active.run(last).pieces.end()), ofAdded);
}

}  // namespace gmkernel_detail
