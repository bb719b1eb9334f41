// SPDX-License-Identifier: MIT
#include "region/locate/BoundaryIndex.h"

#include <cmath>

#include "region/plane/ElementBox.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/Nearest.h"

namespace gmregion {

void BoundaryIndex::take(const RegionSet& set) {
    m_pieces.clear();
    m_loops.clear();
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        for (Index i = set.loops()[loop].first; i < set.loops()[loop].last; ++i)
            append(set.elements()[i], i);
        m_loops.endChain(static_cast<Index>(m_pieces.size()));
    }
    index();
}

void BoundaryIndex::take(const LoopsView& view) {
    m_pieces.clear();
    m_loops.clear();
    Index i = 0;
    for (std::size_t loop = 0; loop < view.loopEnds->size(); ++loop) {
        for (; i < (*view.loopEnds)[loop]; ++i)
            append((*view.elements)[i], i);
        m_loops.endChain(static_cast<Index>(m_pieces.size()));
    }
    index();
}

void BoundaryIndex::append(const Element& e, Index element) {
    visitHalves(e, [&](const Element& half) {
        if (half.sp == half.ep) return;
        BoundaryPiece piece;
        static_cast<Element&>(piece) = half;
        piece.carrier = carrierOf(half);
        piece.element = element;
        m_pieces.push_back(piece);
    });
}

void BoundaryIndex::index() {
    m_boxes.begin(m_pieces.size());
    for (const BoundaryPiece& piece : m_pieces)
        m_boxes.add(boxAbout(piece));
    m_boxes.finish();
}

int BoundaryIndex::windingAbout(Vec2 p) const {
    int sum = 0;
    visitWindings(p, [&](Index, int winding) { sum += winding; });
    return sum;
}

BoundaryIndex::Near BoundaryIndex::nearest(Vec2 p, double limit) const {
    Near near;
    double least = limit * limit;
    m_boxes.visitNear(p, least, [&](std::size_t i) {
        const BoundaryPiece& piece = m_pieces[i];
        Vec2 at = nearestOn(piece, piece.carrier, p);
        // From far away the foot is a rounded one; its own foot is right.
        if (at != piece.sp && at != piece.ep) at = footOn(piece.carrier, at);
        const double squared = dot(at - p, at - p);
        const bool isFirst = near.piece == kNone || i < near.piece;
        if (!(squared < least || (squared == least && isFirst))) return least;
        least = squared;
        near.at = at;
        near.piece = static_cast<Index>(i);
        return least;
    });
    near.distance = std::sqrt(least);
    return near;
}

bool BoundaryIndex::isNear(std::size_t piece, Vec2 p, double limit) const {
    const BoundaryPiece& e = m_pieces[piece];
    if (!isWithin(e.carrier, p, limit)) return false;
    const Vec2 way = nearestOn(e, e.carrier, p) - p;
    return dot(way, way) <= limit * limit;
}

bool BoundaryIndex::isAnyNear(Vec2 p, double limit) const {
    Index guess = kNone;
    return isAnyNear(p, limit, guess);
}

bool BoundaryIndex::isAnyNear(Vec2 p, double limit, Index& guess) const {
    if (guess < m_pieces.size() && isNear(guess, p, limit)) return true;
    const Vec2 by{limit, limit};
    return m_boxes.anyOverlapping({p - by, p + by}, [&](std::size_t i) {
        if (!isNear(i, p, limit)) return false;
        guess = static_cast<Index>(i);
        return true;
    });
}

}  // namespace gmregion
