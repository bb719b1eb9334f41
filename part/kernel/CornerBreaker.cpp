// SPDX-License-Identifier: MIT
/// @file
/// Corners by the kernel's transitions.
///
/// A transition depends on its two elements alone, so the kernel gets a contour of these two. What
/// it made is compared with what lies near: a transition is nowhere farther from the first of its
/// elements than twice its size, so that the boxes of elements, which only become smaller, find
/// transitions, too.

#include "part/kernel/CornerBreaker.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "gmbridge/Curves.h"
#include "gmkernel/GmContour.h"

namespace gmpart {

namespace {

/// What the kernel made of a corner.
struct CornerTransition {
    BoxedCurve made;
    BoxedCurve first;   ///< the element before, cut back; without a curve when used up
    BoxedCurve second;  ///< the element behind, the same
};

GmContour::eTransType kernelType(CornerKind kind) {
    switch (kind) {
        case CornerKind::kChamferDistance:
            return GmContour::eTransChamferDist;
        case CornerKind::kChamferLength:
            return GmContour::eTransChamferLength;
        case CornerKind::kRounding:
            break;
    }
    return GmContour::eTransRadius;
}

/// What the kernel makes of the corner between two curves; nothing where it makes nothing.
std::optional<CornerTransition> transitionBetween(const GmCurve& first, const GmCurve& second,
                                                  CornerKind kind, double value) {
    GmContour contour;
    contour.AddElement(first, false, 0);
    contour.AddElement(second, false, 0);
    if (contour.ElementCount() != 2 || !contour.AddTrans(kernelType(kind), 0, value, true)) {
        return std::nullopt;
    }
    // Elements that are used up are gone from the contour.
    CornerTransition found;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const bool isMade = contour.GetContElement(i)->bInserted;
        BoxedCurve& curve = isMade ? found.made : found.made.curve ? found.second : found.first;
        curve.take(*contour.GetElement(i));
    }
    if (!found.made.curve) return std::nullopt;
    return found;
}

}  // namespace

CornerBreaker::CornerBreaker(const Path& path, std::size_t own)
    : m_own(own), m_source(simplifiedForKernel(path)) {
    GmContour contour;
    m_refusal = fillContour(contour, m_source);
    if (m_refusal != KernelRefusal::kNone) return;
    const std::size_t count = m_source.path.elements.size();
    m_links.resize(2 * count);
    std::vector<Box> boxes;
    for (std::size_t i = 0; i < count; ++i) {
        m_links[i].curve.take(*contour.GetElement(static_cast<int>(i)));
        m_links[i].previous = (i + count - 1) % count;
        m_links[i].next = (i + 1) % count;
        boxes.push_back(m_links[i].curve.box);
    }
    m_boxes.assign(boxes);
}

bool CornerBreaker::breakCorner(std::size_t index, CornerKind kind, double value,
                                const CornerRoom& room) {
    // Where a transition has used the element up, it ends in the corner instead.
    const std::size_t first = m_links[index].isGone() ? m_links[index].previous : index;
    const std::size_t second = m_links[first].next;
    std::optional<CornerTransition> found =
        transitionBetween(*m_links[first].curve.curve, *m_links[second].curve.curve, kind, value);
    if (!found) return false;
    const std::size_t before = found->first.curve ? first : m_links[first].previous;
    const std::size_t behind = found->second.curve ? second : m_links[second].next;
    const Vec2 corner = gmbridge::planePoint(m_links[first].curve.curve->EP());
    const std::array<std::size_t, 4> neighbours = {first, second, before, behind};
    if (meetsOwn(found->made, 4.0 * value, neighbours)) return false;
    if (!room.allows(found->made, corner, m_own)) return false;
    m_links[first].curve = std::move(found->first);
    m_links[second].curve = std::move(found->second);
    const std::size_t made = transitionBehind(index);
    m_links[made] = {std::move(found->made), before, behind};
    m_links[before].next = made;
    m_links[behind].previous = made;
    return true;
}

/// Whether a transition meets anything of the contour but its neighbours.
bool CornerBreaker::meetsOwn(const BoxedCurve& made, double reach,
                             const std::array<std::size_t, 4>& neighbours) const {
    const auto meetsLink = [&](std::size_t link) {
        const auto* const end = neighbours.data() + neighbours.size();
        return std::find(neighbours.data(), end, link) == end && !m_links[link].isGone() &&
               meet(made, m_links[link].curve);
    };
    const Box near = made.box.grown(reach + kKernelTolerance);
    return m_boxes.anyOverlapping(near, [&](std::size_t element) {
        return meetsLink(element) || meetsLink(transitionBehind(element));
    });
}

Path CornerBreaker::result() const {
    GmContour contour;
    long id = 0;
    for (std::size_t i = 0; i < m_links.size() / 2; ++i) {
        for (const std::size_t link : {i, transitionBehind(i)}) {
            if (!m_links[link].isGone()) {
                contour.AddElement(m_links[link].curve.curve.get(), false, id++);
            }
        }
    }
    return pathFromKernel(contour, m_source.path.layer).path;
}

}  // namespace gmpart
