// SPDX-License-Identifier: MIT
#include "part/model/Path.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace gmpart {

namespace {

/// Arcs that turn further than this are halved.
constexpr double kMaxSweep = 300.0 / 180.0 * kPi;

Vec2 pointAt(Vec2 m, double r, double angle) {
    return m + r * Vec2{std::cos(angle), std::sin(angle)};
}

void meet(Element& before, Element& after) {
    if (before.ep == after.sp) return;
    const Vec2 joint = middle(before.ep, after.sp);
    before = withEnds(before, before.sp, joint);
    after = withEnds(after, joint, after.ep);
}

}  // namespace

std::size_t arcCount(const Path& path) {
    return static_cast<std::size_t>(
        std::count_if(path.elements.begin(), path.elements.end(), gmregion::isArc));
}

double length(const Path& path) {
    double sum = 0.0;
    for (const Element& e : path.elements)
        sum += length(e);
    return sum;
}

const Element& longestElement(const Path& path) {
    return *std::max_element(
        path.elements.begin(), path.elements.end(),
        [](const Element& a, const Element& b) { return length(a) < length(b); });
}

Box boundingBox(const Path& path) {
    Box box;
    for (const Element& e : path.elements)
        box.include(boundingBox(e));
    return box;
}

Path reversed(const Path& path) {
    Path result = path;
    std::reverse(result.elements.begin(), result.elements.end());
    for (Element& e : result.elements)
        e = reversed(e);
    return result;
}

double distance(const Path& path, Vec2 p) {
    double nearest = std::numeric_limits<double>::infinity();
    for (const Element& e : path.elements)
        nearest = std::min(nearest, distance(e, p));
    return nearest;
}

void appendArc(std::vector<Element>& elements, Vec2 m, double r, double startAngle, double sweep) {
    const Vec2 sp = pointAt(m, r, startAngle);
    const bool fullCircle = std::abs(sweep) == 2.0 * kPi;
    const Vec2 ep = fullCircle ? sp : pointAt(m, r, startAngle + sweep);
    if (std::abs(sweep) <= kMaxSweep) {
        elements.push_back({sp, ep, std::tan(0.25 * sweep)});
        return;
    }
    const Vec2 half = fullCircle ? 2.0 * m - sp : pointAt(m, r, startAngle + 0.5 * sweep);
    const double bulge = std::tan(0.125 * sweep);
    elements.push_back({sp, half, bulge});
    elements.push_back({half, ep, bulge});
}

void appendBulge(std::vector<Element>& elements, const Element& e) {
    if (e.sp == e.ep) {
        elements.push_back({e.sp, e.ep, 0.0});
        return;
    }
    if (std::abs(sweep(e)) <= kMaxSweep) {
        elements.push_back(e);
        return;
    }
    const Vec2 half = halvingPoint(e);
    const double halfBulge = std::tan(0.5 * std::atan(e.bulge));
    elements.push_back({e.sp, half, halfBulge});
    elements.push_back({half, e.ep, halfBulge});
}

void meetEnds(Path& path) {
    for (std::size_t i = 0; i + 1 < path.elements.size(); ++i) {
        meet(path.elements[i], path.elements[i + 1]);
    }
    if (!path.closed || path.elements.empty()) return;
    if (path.elements.size() > 1) {
        meet(path.elements.back(), path.elements.front());
    } else {
        Element& only = path.elements.front();
        const Vec2 joint = middle(only.sp, only.ep);
        only = withEnds(only, joint, joint);
    }
}

}  // namespace gmpart
