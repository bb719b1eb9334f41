// SPDX-License-Identifier: MIT
/// @file
/// Paths that are drawn twice.
///
/// Copies have the same box, so only paths whose boxes have near middles are compared, found by a
/// grid; then element by element, from every start where they are closed. Paths over the same
/// course with other joints are no copies, nor are those that overlap in part. Cost: linear in the
/// elements, but for many closed paths about one middle.

#include "drawing/contours/Duplicates.h"

#include <algorithm>
#include <cmath>

#include "region/model/Box.h"
#include "region/search/PointGrid.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Box;
using gmregion::Element;
using gmregion::isArc;
using gmregion::kKernelTolerance;
using gmregion::PointGrid;
using gmregion::Vec2;

namespace {

bool isSame(Vec2 a, Vec2 b) {
    return distance(a, b) < kKernelTolerance;
}

bool isSame(const Element& a, const Element& b) {
    return isSame(a.sp, b.sp) && isSame(a.ep, b.ep) && isSame(halvingPoint(a), halvingPoint(b));
}

/// Two halves of one circle: closed, so the ends meet, and both half circles turn the same way.
bool isCircle(const Path& path) {
    if (!path.closed || path.elements.size() != 2) return false;
    const Element& first = path.elements[0];
    const Element& second = path.elements[1];
    return isArc(first) && isArc(second) && first.bulge * second.bulge > 0.0 &&
           isSame(centre(first), centre(second));
}

bool isSameCircle(const Path& a, const Path& b) {
    const Element& first = a.elements.front();
    const Element& second = b.elements.front();
    return isSame(centre(first), centre(second)) &&
           std::abs(radius(first) - radius(second)) < kKernelTolerance;
}

bool matchesFrom(const Path& a, const Path& b, std::size_t start) {
    const std::size_t count = a.elements.size();
    for (std::size_t i = 0; i < count; ++i) {
        if (!isSame(a.elements[i], b.elements[(start + i) % count])) return false;
    }
    return true;
}

bool runsLike(const Path& a, const Path& b) {
    const std::size_t starts = a.closed ? b.elements.size() : 1;
    for (std::size_t start = 0; start < starts; ++start) {
        if (matchesFrom(a, b, start)) return true;
    }
    return false;
}

bool isDuplicate(const Path& a, const Path& b) {
    if (a.closed != b.closed || a.elements.size() != b.elements.size() || a.layer != b.layer) {
        return false;
    }
    if (isCircle(a) && isCircle(b)) return isSameCircle(a, b);
    return runsLike(a, b) || runsLike(reversed(a), b);
}

}  // namespace

std::size_t dropDuplicates(std::vector<Path>& paths) {
    // Copies of a path have the same middle of their box, so only near middles are compared.
    PointGrid middles(kKernelTolerance);
    std::vector<Path> kept;
    for (Path& path : paths) {
        const Box box = boundingBox(path);
        const Vec2 key = middle(box.low, box.high);
        bool duplicate = false;
        middles.visitNear(
            key, [&](std::size_t i) { duplicate = duplicate || isDuplicate(path, kept[i]); });
        if (duplicate) continue;
        middles.add(key, kept.size());
        kept.push_back(std::move(path));
    }
    const std::size_t dropped = paths.size() - kept.size();
    paths = std::move(kept);
    return dropped;
}

}  // namespace gmdrawing
