// SPDX-License-Identifier: MIT
#include "region/simplify/Directions.h"

#include "region/plane/Carrier.h"
#include "region/plane/ElementWinding.h"
#include "region/simplify/Chain.h"

namespace gmregion {

Vec2 startDirection(const Element& e) {
    return rightNormal(carrierOf(e).normal);
}

Vec2 endDirection(const Element& e) {
    return -1.0 * startDirection({e.ep, e.sp, -e.bulge});
}

double bulgeLeaving(Vec2 direction, Vec2 chord) {
    return cross(direction, chord) / (lengthOf(chord) + dot(direction, chord));
}

double bulgeReaching(Vec2 chord, Vec2 direction) {
    return cross(chord, direction) / (lengthOf(chord) + dot(direction, chord));
}

bool jumpsBy(Vec2 a, Vec2 b, double limit) {
    return std::fabs(cross(a, b)) > limit * (1.0 + dot(a, b)) || dot(a, b) < limit - 1.0;
}

Parts cutAt(const Element& e, Vec2 p) {
    if (e.bulge == 0.0) return {{e.sp, p, 0.0}, {p, e.ep, 0.0}};
    return {{e.sp, p, bulgeLeaving(startDirection(e), p - e.sp)},
            {p, e.ep, bulgeReaching(e.ep - p, endDirection(e))}};
}

Parts halved(const Element& e) {
    const Vec2 m = middleOf(e);
    const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
    return {{e.sp, m, half}, {m, e.ep, half}};
}

Piece pieceOf(const Element& e, std::uint32_t source) {
    Piece piece;
    piece.e = e;
    piece.startDir = startDirection(e);
    piece.endDir = endDirection(e);
    piece.first = piece.last = source;
    return piece;
}

}  // namespace gmregion
