// SPDX-License-Identifier: MIT
/// @file
/// Where a distance is passed.
///
/// The points at one distance from a piece lie on its parallels to both sides and on the circles
/// about its ends. An element crosses them where its distance from the piece passes that value, and
/// maybe elsewhere; so between two crossings with the curves of all pieces no distance passes it,
/// and one point of a part answers for the whole part. A cut too many costs nothing but time.
#include "region/verify/Cuts.h"

#include <algorithm>

#include "region/plane/Crossing.h"
#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

/// For rounding, in reaches.
constexpr double kSlack = 1e-6;

}  // namespace

void Cuts::begin(const Element& e) {
    m_element = e;
    m_carrier = carrierOf(e);
    m_middle = middleOf(e);
    const Vec2 reach = e.ep - m_middle;
    m_reach = (1.0 + kSlack) * std::sqrt(dot(reach, reach));
    m_cuts.clear();
    m_cuts.push_back({0.0, e.sp});
    m_cuts.push_back({1.0, e.ep});
}

void Cuts::cut(const BoundaryPiece& piece, double reach) {
    if (!(reach > 0.0)) return;
    for (const double side : {reach, -reach}) {
        if (const auto beside = parallel(piece.carrier, side)) cutAt(*beside);
    }
    // The end of every piece is the start of another one.
    cutAt({piece.sp + Vec2{reach, 0.0}, {-1.0, 0.0}, 1.0 / reach});
}

void Cuts::cutAt(const Carrier& c) {
    // No point of the element is farther from its middle than its ends.
    if (!isWithin(c, m_middle, m_reach)) return;
    for (const Vec2 crossing : crossings(m_carrier, c)) {
        // Where both run along each other crossings are anywhere; on the element they do no harm.
        // The foot from far away is rounded, its own foot is not.
        const Vec2 p = footOn(m_carrier, footOn(m_carrier, crossing));
        const double place = placeOn(m_element, p);
        if (place > 0.0 && place < 1.0) m_cuts.push_back({place, p});
    }
}

void Cuts::sortCuts() {
    std::sort(m_cuts.begin(), m_cuts.end(),
              [](const Cut& a, const Cut& b) { return a.place < b.place; });
}

/// The middle of the part between two points of the element.
Vec2 Cuts::between(Vec2 a, Vec2 b) const {
    if (m_element.bulge == 0.0) return middle(a, b);
    return middleOf({a, b, bulgeBetween(m_carrier, a, b)});
}

}  // namespace gmregion
