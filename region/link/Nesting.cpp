// SPDX-License-Identifier: MIT
/// @file
/// Nesting by looking left.
///
/// From a loop the look goes to the left, from one element that it meets to the next. The first one
/// of another loop that it meets outside of its own bounds the same region, if that is covered, or
/// the same free place. A hole belongs to the outline that the loop beside it belongs to; that one
/// reaches farther left, so this comes to an end. Both have to agree on whether what lies between
/// them is covered.
#include "region/link/Nesting.h"

#include <algorithm>
#include <cmath>

#include "region/model/Box.h"
#include "region/plane/ElementBox.h"
#include "region/plane/ElementWinding.h"
#include "region/plane/LevelHits.h"

namespace gmregion {

namespace {

/// The boxes of arcs of a smaller bulge are larger than the arcs.
constexpr double kFlat = 0.1;
/// In tolerances: how far beside what it met a look goes on.
constexpr double kStep = 1.0 / 16.0;

}  // namespace

bool Nesting::find(const std::vector<Element>& elements, const std::vector<Index>& ends,
                   const std::vector<double>& areas, double tolerance) {
    m_elements = &elements;
    m_ends = &ends;
    m_areas = &areas;
    m_tolerance = tolerance;
    m_outlineOf.assign(ends.size(), kNone);
    m_beside.assign(ends.size(), kNone);
    if (ends.size() == 1 && areas[0] > 0.0) {
        m_outlineOf[0] = 0;
        return true;
    }
    raiseBoxes();
    for (Index loop = 0; loop < ends.size(); ++loop) {
        if (!place(loop)) return false;
    }
    for (Index loop = 0; loop < ends.size(); ++loop) {
        if (!resolve(loop)) return false;
    }
    return true;
}

void Nesting::raiseBoxes() {
    m_loopOf.resize(m_elements->size());
    m_boxes.begin(m_elements->size());
    for (std::size_t loop = 0, i = 0; loop < m_ends->size(); ++loop) {
        for (; i < (*m_ends)[loop]; ++i) {
            m_loopOf[i] = static_cast<Index>(loop);
            m_boxes.add(boxAbout((*m_elements)[i]));
        }
    }
    m_boxes.finish();
}

Nesting::Sight Nesting::lookLeft(Vec2 from) const {
    Sight sight;
    m_boxes.lookLeft(from, [&](std::size_t i) {
        const LevelHit hit = hitLeftOf((*m_elements)[i], from);
        if (hit.x > sight.x) sight = {static_cast<Index>(i), hit.x, hit.coveredToEast};
        return hit.x;
    });
    return sight;
}

/// How high an element surely reaches, of flat arcs that of their chord.
double Nesting::riseOf(Index element) const {
    const Element& e = (*m_elements)[element];
    if (std::fabs(e.bulge) < kFlat) return std::fabs(e.ep.y - e.sp.y);
    return m_boxes[element].size().y;
}

/// Where a look to the left meets an element for the last time; where it starts if it does not.
double Nesting::lastLeft(const Element& e, Vec2 from) const {
    // An element that turns by half a turn at the most meets a level twice at the most.
    for (int i = 0; i < 2; ++i) {
        const LevelHit hit = hitLeftOf(e, {from.x - kStep * m_tolerance, from.y});
        if (!std::isfinite(hit.x)) break;
        from.x = hit.x;
    }
    return from.x;
}

/// A point right beside a loop's element that reaches far left, from where the look meets it. The
/// element is no level one, unless the whole loop is hardly higher.
Vec2 Nesting::startBeside(Index loop) const {
    const Index first = loop == 0 ? 0 : (*m_ends)[loop - 1];
    const Index last = (*m_ends)[loop];
    double highest = 0.0;
    for (Index i = first; i < last; ++i)
        highest = std::max(highest, riseOf(i));
    const double enough = std::min(2.0 * m_tolerance, 0.5 * highest);
    Vec2 start;
    double left = HUGE_VAL;
    for (Index i = first; i < last; ++i) {
        const Box& box = m_boxes[i];
        if (!(box.low.x < left) || riseOf(i) < enough) continue;
        left = box.low.x;
        start = {box.high.x + m_tolerance, 0.5 * (box.low.y + box.high.y)};
        start.x = lastLeft((*m_elements)[i], start) + kStep * m_tolerance;
    }
    return start;
}

/// Finds the loop beside a loop, and whether both agree on what lies between them.
bool Nesting::place(Index loop) {
    Vec2 from = startBeside(loop);
    m_conflict = from;
    bool isOutside = false;  // whether the look is beside the loop, having met it
    for (;;) {
        const Sight sight = lookLeft(from);
        if (sight.element == kNone) return isOutside && !isHole(loop);
        const Index other = m_loopOf[sight.element];
        if (other == loop) {
            isOutside = sight.coveredToEast != isHole(loop);
        } else if (isOutside) {
            m_beside[loop] = other;
            return sight.coveredToEast == isHole(loop);
        }
        // A tolerance near rounding may be no step at all.
        from.x = std::min(sight.x - kStep * m_tolerance, std::nextafter(sight.x, -HUGE_VAL));
    }
}

/// Follows the loops beside a hole to an outline. Holes may be beside each other.
bool Nesting::resolve(Index loop) {
    Index at = loop;
    std::size_t steps = 0;
    while (m_outlineOf[at] == kNone && isHole(at) && steps++ <= m_ends->size())
        at = m_beside[at];
    Index outline = isHole(at) ? m_outlineOf[at] : at;
    if (outline == kNone) outline = outlineAbout(loop);
    if (outline == kNone) {
        m_conflict = startBeside(loop);
        return false;
    }
    for (Index i = loop; m_outlineOf[i] == kNone; i = m_beside[i]) {
        m_outlineOf[i] = outline;
        if (!isHole(i)) break;
    }
    return true;
}

/// The smallest outline that runs round a loop, by winding numbers; kNone when there is none.
Index Nesting::outlineAbout(Index loop) {
    const Vec2 p = startBeside(loop);
    m_winding.assign(m_ends->size(), 0);
    for (std::size_t i = 0; i < m_elements->size(); ++i)
        m_winding[m_loopOf[i]] += windingOf((*m_elements)[i], p);
    Index outline = kNone;
    for (Index other = 0; other < m_ends->size(); ++other) {
        if (other == loop || m_winding[other] <= 0) continue;
        if (outline == kNone || (*m_areas)[other] < (*m_areas)[outline]) outline = other;
    }
    return outline;
}

}  // namespace gmregion
