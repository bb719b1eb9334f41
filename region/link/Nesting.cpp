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
#include <array>
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
/// The heights of looks, one after the other, in parts of the height of the element begun from.
constexpr std::array<double, 7> kShares{0.5, 0.382, 0.618, 0.236, 0.764, 0.146, 0.854};

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

/// The heights that an element surely passes.
Nesting::Heights Nesting::heightsOf(Index element) const {
    const Element& e = (*m_elements)[element];
    const Box& box = m_boxes[element];
    if (e.bulge == 0.0 || std::fabs(e.bulge) >= kFlat) return {box.low.y, box.high.y};
    const double middle = middleOf(e).y;
    return {std::min({e.sp.y, e.ep.y, middle}), std::max({e.sp.y, e.ep.y, middle})};
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

/// A point right beside a loop's element that reaches far left, from where the look meets it, at a
/// share of its height. The element is no level one, unless the whole loop is hardly higher.
Vec2 Nesting::startBeside(Index loop, double share) const {
    const Index first = loop == 0 ? 0 : (*m_ends)[loop - 1];
    const Index last = (*m_ends)[loop];
    double highest = 0.0;
    for (Index i = first; i < last; ++i)
        highest = std::max(highest, heightsOf(i).rise());
    const double enough = std::min(2.0 * m_tolerance, 0.5 * highest);
    Index farthest = first;
    double left = HUGE_VAL;
    for (Index i = first; i < last; ++i) {
        const Box& box = m_boxes[i];
        if (!(box.low.x < left) || heightsOf(i).rise() < enough) continue;
        left = box.low.x;
        farthest = i;
    }
    const Heights heights = heightsOf(farthest);
    Vec2 start{m_boxes[farthest].high.x + m_tolerance, heights.low + share * heights.rise()};
    start.x = lastLeft((*m_elements)[farthest], start) + kStep * m_tolerance;
    return start;
}

/// Finds the loop beside a loop. Where another loop touches it at the height of the look, the order
/// in which both are met says nothing; then the look is at another height.
bool Nesting::place(Index loop) {
    return std::any_of(kShares.begin(), kShares.end(),
                       [&](double share) { return placeFrom(loop, startBeside(loop, share)); });
}

/// Whether a look from there tells the loop beside a loop, and both agree on what lies between
/// them.
bool Nesting::placeFrom(Index loop, Vec2 from) {
    m_conflict = from;
    bool isOutside = false;  // whether the look is beside the loop, having met it
    double own = HUGE_VAL;   // where it met the loop last
    for (;;) {
        const Sight sight = lookLeft(from);
        if (sight.element == kNone) return isOutside && !isHole(loop);
        const Index other = m_loopOf[sight.element];
        if (other == loop) {
            isOutside = sight.coveredToEast != isHole(loop);
            own = sight.x;
        } else if (isOutside) {
            m_beside[loop] = other;
            return own - sight.x > m_tolerance && sight.coveredToEast == isHole(loop);
        }
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
        m_conflict = startBeside(loop, kShares.front());
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
    const Vec2 p = startBeside(loop, kShares.front());
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
