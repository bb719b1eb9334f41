// SPDX-License-Identifier: MIT
#include "gmbridge/ContourPaths.h"

#include <cmath>
#include <limits>

#include "bridge/ArcCentre.h"
#include "gmbridge/Curves.h"

namespace gmbridge {

using gmregion::Element;
using gmregion::Origin;
using gmregion::OriginKind;
using gmregion::Point;

namespace {

/// How far the centre of an arc about a corner may be computed beside the corner, in radii.
constexpr double kBesideCorner = 1.0 / 1024.0;

double distance(Point a, Point b) {
    return std::hypot(b.x - a.x, b.y - a.y);
}

/// Whether the kernel counts two points of the plane as the same.
bool isJoint(Point a, Point b) {
    return std::fabs(b.x - a.x) < GmBase::m_scdPrec && std::fabs(b.y - a.y) < GmBase::m_scdPrec;
}

/// Whether what was put into a corner lies at the start of an element that meets the corner. Arcs
/// have their centre in it; what is straight lies nearer to it than to the element's other end.
bool isAboutStart(const Element& inCorner, const Element& e) {
    const bool isArc = inCorner.bulge != 0.0;
    const Point corner =
        isArc ? centreOf(inCorner)
              : Point{0.5 * (inCorner.sp.x + inCorner.ep.x), 0.5 * (inCorner.sp.y + inCorner.ep.y)};
    const double reach = isArc ? kBesideCorner * distance(corner, inCorner.sp)
                               : std::numeric_limits<double>::infinity();
    const double fromStart = distance(corner, e.sp);
    return fromStart <= reach && fromStart < distance(corner, e.ep);
}

bool isFullCircle(const GmContour& contour, const std::vector<Element>& elements) {
    return contour.ElementCount() == 1 && elements.size() == 2 &&
           elements.front().sp == elements.back().ep;
}

/// Lets each element start where the one before ends, and the last one end where the first starts.
/// @returns the number of the first element that starts too far from there, or -1
long closeJoints(std::vector<Element>& elements, bool closed) {
    for (std::size_t i = 1; i < elements.size(); ++i) {
        const Point end = elements[i - 1].ep;
        if (!isJoint(end, elements[i].sp)) return static_cast<long>(i);
        elements[i].sp = end;
    }
    if (!closed) return -1;
    if (!isJoint(elements.back().ep, elements.front().sp)) return 0;
    elements.back().ep = elements.front().sp;
    return -1;
}

}  // namespace

Refusal ContourPaths::add(const GmContour& contour) {
    const std::size_t number = m_paths.size();
    const long count = contour.ElementCount();
    if (!contour.CreationOK() || count == 0) return {Reason::kUndefined, number};
    std::vector<Element> elements;
    std::vector<ContourElement> sources;
    for (int i = 0; i < count; ++i) {
        const GmContElement& element = *contour.GetContElement(i);
        if (!element.pCurve || !appendElements(*element.pCurve, elements))
            return {Reason::kElement, number, i};
        sources.resize(elements.size(), {number, i, element.lId});
    }
    const bool closed = contour.IsClosed() || isFullCircle(contour, elements);
    const long gap = closeJoints(elements, closed);
    if (gap >= 0) {
        const auto at = static_cast<std::size_t>(gap);
        return {Reason::kGap, number, sources[at].index, kernelPoint(elements[at].sp)};
    }
    m_paths.add(elements, closed);
    m_sources.insert(m_sources.end(), sources.begin(), sources.end());
    return {};
}

std::optional<ContourElement> ContourPaths::sourceOf(const gmregion::RegionSet& set,
                                                     std::size_t element) const {
    return sourceOf(set.elements()[element], *set.origins(element).begin());
}

std::optional<ContourElement> ContourPaths::sourceOf(const gmregion::Element& element,
                                                     const Origin& origin) const {
    if (origin.path < 0 || static_cast<std::size_t>(origin.path) >= m_paths.size()) return {};
    const gmregion::PathView path = m_paths[static_cast<std::size_t>(origin.path)];
    std::size_t number = origin.element;
    if (number >= path.size()) return {};
    const bool isCorner = origin.kind == OriginKind::kCorner;
    if (isCorner && isAboutStart(element, path.first[number])) {
        if (number > 0) {
            --number;
        } else if (path.closed) {
            number = path.size() - 1;
        }
    }
    const auto before = static_cast<std::size_t>(path.first - m_paths[0].first);
    return m_sources[before + number];
}

}  // namespace gmbridge
