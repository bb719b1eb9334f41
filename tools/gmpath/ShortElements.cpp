#include "ShortElements.h"

namespace gmpath {

namespace {

bool isShort(const Element& e, double shortest) {
    return length(e) < shortest || radius(e) < shortest;
}

}  // namespace

std::size_t dropShortElements(Path& path, double shortest) {
    if (path.elements.empty()) return 0;
    std::vector<Element> kept;
    Vec2 sp = path.elements.front().sp;
    for (const Element& e : path.elements) {
        const Element moved = straightened(withEnds(e, sp, e.ep));
        if (isShort(moved, shortest)) continue;
        kept.push_back(moved);
        sp = moved.ep;
    }
    const std::size_t dropped = path.elements.size() - kept.size();
    if (path.closed && kept.size() == 1 && !isArc(kept.front())) kept.clear();
    path.elements = std::move(kept);
    if (dropped > 0 && path.closed) meetEnds(path);
    return dropped;
}

}  // namespace gmpath
