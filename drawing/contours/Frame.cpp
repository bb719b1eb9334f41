// SPDX-License-Identifier: MIT
#include "drawing/contours/Frame.h"

#include <algorithm>

namespace gmdrawing {

using gmpart::boundingBox;
using gmpart::Path;
using gmregion::Box;
using gmregion::Element;

namespace {

bool isRectangle(const Path& path) {
    const auto isAlongAxis = [](const Element& e) {
        return !isArc(e) && (e.sp.x == e.ep.x) != (e.sp.y == e.ep.y);
    };
    const std::vector<Element>& sides = path.elements;
    return path.closed && sides.size() == 4 &&
           std::all_of(sides.begin(), sides.end(), isAlongAxis) &&
           (sides[0].sp.x == sides[0].ep.x) == (sides[2].sp.x == sides[2].ep.x) &&
           (sides[0].sp.x == sides[0].ep.x) != (sides[1].sp.x == sides[1].ep.x);
}

bool holds(const Box& outer, const Box& inner) {
    return outer.low.x < inner.low.x && outer.low.y < inner.low.y && inner.high.x < outer.high.x &&
           inner.high.y < outer.high.y;
}

}  // namespace

std::optional<std::size_t> frameOf(const std::vector<Path>& contours) {
    if (contours.size() < 2) return std::nullopt;
    const auto isWider = [](const Path& a, const Path& b) {
        const Box first = boundingBox(a);
        const Box second = boundingBox(b);
        return first.high.x - first.low.x < second.high.x - second.low.x;
    };
    const auto widest = std::max_element(contours.begin(), contours.end(), isWider);
    if (!isRectangle(*widest)) return std::nullopt;
    const Box outer = boundingBox(*widest);
    const bool alone = std::all_of(contours.begin(), contours.end(), [&](const Path& contour) {
        return &contour == &*widest ||
               (contour.layer != widest->layer && holds(outer, boundingBox(contour)));
    });
    if (!alone) return std::nullopt;
    return static_cast<std::size_t>(widest - contours.begin());
}

}  // namespace gmdrawing
