// SPDX-License-Identifier: MIT
#include "region/simplify/Writer.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "region/plane/Carrier.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

/// The bulge of three quarters of a turn, 1 + sqrt(2), rounded up.
constexpr double kWidestBulge = 2.4142135625;

bool areHalvesOfOne(const Piece& a, const Piece& b) {
    return a.part == Part::kFirstHalf && b.part == Part::kSecondHalf && a.first == b.first;
}

/// The bulge of two arcs that follow each other on one circle, by the tangent of a sum; that of no
/// arc where it is not above half a turn.
double bulgeOfBoth(const Element& a, const Element& b) {
    return (a.bulge + b.bulge) / (1.0 - a.bulge * b.bulge);
}

/// Whether two arcs are one of more than half a turn; up to that they were tried already.
bool areOneArc(const Element& a, const Element& b, double rounding) {
    const double bulge = bulgeOfBoth(a, b);
    const bool isWide = std::fabs(bulge) > 1.0 && std::fabs(bulge) <= kWidestBulge;
    if (!isWide || (a.bulge > 0.0) != (b.bulge > 0.0) || (bulge > 0.0) != (a.bulge > 0.0))
        return false;
    const Carrier c = carrierOf(std::fabs(a.bulge) > std::fabs(b.bulge) ? a : b);
    const std::array<Vec2, 4> points{a.sp, middleOf(a), middleOf(b), b.ep};
    return std::all_of(points.begin(), points.end(),
                       [&](Vec2 p) { return std::fabs(signedDistance(c, p)) <= rounding; });
}

}  // namespace

void writePath(const std::vector<Piece>& pieces, bool closed, std::int64_t id, const Limits& limits,
               std::vector<Element>& elements, Simplified& result) {
    elements.clear();
    const bool isWholeCircle = closed && pieces.size() == 2;
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        const Piece& piece = pieces[i];
        if (i + 1 < pieces.size() && areHalvesOfOne(piece, pieces[i + 1])) {
            elements.push_back({piece.e.sp, pieces[i + 1].e.ep, piece.wholeBulge});
            result.sources.push_back({piece.first, pieces[++i].last});
        } else if (!isWholeCircle && !elements.empty() &&
                   areOneArc(elements.back(), piece.e, limits.rounding)) {
            Element& before = elements.back();
            before = {before.sp, piece.e.ep, bulgeOfBoth(before, piece.e)};
            result.sources.back().last = piece.last;
        } else {
            elements.push_back(piece.e);
            result.sources.push_back({piece.first, piece.last});
        }
    }
    result.paths.add(elements, closed, id);
}

}  // namespace gmregion
