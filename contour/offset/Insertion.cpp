#include "contour/offset/Insertion.h"

#include <algorithm>
#include <iterator>
#include <vector>

namespace gmkernel_detail {

namespace {

using Points = std::vector<GmPoint>;

/// Splits a piece at points of its curve, taken in order along the curve. Points equal to an end
/// split nothing. The parts before each point are inserted before the piece, which keeps the rest.
void splitPiece(PieceList& list, PieceList::iterator piece, Points& points) {
    GmCurve& curve = piece->element.curve();
    std::stable_sort(points.begin(), points.end(), less_than_curve(&curve));

    bool split = false;
    for (GmPoint const& p : points) {
        if (p == curve.SP() || p == curve.EP()) continue;
        GmOffsetElement part(piece->element);
        part.curve().SetEP(p);
        list.insert(piece, Piece(std::move(part)));
        curve.SetSP(p);
        split = true;
    }
    if (split) piece->measure();
}

}  // namespace

void insertPiece(PieceList& active, GmOffsetElement element) {
    Piece added(std::move(element));
    Points ofAdded;
    Points ofOld;
    for (auto old = active.begin(); old != active.end(); ++old) {
        if (!added.reach.overlaps(old->reach)) continue;
        ::Intersection(added.element.curve(), old->element.curve(), ofOld);
        ofAdded.insert(ofAdded.end(), ofOld.begin(), ofOld.end());
        splitPiece(active, old, ofOld);
    }
    active.push_back(std::move(added));
    splitPiece(active, std::prev(active.end()), ofAdded);
}

}  // namespace gmkernel_detail
