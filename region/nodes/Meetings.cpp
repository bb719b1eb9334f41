// SPDX-License-Identifier: MIT
/// @file
/// Where elements meet.
///
/// Every two elements whose boxes, grown by the tolerance, have a point in common are
/// asked. Ends of the one within the tolerance of the other come first; then crossings; then the
/// place where the carriers come nearest, for elements that do not cross. Lines have no such place
/// between ends, so an end finds it.
#include "region/nodes/Meetings.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "region/plane/Apart.h"
#include "region/plane/Crossing.h"
#include "region/plane/ElementBox.h"
#include "region/plane/Nearest.h"

namespace gmregion {

namespace {

/// Crossings at a smaller sine lie where rounding lets them along the elements.
constexpr double kShallow = 1e-4;
constexpr double kAnySine = 2.0;
/// In tolerances: what comes nearer is a near miss.
constexpr double kNear = 4.0;

double squaredLength(Vec2 v) {
    return dot(v, v);
}

double sineBetween(const Carrier& a, const Carrier& b, Vec2 p) {
    return std::fabs(cross(sideOf(a, p).gradient, sideOf(b, p).gradient));
}

}  // namespace

bool Meetings::find(const Strands& strands, double tolerance, const Scope& scope) {
    m_strands = &strands;
    m_tolerance = tolerance;
    m_shallow = scope.care == Care::kThorough ? kAnySine : kShallow;
    m_points.clear();
    m_found.clear();
    m_shallowPoints.clear();
    m_nearMisses.clear();
    m_reach = scope.wantsNearMisses ? 0.5 * kNear * tolerance : tolerance;
    m_turnsBack = false;
    prepare(strands);
    raiseBoxes(scope);
    if (!meetPairs(scope)) return false;
    stopAtShallow(scope.split);
    sortStops();
    return true;
}

bool Meetings::takePair() {
    if (m_pairsLeft == 0) return false;
    --m_pairsLeft;
    return true;
}

/// False when there are more pairs than allowed.
bool Meetings::meetPairs(const Scope& scope) {
    if (scope.split != kNone) {
        return m_boxes.visitPairsWith(m_otherBoxes, [&](std::size_t i, std::size_t j) {
            if (!takePair()) return false;
            meet(static_cast<Index>(i), static_cast<Index>(j) + scope.split);
            return true;
        });
    }
    if (scope.moved) return meetMoved(*scope.moved);
    return m_boxes.visitPairs([&](std::size_t i, std::size_t j) {
        if (!takePair()) return false;
        meet(static_cast<Index>(i), static_cast<Index>(j));
        return true;
    });
}

/// The same for pairs of which one has moved: mostly few have.
bool Meetings::meetMoved(const std::vector<std::uint8_t>& moved) {
    for (std::size_t i = 0; i < moved.size(); ++i) {
        if (moved[i] == 0) continue;
        const bool isAtLimit = m_boxes.anyOverlapping(m_boxes[i], [&](std::size_t j) {
            if (j == i || (j < i && moved[j] != 0)) return false;
            if (!takePair()) return true;
            meet(static_cast<Index>(std::min(i, j)), static_cast<Index>(std::max(i, j)));
            return false;
        });
        if (isAtLimit) return false;
    }
    return true;
}

Vec2 Meetings::vertex(Index v) const {
    const auto& elements = m_strands->elements;
    if (v < elements.size()) return elements[v].sp;
    return elements[m_strands->strands[v - elements.size()].last - 1].ep;
}

/// Numbers the vertices. Ends of open strands are met from the start, and so are both ends of
/// elements shorter than the tolerance.
void Meetings::prepare(const Strands& strands) {
    const std::size_t count = strands.elements.size();
    m_endVertex.resize(count);
    m_carriers.resize(count);
    m_hasCarrier.assign(count, 0);
    m_isMet.assign(count + strands.strands.size(), 0);
    for (std::size_t s = 0; s < strands.strands.size(); ++s) {
        const Strand& strand = strands.strands[s];
        for (Index i = strand.first; i < strand.last; ++i) {
            m_endVertex[i] = i + 1;
            const Element& e = strands.elements[i];
            if (squaredLength(e.ep - e.sp) > m_tolerance * m_tolerance) continue;
            m_isMet[i] = 1;
            m_isMet[i + 1 < strand.last ? i + 1 : strand.first] = 1;
        }
        const Index end = static_cast<Index>(count + s);
        m_endVertex[strand.last - 1] = strand.closed ? strand.first : end;
        if (strand.closed) continue;
        m_isMet[strand.first] = 1;
        m_isMet[end] = 1;
    }
}

void Meetings::raiseBoxes(const Scope& scope) {
    const auto& elements = m_strands->elements;
    const std::size_t split = std::min<std::size_t>(scope.split, elements.size());
    m_boxes.begin(split);
    m_otherBoxes.begin(elements.size() - split);
    for (std::size_t i = 0; i < elements.size(); ++i)
        (i < split ? m_boxes : m_otherBoxes).add(boxAbout(elements[i]).grown(m_reach));
    m_boxes.finish();
    m_otherBoxes.finish();
}

const Carrier& Meetings::carrier(Index element) {
    if (m_hasCarrier[element] == 0) {
        m_carriers[element] = carrierOf(m_strands->elements[element]);
        m_hasCarrier[element] = 1;
    }
    return m_carriers[element];
}

const Box& Meetings::boxOf(Index element) const {
    const std::size_t split = m_boxes.size();
    return element < split ? m_boxes[element] : m_otherBoxes[element - split];
}

void Meetings::meet(Index i, Index j) {
    const StrandElement& a = m_strands->elements[i];
    const StrandElement& b = m_strands->elements[j];
    const bool thenB = m_endVertex[i] == j;
    const bool thenA = m_endVertex[j] == i;
    if ((thenB && a.joined) || (thenA && b.joined)) return;
    if (!thenA && !thenB && areApart(carrier(i), boxOf(i), carrier(j), boxOf(j), m_reach)) return;
    const std::size_t before = m_found.size();
    m_contacts.clear();
    const bool endsOfA = stopAtEnds(i, j);
    const bool endsOfB = stopAtEnds(j, i);
    const bool straight = a.bulge == 0.0 && b.bulge == 0.0;
    const bool backAndForth = a.sp == b.ep && a.ep == b.sp;
    if (backAndForth && (thenA || thenB)) meetBackAndForth(i, j);
    if (backAndForth || (a.sp == b.sp && a.ep == b.ep)) return;
    const bool areDone = straight ? thenA || thenB || (endsOfA && endsOfB) : meetInTwoEnds();
    if (!areDone) meetBetween(i, j, thenA || thenB);
    if (m_found.size() == before) {
        if (m_reach > m_tolerance && !thenA && !thenB) noteNearMiss(i, j);
        return;
    }
    // Neighbours that meet again lie side by side from there to their common end, which is where
    // they turn back.
    if (thenB) m_isMet[j] = 1;
    if (thenA) m_isMet[i] = 1;
}

/// Neighbours with both ends in common that lie side by side need both as nodes.
void Meetings::meetBackAndForth(Index i, Index j) {
    const StrandElement& a = m_strands->elements[i];
    const Vec2 chord = a.ep - a.sp;
    const double apart = 0.5 * std::fabs(a.bulge + m_strands->elements[j].bulge);
    if (apart * apart * squaredLength(chord) > m_tolerance * m_tolerance) return;
    m_turnsBack = m_turnsBack || m_isMet[i] == 0 || m_isMet[j] == 0;
    m_isMet[i] = 1;
    m_isMet[j] = 1;
}

/// Notes where an end of one element comes near another one, or both do between their ends.
void Meetings::noteNearMiss(Index i, Index j) {
    const StrandElement& a = m_strands->elements[i];
    const StrandElement& b = m_strands->elements[j];
    const auto isNearMiss = [&](Vec2 p, const Element& e, const Carrier& c) {
        return squaredLength(nearestOn(e, c, p) - p) <= kNear * kNear * m_tolerance * m_tolerance;
    };
    for (const Vec2 p : {a.sp, a.ep}) {
        if (isNearMiss(p, b, carrier(j))) return m_nearMisses.push_back(p);
    }
    for (const Vec2 p : {b.sp, b.ep}) {
        if (isNearMiss(p, a, carrier(i))) return m_nearMisses.push_back(p);
    }
    const std::optional<Vec2> p = nearestApproach(carrier(i), carrier(j));
    if (p && isNearMiss(*p, a, carrier(i)) && isNearMiss(*p, b, carrier(j)))
        m_nearMisses.push_back(*p);
}

/// Whether ends at two places are on both of two elements. Carriers cross twice at the most: there,
/// or within the tolerance of each other in between, where it says nothing.
bool Meetings::meetInTwoEnds() const {
    return std::any_of(m_contacts.begin(), m_contacts.end(), [&](Vec2 p) {
        return squaredLength(p - m_contacts.front()) > m_tolerance * m_tolerance;
    });
}

/// Lets elements stop where they cross, or where they come nearest.
void Meetings::meetBetween(Index i, Index j, bool areNeighbours) {
    const StrandElement& a = m_strands->elements[i];
    const StrandElement& b = m_strands->elements[j];
    const Carrier& onA = carrier(i);
    const Carrier& onB = carrier(j);
    bool crossed = false;
    for (const Vec2 p : crossings(onA, onB)) {
        if (!spans(a, p) || !spans(b, p)) continue;
        if (!isNear(onA, p) || !isNear(onB, p)) continue;
        crossed = true;
        if (isNearCommonEnd(a, b, p)) continue;
        if (sineBetween(onA, onB, p) < m_shallow)
            m_shallowPoints.push_back(static_cast<Index>(m_points.size()));
        stopBoth(i, j, p);
    }
    if (crossed || areNeighbours) return;
    const std::optional<Vec2> p = nearestApproach(onA, onB);
    if (!p || !isNear(onA, *p) || !isNear(onB, *p)) return;
    const Vec2 gap = nearestOn(a, onA, *p) - nearestOn(b, onB, *p);
    const bool near = squaredLength(gap) <= m_tolerance * m_tolerance;
    if (!near || squaredLength(nearestOn(a, onA, *p) - *p) > m_tolerance * m_tolerance) return;
    m_shallowPoints.push_back(static_cast<Index>(m_points.size()));
    stopBoth(i, j, *p);
    // The place is on neither, so an end near it need not be near the other element.
    for (const Index v : {i, m_endVertex[i], j, m_endVertex[j]}) {
        if (squaredLength(vertex(v) - *p) <= m_tolerance * m_tolerance) m_isMet[v] = 1;
    }
}

/// Crossings of carriers that are nearly the same may lie anywhere.
bool Meetings::isNear(const Carrier& c, Vec2 p) const {
    return isWithin(c, p, m_tolerance);
}

/// Whether a point is an end that both elements have in common, bit by bit, but for the tolerance.
bool Meetings::isNearCommonEnd(const Element& a, const Element& b, Vec2 p) const {
    const double squared = m_tolerance * m_tolerance;
    if ((a.sp == b.sp || a.sp == b.ep) && squaredLength(a.sp - p) <= squared) return true;
    return (a.ep == b.sp || a.ep == b.ep) && squaredLength(a.ep - p) <= squared;
}

/// Lets one element stop at the ends of another that lie on it; answers whether there are any.
bool Meetings::stopAtEnds(Index ends, Index on) {
    const Element& e = m_strands->elements[on];
    const Element& other = m_strands->elements[ends];
    const Box& box = boxOf(on);
    bool any = false;
    for (const bool atEnd : {false, true}) {
        const Vec2 p = atEnd ? other.ep : other.sp;
        if (!box.holds(p)) continue;
        const Index v = atEnd ? m_endVertex[ends] : ends;
        if (isVertexOf(v, on)) continue;
        if (p == e.sp || p == e.ep) {
            m_contacts.push_back(p);
            m_isMet[v] = 1;
            m_isMet[p == e.sp ? on : m_endVertex[on]] = 1;
            any = true;
            continue;
        }
        if (!isNear(carrier(on), p)) continue;
        if (squaredLength(nearestOn(e, carrier(on), p) - p) > m_tolerance * m_tolerance) continue;
        m_isMet[v] = 1;
        m_contacts.push_back(p);
        addStop(on, v, p);
        any = true;
    }
    return any;
}

void Meetings::stopBoth(Index i, Index j, Vec2 p) {
    const Index point = static_cast<Index>(m_isMet.size() + m_points.size());
    m_points.push_back(p);
    addStop(i, point, p);
    addStop(j, point, p);
}

/// Lets whatever comes near a shallow crossing stop there: what runs along one of the two elements
/// may cross the other one far from there, or not at all.
void Meetings::stopAtShallow(Index split) {
    for (const Index number : m_shallowPoints) {
        const Vec2 p = m_points[number];
        const Index point = static_cast<Index>(m_isMet.size()) + number;
        const auto stopHere = [&](std::size_t i) {
            const Element& e = m_strands->elements[i];
            const Vec2 away = nearestOn(e, carrier(static_cast<Index>(i)), p) - p;
            if (squaredLength(away) <= m_tolerance * m_tolerance)
                addStop(static_cast<Index>(i), point, p);
        };
        m_boxes.visitOverlapping({p, p}, stopHere);
        m_otherBoxes.visitOverlapping({p, p}, [&](std::size_t i) { stopHere(i + split); });
    }
}

/// At a point beyond an end the element stops already, at that end: going to the point and back
/// would be a way of its own.
void Meetings::addStop(Index element, Index point, Vec2 p) {
    const double place = placeOn(m_strands->elements[element], p);
    if (place > 0.0 && place < 1.0)
        m_found.push_back({element, point, place});
    else
        m_isMet[place < 0.5 ? element : m_endVertex[element]] = 1;
}

/// By element, then by place: counted into their elements, then sorted within each.
void Meetings::sortStops() {
    const std::size_t count = m_strands->elements.size();
    m_firstStop.assign(count + 2, 0);
    for (const Stop& stop : m_found)
        ++m_firstStop[stop.element + 2];
    for (std::size_t i = 2; i < m_firstStop.size(); ++i)
        m_firstStop[i] += m_firstStop[i - 1];
    m_stops.resize(m_found.size());
    for (const Stop& stop : m_found)
        m_stops[m_firstStop[stop.element + 1]++] = stop;
    for (std::size_t i = 0; i < count; ++i) {
        const auto first = m_stops.begin() + m_firstStop[i];
        const auto last = m_stops.begin() + m_firstStop[i + 1];
        std::sort(first, last, [](const Stop& a, const Stop& b) {
            return a.place < b.place || (a.place == b.place && a.point < b.point);
        });
    }
}

}  // namespace gmregion
