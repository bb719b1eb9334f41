// SPDX-License-Identifier: MIT
/// @file
/// Dropping short elements without opening the path.
///
/// The element behind a dropped one is stretched back to where the dropped one started. So a row of
/// short elements shrinks towards its start instead of adding up gaps, and each end moves by less
/// than the limit. It does not look at what the moved elements may cross.

#include "part/model/ShortElements.h"

namespace gmpart {

namespace {

bool isShort(const Element& e, double shortest) {
    return length(e) < shortest || radius(e) < shortest;
}

}  // namespace

std::vector<std::size_t> dropShortElements(Path& path, double shortest) {
    if (path.elements.empty()) return {};
    std::vector<std::size_t> stay;
    std::vector<Element> kept;
    Vec2 sp = path.elements.front().sp;
    for (std::size_t i = 0; i < path.elements.size(); ++i) {
        const Element& e = path.elements[i];
        const Element moved = straightened(withEnds(e, sp, e.ep));
        if (isShort(moved, shortest)) continue;
        kept.push_back(moved);
        stay.push_back(i);
        sp = moved.ep;
    }
    const bool dropped = kept.size() < path.elements.size();
    if (path.closed && kept.size() == 1 && !isArc(kept.front())) {
        kept.clear();
        stay.clear();
    }
    path.elements = std::move(kept);
    if (dropped && path.closed) meetEnds(path);
    return stay;
}

}  // namespace gmpart
