// SPDX-License-Identifier: MIT
#include "region/offset/OffsetSource.h"

#include <algorithm>
#include <cmath>

#include "region/plane/Crossing.h"
#include "region/plane/ElementBox.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/Measures.h"

namespace gmregion {

namespace {

double squared(Vec2 v) {
    return dot(v, v);
}

double squaredDistance(const Element& segment, Vec2 p) {
    const Vec2 along = segment.ep - segment.sp;
    const Vec2 fromStart = p - segment.sp;
    const double place = dot(along, fromStart);
    const double whole = squared(along);
    if (place <= 0.0) return squared(fromStart);
    if (place >= whole) return squared(p - segment.ep);
    const double side = cross(along, fromStart);
    return side * side / whole;
}

/// The distance of a point from an element, if that is below a limit; else the limit.
double distanceFrom(const SourceElement& e, Vec2 p, double limit) {
    if (e.bulge == 0.0) {
        const double found = squaredDistance(e, p);
        return found < limit * limit ? std::sqrt(found) : limit;
    }
    const Carrier carrier = e.carrier();
    if (!isWithin(carrier, p, limit)) return limit;
    if (spans(e, footOn(carrier, p))) return std::min(limit, std::fabs(signedDistance(carrier, p)));
    return std::min(limit, std::sqrt(std::min(squared(p - e.sp), squared(p - e.ep))));
}

Box about(Vec2 p, double distance) {
    return {{p.x - distance, p.y - distance}, {p.x + distance, p.y + distance}};
}

}  // namespace

void OffsetSource::clear() {
    m_elements.clear();
    m_loopEnds.clear();
    m_isThereAndBack.clear();
}

void OffsetSource::take(const RegionSet& set) {
    clear();
    m_elements.reserve(set.elements().size());
    for (const Loop& loop : set.loops()) {
        for (Index i = loop.first; i < loop.last; ++i)
            append(set.elements()[i], i);
        endLoop(false);
    }
    finish();
}

void OffsetSource::take(const Strands& paths) {
    clear();
    for (const Strand& path : paths.strands) {
        for (Index i = path.first; i < path.last; ++i)
            append(paths.elements[i], paths.elements[i].tag);
        if (path.closed) endLoop(false);
        for (Index i = path.last; i-- > path.first;) {
            const StrandElement& e = paths.elements[i];
            append({e.ep, e.sp, -e.bulge}, e.tag);
        }
        endLoop(!path.closed);
    }
    finish();
}

void OffsetSource::append(const Element& whole, Index owner) {
    visitHalves(whole, [&](const Element& e) {
        if (e.sp == e.ep) return;
        SourceElement s;
        static_cast<Element&>(s) = e;
        const Carrier carrier = carrierOf(e);
        s.startNormal = carrier.normal;
        s.curvature = carrier.curvature;
        s.endNormal = carrier.normal - carrier.curvature * (e.ep - e.sp);
        s.owner = owner;
        m_elements.push_back(s);
    });
}

void OffsetSource::endLoop(bool isThereAndBack) {
    const Index end = static_cast<Index>(m_elements.size());
    if (end == (m_loopEnds.empty() ? 0 : m_loopEnds.back())) return;
    m_loopEnds.push_back(end);
    m_isThereAndBack.push_back(isThereAndBack ? 1 : 0);
}

void OffsetSource::finish() {
    m_boxes.begin(m_elements.size());
    for (const SourceElement& e : m_elements)
        m_boxes.add(boxAbout(e));
    m_boxes.finish();
    m_area = 0.0;
    m_length = 0.0;
    const Vec2 about = m_elements.empty() ? Vec2{} : m_elements.front().sp;
    for (const SourceElement& e : m_elements) {
        m_area += 0.5 * sweptTwice(e, about);
        m_length += std::sqrt(squared(e.ep - e.sp)) * (1.0 + e.bulge * e.bulge);
    }
}

double OffsetSource::distanceBelow(Vec2 p, double limit, double nearEnough, Index& guess) const {
    double nearest = limit;
    if (guess < m_elements.size()) nearest = distanceFrom(m_elements[guess], p, limit);
    if (nearest < nearEnough) return nearest;
    m_boxes.anyOverlapping(about(p, nearest), [&](std::size_t i) {
        nearest = distanceFrom(m_elements[i], p, nearest);
        if (!(nearest < nearEnough)) return false;
        guess = static_cast<Index>(i);
        return true;
    });
    return nearest;
}

}  // namespace gmregion
