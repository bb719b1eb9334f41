// SPDX-License-Identifier: MIT
/// @file
/// A closed chain as a full circle.
///
/// The circle is that of least squares of x x + y y + 2 a x + 2 b y + c over the vertices and the
/// middles of arcs (Kasa, IEEE Transactions on Instrumentation 25, 1976), taken from their mean: a
/// square root, no steps, and exact for points on a circle.
///
/// A chain in the ring of width t about the circle that runs round the centre once is within t of
/// the circle, and takes every point of it as its nearest: both ways.
#include "region/simplify/CircleFit.h"

#include <cmath>

#include "region/plane/ElementWinding.h"
#include "region/simplify/ArcFit.h"
#include "region/simplify/Corridor.h"
#include "region/simplify/Directions.h"

namespace gmregion {

namespace {

template <class Visit>
void visitPoints(const Chain& chain, const Visit& visit) {
    for (const Piece& piece : chain.pieces) {
        visit(piece.e.sp);
        if (isArc(piece.e)) visit(middleOf(piece.e));
    }
}

Vec2 meanOf(const Chain& chain) {
    const Vec2 origin = chain.pieces.front().e.sp;
    Vec2 sum;
    double count = 0.0;
    visitPoints(chain, [&](Vec2 p) {
        sum = sum + (p - origin);
        count += 1.0;
    });
    return origin + (1.0 / count) * sum;
}

struct Circle {
    Vec2 m;
    double r;
};

Circle leastSquares(const Chain& chain) {
    const Vec2 mean = meanOf(chain);
    double xx = 0.0, xy = 0.0, yy = 0.0, count = 0.0;
    Vec2 moment;
    visitPoints(chain, [&](Vec2 p) {
        const Vec2 q = p - mean;
        xx += q.x * q.x;
        xy += q.x * q.y;
        yy += q.y * q.y;
        moment = moment + dot(q, q) * q;
        count += 1.0;
    });
    const double determinant = 2.0 * (xx * yy - xy * xy);
    const Vec2 m{(moment.x * yy - moment.y * xy) / determinant,
                 (moment.y * xx - moment.x * xy) / determinant};
    return {mean + m, std::sqrt(dot(m, m) + (xx + yy) / count)};
}

/// The end of the radius towards p; p itself when it is there up to rounding.
Vec2 endOfRadius(const Circle& circle, Vec2 p, double rounding) {
    const Vec2 v = p - circle.m;
    const double length = lengthOf(v);
    if (std::fabs(length - circle.r) <= rounding) return p;
    return circle.m + (circle.r / length) * v;
}

/// Sets which elements of the source each half stands for.
void shareSources(const Chain& chain, int winding, std::array<Piece, 2>& halves) {
    const Element& half = halves[0].e;
    std::size_t i = 0;
    while (i + 1 < chain.pieces.size() &&
           winding * cross(half.ep - half.sp, chain.pieces[i].e.ep - half.sp) < 0.0)
        ++i;
    halves[0].last = chain.pieces[i].last;
    halves[1].first = chain.pieces[i].first;
}

int windingAbout(const Chain& chain, Vec2 p) {
    int sum = 0;
    for (const Piece& piece : chain.pieces)
        sum += windingOf(piece.e, p);
    return sum;
}

}  // namespace

std::optional<std::array<Piece, 2>> fitCircle(const Chain& chain, const Limits& limits) {
    if (chain.pieces.size() < 3) return std::nullopt;
    const Circle circle = leastSquares(chain);
    if (!std::isfinite(circle.r)) return std::nullopt;
    const int winding = windingAbout(chain, circle.m);
    if (winding != 1 && winding != -1) return std::nullopt;
    const PieceRun run{chain, limits, 0, chain.pieces.size()};
    const Vec2 sp = endOfRadius(circle, run.first().e.sp, limits.rounding);
    const Vec2 ep = circle.m + (circle.m - sp);
    std::array<Piece, 2> halves{standIn(run, {sp, ep, double(winding)}),
                                standIn(run, {ep, sp, double(winding)})};
    const Ring ring(halves[0].e);
    for (std::size_t i = 0; i < chain.pieces.size(); ++i) {
        if (!ring.holds(chain.pieces[i], run.toleranceOf(i))) return std::nullopt;
    }
    shareSources(chain, winding, halves);
    return halves;
}

}  // namespace gmregion
