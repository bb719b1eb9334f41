// SPDX-License-Identifier: MIT
/// @file
/// The distance between two elements.
///
/// Where they do not cross, the shortest way between them starts at an end, or it is square to both
/// of them: then it goes through the centre of each that is an arc. All these ways and the
/// crossings are compared; each is between points of both, so none can be too short.

#include "region/plane/ElementDistance.h"

#include <cmath>

#include "region/plane/Crossing.h"
#include "region/plane/Nearest.h"

namespace gmregion {

namespace {

struct Operand {
    const Element& element;
    const Carrier& carrier;
};

class ShortestWay {
public:
    ShortestWay(const Operand& a, const Operand& b) : m_a(a), m_b(b) {}

    /// Where they cross. Of lines that are parallel but for rounding a crossing may be anywhere, so
    /// both are asked for their own points there.
    void crossing() {
        for (const Vec2 p : crossings(m_a.element, m_b.element)) {
            consider(nearestOn(m_a.element, m_a.carrier, p),
                     nearestOn(m_b.element, m_b.carrier, p));
        }
    }
    void fromFirst(Vec2 p) { consider(p, nearestOn(m_b.element, m_b.carrier, p)); }
    void fromSecond(Vec2 p) { consider(nearestOn(m_a.element, m_a.carrier, p), p); }

    /// The ways through the centre of the first, an arc, that are square to the second.
    void throughCentre() {
        if (m_a.carrier.curvature == 0.0) return;
        const Vec2 centre = m_a.carrier.at + 1.0 / m_a.carrier.curvature * m_a.carrier.normal;
        const Vec2 foot = footOn(m_b.carrier, centre);
        const Vec2 nearFoot = footOn(m_b.carrier, foot);
        considerFoot(nearFoot);
        if (m_b.carrier.curvature != 0.0) considerFoot(oppositeOf(nearFoot));
    }

    const Approach& best() const { return m_best; }

private:
    /// The other end of the diameter of the second.
    Vec2 oppositeOf(Vec2 p) const {
        const Vec2 centre = m_b.carrier.at + 1.0 / m_b.carrier.curvature * m_b.carrier.normal;
        return centre + (centre - p);
    }
    void considerFoot(Vec2 p) {
        if (spans(m_b.element, p)) fromSecond(p);
    }
    void consider(Vec2 p, Vec2 q) {
        const double found = std::sqrt(dot(q - p, q - p));
        if (found < m_best.distance) m_best = {p, q, found};
    }

    Operand m_a;
    Operand m_b;
    Approach m_best{{}, {}, HUGE_VAL};
};

}  // namespace

Approach nearestBetween(const Element& a, const Carrier& carrierA, const Element& b,
                        const Carrier& carrierB) {
    ShortestWay way({a, carrierA}, {b, carrierB});
    way.crossing();
    for (const Vec2 p : {a.sp, a.ep})
        way.fromFirst(p);
    for (const Vec2 p : {b.sp, b.ep})
        way.fromSecond(p);
    way.throughCentre();
    if (carrierA.curvature == 0.0 && carrierB.curvature != 0.0) {
        ShortestWay swapped({b, carrierB}, {a, carrierA});
        swapped.throughCentre();
        const Approach& found = swapped.best();
        if (found.distance < way.best().distance) {
            return {found.onSecond, found.onFirst, found.distance};
        }
    }
    return way.best();
}

}  // namespace gmregion
