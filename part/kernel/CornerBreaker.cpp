// SPDX-License-Identifier: MIT
/// @file
/// Corners by the kernel's transitions.
///
/// A transition depends on its two elements alone, so the kernel gets a contour of these two. What
/// it made is compared with what lies near: a transition is nowhere farther from the first of its
/// elements than twice its size, so that the boxes of elements, which only become smaller, find
/// transitions, too.

#include "part/kernel/CornerBreaker.h"

#include "gmbridge/Curves.h"
#include "gmkernel/GmContour.h"

namespace gmpart {

namespace {

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

}  // namespace

CornerBreaker::CornerBreaker(const Path& path, std::size_t own)
    : m_own(own), m_source(simplifiedForKernel(path)) {
    GmContour contour;
    m_refusal = fillContour(contour, m_source);
    if (m_refusal != KernelRefusal::kNone) return;
    m_elements.resize(m_source.path.elements.size());
    m_transitions.resize(m_elements.size());
    std::vector<Box> boxes;
    for (std::size_t i = 0; i < m_elements.size(); ++i) {
        m_elements[i].take(*contour.GetElement(static_cast<int>(i)));
        boxes.push_back(m_elements[i].box);
    }
    m_boxes.assign(boxes);
}

bool CornerBreaker::breakCorner(std::size_t index, CornerKind kind, double value,
                                const CornerRoom& room) {
    BoxedCurve& first = m_elements[index];
    BoxedCurve& second = m_elements[(index + 1) % m_elements.size()];
    GmContour corner;
    corner.AddElement(first.curve.get(), false, 0);
    corner.AddElement(second.curve.get(), false, 1);
    if (corner.ElementCount() != 2 || !corner.AddTrans(kernelType(kind), 0, value, true)) {
        return false;
    }
    constexpr long kWithTransition = 3;
    if (corner.ElementCount() != kWithTransition || !corner.GetContElement(1)->bInserted) {
        return false;
    }
    BoxedCurve made;
    made.take(*corner.GetElement(1));
    const Vec2 at = gmbridge::planePoint(first.curve->EP());
    if (meetsOwn(made, index, 2.0 * value) || !room.allows(made, at, m_own)) return false;
    first.take(*corner.GetElement(0));
    second.take(*corner.GetElement(2));
    m_transitions[index] = std::move(made);
    return true;
}

/// Whether a transition behind an element meets anything of the contour but its neighbours.
bool CornerBreaker::meetsOwn(const BoxedCurve& made, std::size_t index, double reach) const {
    const std::size_t next = (index + 1) % m_elements.size();
    const Box near = made.box.grown(reach + kKernelTolerance);
    return m_boxes.anyOverlapping(near, [&](std::size_t i) {
        if (i != index && i != next && meet(made, m_elements[i])) return true;
        return i != index && m_transitions[i].curve && meet(made, m_transitions[i]);
    });
}

Path CornerBreaker::result() const {
    GmContour contour;
    long id = 0;
    for (std::size_t i = 0; i < m_elements.size(); ++i) {
        contour.AddElement(m_elements[i].curve.get(), false, id++);
        if (m_transitions[i].curve) {
            contour.AddElement(m_transitions[i].curve.get(), false, id++);
        }
    }
    return pathFromKernel(contour, m_source.path.layer).path;
}

}  // namespace gmpart
