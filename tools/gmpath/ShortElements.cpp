#include "ShortElements.h"

namespace gmpath {

namespace {

bool isShort(const Element& e) {
    return length(e) < kKernelTolerance || radius(e) < kKernelTolerance;
}

}  // namespace

std::size_t dropShortElements(Path& path) {
    if (path.elements.empty()) return 0;
    std::vector<Element> kept;
    Vec2 sp = path.elements.front().sp;
    for (const Element& e : path.elements) {
        const Element moved = straightened(withEnds(e, sp, e.ep));
        if (isShort(moved)) continue;
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
