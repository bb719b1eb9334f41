// SPDX-License-Identifier: MIT
/// @file
/// Raw parallels.
///
/// The exact boundary of an offset is a part of the parallels of the elements and of the arcs about
/// corners that are convex on that side; the rest of them lies nearer to the source than the
/// distance. An arc whose radius is not above the distance has no parallel on its inner side that
/// could belong to it, since all of that is nearer to other points of the arc.
///
/// Where two neighbours are nearly tangent, as rounded coordinates make them, the ends of their
/// parallels miss each other by the distance times the bend, far above any tolerance, while the
/// parallels themselves come as near as the square of the bend. If the middle of both ends lies
/// within half a tolerance of both parallels, both end there; arcs keep their circles.
///
/// At a concave corner the end of each parallel is nearer to the other element than the distance,
/// and so is everything from there to where the parallels cross.
#include "region/offset/RawParallels.h"

#include <algorithm>
#include <cmath>

#include "region/offset/Corners.h"
#include "region/plane/Crossing.h"

namespace gmregion {

namespace {

double squared(Vec2 v) {
    return dot(v, v);
}

}  // namespace

void RawParallels::make(const OffsetSource& source, double distance, double tolerance, bool trims,
                        Strands& strands) {
    m_distance = distance;
    m_tolerance = tolerance;
    m_trims = trims;
    m_sweptArea = 0.0;
    m_source = source.elements().data();
    m_madeOf.clear();
    strands.clear();
    Index first = 0;
    for (const Index last : source.loopEnds()) {
        makeLoop(source.elements().data() + first, last - first, strands);
        first = last;
    }
}

void RawParallels::makeLoop(const SourceElement* first, std::size_t count, Strands& strands) {
    m_parallels.clear();
    m_parallels.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        m_parallels.push_back(parallelOf(first[i]));
        const double chord = std::sqrt(squared(first[i].ep - first[i].sp));
        const double growth = 1.0 + first[i].curvature * m_distance;
        m_sweptArea += chord * (1.0 + first[i].bulge * first[i].bulge) * std::fabs(m_distance) *
                       std::max(1.0, 0.5 * (1.0 + growth));
    }
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t next = i + 1 < count ? i + 1 : 0;
        m_parallels[i].joint = join(first[i], first[next], m_parallels[i], m_parallels[next]);
    }
    emit(first, count, strands);
}

RawParallels::Parallel RawParallels::parallelOf(const SourceElement& e) const {
    Parallel p;
    const double growth = 1.0 + e.curvature * m_distance;
    p.sp = e.sp - m_distance * e.startNormal;
    p.ep = e.ep - m_distance * e.endNormal;
    p.bulge = e.bulge;
    p.exists = growth > 0.0;
    p.joint = Joint::kGap;
    p.carrier = {p.sp, e.startNormal, p.exists ? e.curvature / growth : 0.0};
    if (squared(p.ep - p.sp) > 0.25 * m_tolerance * m_tolerance || e.bulge == 0.0) return p;
    // An arc whose radius is the distance: a point within the tolerance.
    p.exists = p.sp != p.ep;
    p.bulge = 0.0;
    p.carrier.curvature = 0.0;
    return p;
}

RawParallels::Joint RawParallels::join(const SourceElement& before, const SourceElement& after,
                                       Parallel& a, Parallel& b) const {
    const bool both = a.exists && b.exists;
    if (both && (a.ep == b.sp || meetInMiddle(a, b))) return Joint::kJoined;
    if (opensTo(before, after, m_distance)) return Joint::kCorner;
    if (both && m_trims && trimToCrossing(a, b)) return Joint::kJoined;
    return Joint::kGap;
}

/// Lets two parallels end half way between their ends, if that is near enough to both.
bool RawParallels::meetInMiddle(Parallel& a, Parallel& b) const {
    const Vec2 m = middle(a.ep, b.sp);
    const double limit = 0.5 * m_tolerance;
    if (std::fabs(signedDistance(a.carrier, m)) > limit) return false;
    if (std::fabs(signedDistance(b.carrier, m)) > limit) return false;
    a.ep = m;
    b.sp = m;
    a.bulge = bulgeBetween(a.carrier, a.sp, a.ep);
    b.bulge = bulgeBetween(b.carrier, b.sp, b.ep);
    return true;
}

