// SPDX-License-Identifier: MIT
/// @file
/// Where elements meet.
///
/// Every two elements whose boxes, grown by half the tolerance each, have a point in common are
/// asked. Ends of the one within the tolerance of the other come first; then crossings; then the
/// place where the carriers come nearest, for elements that do not cross. Lines have no such place
/// between ends, so an end finds it.
#include "region/nodes/Meetings.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "region/plane/Crossing.h"
#include "region/plane/ElementBox.h"
#include "region/plane/Nearest.h"

namespace gmregion {

namespace {

double squaredLength(Vec2 v) {
    return dot(v, v);
}

}  // namespace

void Meetings::find(const Strands& strands, double tolerance, const Scope& scope) {
    m_strands = &strands;
    m_tolerance = tolerance;
    m_points.clear();
    m_found.clear();
    prepare(strands);
    raiseBoxes(scope);
    if (scope.split != kNone) {
        m_boxes.visitPairsWith(m_otherBoxes, [&](std::size_t i, std::size_t j) {
            meet(static_cast<Index>(i), static_cast<Index>(j) + scope.split);
        });
    } else {
        m_boxes.visitPairs([&](std::size_t i, std::size_t j) {
            if (scope.moved && (*scope.moved)[i] == 0 && (*scope.moved)[j] == 0) return;
            meet(static_cast<Index>(i), static_cast<Index>(j));
        });
    }
    sortStops();
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
        (i < split ? m_boxes : m_otherBoxes).add(boxAbout(elements[i]).grown(0.5 * m_tolerance));
    m_boxes.finish();
    m_otherBoxes.finish();
}

void Meetings::meet(Index i, Index j) {
    const StrandElement& a = m_strands->elements[i];
    const StrandElement& b = m_strands->elements[j];
    const bool thenB = m_endVertex[i] == j;
    const bool thenA = m_endVertex[j] == i;
    if ((thenB && a.joined) || (thenA && b.joined)) return;
    const bool endsOfA = stopAtEnds(i, j);
    const bool endsOfB = stopAtEnds(j, i);
    if (a.bulge == 0.0 && b.bulge == 0.0 && (thenA || thenB || (endsOfA && endsOfB))) return;
    const Carrier onA = carrierOf(a);
    const Carrier onB = carrierOf(b);
    bool crossed = false;
    for (const Vec2 p : crossings(onA, onB)) {
        const double placeOnA = placeOn(a, p);
        const double placeOnB = placeOn(b, p);
        if (placeOnA < 0.0 || placeOnA > 1.0 || placeOnB < 0.0 || placeOnB > 1.0) continue;
        crossed = true;
        if (!isNearCommonEnd(i, j, p)) stopBoth(i, j, p);
    }
    if (crossed || thenA || thenB) return;
    const std::optional<Vec2> p = nearestApproach(onA, onB);
    if (!p) return;
    const Vec2 gap = nearestOn(a, onA, *p) - nearestOn(b, onB, *p);
    const bool near = squaredLength(gap) <= m_tolerance * m_tolerance;
    if (near && squaredLength(nearestOn(a, onA, *p) - *p) <= m_tolerance * m_tolerance)
        stopBoth(i, j, *p);
}

bool Meetings::isNearCommonEnd(Index i, Index j, Vec2 p) const {
    const double squared = m_tolerance * m_tolerance;
    if (m_endVertex[i] == j && squaredLength(vertex(j) - p) <= squared) return true;
    return m_endVertex[j] == i && squaredLength(vertex(i) - p) <= squared;
}

/// Lets one element stop at the ends of another that lie on it; answers whether there are any.
bool Meetings::stopAtEnds(Index ends, Index on) {
    const Element& e = m_strands->elements[on];
    const Element& other = m_strands->elements[ends];
    const Box box = boxAbout(e).grown(m_tolerance);
    bool any = false;
    for (const bool atEnd : {false, true}) {
        const Vec2 p = atEnd ? other.ep : other.sp;
        if (!box.holds(p)) continue;
        const Index v = atEnd ? m_endVertex[ends] : ends;
        if (isVertexOf(v, on)) continue;
        if (squaredLength(nearestOn(e, carrierOf(e), p) - p) > m_tolerance * m_tolerance) continue;
        m_isMet[v] = 1;
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

/// A point beside an end comes between the start and the end, too.
void Meetings::addStop(Index element, Index point, Vec2 p) {
    const double place = placeOn(m_strands->elements[element], p);
    m_found.push_back({element, point, std::clamp(place, 0.0, 1.0)});
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