/// Lets two parallels end where they cross, if they do so once.
bool RawParallels::trimToCrossing(Parallel& a, Parallel& b) const {
    Vec2 crossing;
    int count = 0;
    for (const Vec2 p : crossings(a.carrier, b.carrier)) {
        const double onA = placeOn(a, p);
        const double onB = placeOn(b, p);
        if (!(onA > 0.0 && onA < 1.0 && onB > 0.0 && onB < 1.0)) continue;
        if (std::fabs(signedDistance(a.carrier, p)) > m_tolerance) continue;
        if (std::fabs(signedDistance(b.carrier, p)) > m_tolerance) continue;
        crossing = p;
        ++count;
    }
    if (count != 1) return false;
    a.ep = crossing;
    b.sp = crossing;
    a.bulge = bulgeBetween(a.carrier, a.sp, a.ep);
    b.bulge = bulgeBetween(b.carrier, b.sp, b.ep);
    return true;
}

Element RawParallels::cornerArc(const SourceElement& before, const SourceElement& after) const {
    const double bulge = bulgeOfTurn(before.endNormal, after.startNormal, m_distance > 0.0);
    return {before.ep - m_distance * before.endNormal, after.sp - m_distance * after.startNormal,
            bulge};
}

/// Room for the parallels in hand and their corner arcs, and no more where that is all there is.
void RawParallels::makeRoom(Strands& strands) const {
    std::size_t needed = strands.elements.size();
    for (const Parallel& p : m_parallels)
        needed += (p.exists ? 1U : 0U) + (p.joint == Joint::kCorner ? 1U : 0U);
    const std::size_t capacity = strands.elements.capacity();
    if (needed > capacity) strands.elements.reserve(std::max(needed, 2 * capacity));
}

/// Lists the parallels of a loop and its corner arcs, and ends its strands.
void RawParallels::emit(const SourceElement* first, std::size_t count, Strands& strands) {
    const Index begin = static_cast<Index>(strands.elements.size());
    makeRoom(strands);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t next = i + 1 < count ? i + 1 : 0;
        const Parallel& p = m_parallels[i];
        if (p.exists) {
            emitElement(p, first[i], OriginKind::kParallel, p.joint != Joint::kGap, strands);
        }
        if (p.joint != Joint::kCorner) continue;
        const Element arc = cornerArc(first[i], first[next]);
        m_sweptArea += 2.0 * std::fabs(arc.bulge) * m_distance * m_distance;
        emitElement(arc, first[i], OriginKind::kCorner, m_parallels[next].exists, strands);
    }
    endStrands(begin, strands);
}

void RawParallels::emitElement(const Element& e, const SourceElement& of, OriginKind kind,
                               bool goesOn, Strands& strands) {
    StrandElement s;
    static_cast<Element&>(s) = e;
    s.tag = m_madeOf.add(static_cast<Index>(&of - m_source), of.owner, kind);
    s.joined = goesOn;
    strands.elements.push_back(s);
}

double RawParallels::ownDistance(const OffsetSource& source, Index tag, Vec2 p) const {
    const SourceElement& e = source.elements()[m_madeOf.sources[tag]];
    if (m_madeOf.kinds[tag] == OriginKind::kCorner) return std::sqrt(squared(p - e.ep));
    return std::fabs(signedDistance(e.carrier(), p));
}

/// Makes strands of the loop's elements: one that is closed where all of them go on, else those
/// between the gaps.
void RawParallels::endStrands(Index begin, Strands& strands) {
    const auto first = strands.elements.begin() + begin;
    const auto last = strands.elements.end();
    if (first == last) return;
    const auto isGap = [](const StrandElement& e) { return !e.joined; };
    const auto gap = std::find_if(first, last, isGap);
    if (gap == last) {
        strands.strands.push_back(
            {begin, static_cast<Index>(strands.elements.size()), true, {1, 0}});
        return;
    }
    std::rotate(first, gap + 1, last);
    Index from = begin;
    for (Index i = begin; i < strands.elements.size(); ++i) {
        if (strands.elements[i].joined) continue;
        strands.strands.push_back({from, i + 1, false, {1, 0}});
        from = i + 1;
    }
}

}  // namespace gmregion
