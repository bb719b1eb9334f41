// SPDX-License-Identifier: MIT
/// @file
/// Paths as contours of the kernel, and back.
///
/// The kernel holds arcs by centre and radius and counts ends within its tolerance as one point; a
/// path holds arcs by their bulge, with exact ends. So on the way in elements too short for the
/// kernel are left out, and on the way back every arc gets exactly the kernel's ends and the ends
/// are made to meet. Identifiers of the kernel carry the indices of the source's elements.

#include "region/bridge/PathConversion.h"

#include <cmath>
#include <numeric>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "region/model/ShortElements.h"

namespace gmregion {

namespace {

/// The arc as elements that start and end exactly at the kernel's end points.
void appendKernelArc(std::vector<Element>& elements, const GmArc& arc) {
    const Vec2 m = fromKernel(arc.M());
    const Vec2 toStart = fromKernel(arc.SP()) - m;
    const Vec2 toEnd = fromKernel(arc.EP()) - m;
    const double startAngle = std::atan2(toStart.y, toStart.x);
    const double turn = arc.Dir() == GmBase::eRotCW ? -1.0 : 1.0;
    double angle = turn * std::atan2(cross(toStart, toEnd), dot(toStart, toEnd));
    if (arc.IsFullCircle()) {
        angle = 2.0 * kPi;
    } else if (angle < 0.0) {
        angle += 2.0 * kPi;
    }
    const std::size_t first = elements.size();
    appendArc(elements, m, arc.R(), startAngle, turn * angle);
    elements[first] = withEnds(elements[first], fromKernel(arc.SP()), elements[first].ep);
    elements.back() = withEnds(elements.back(), elements.back().sp, fromKernel(arc.EP()));
}

}  // namespace

GmPoint kernelPoint(Vec2 p) {
    return {p.x, p.y};
}

Vec2 fromKernel(const GmPoint& p) {
    return {p.X(), p.Y()};
}

std::unique_ptr<GmCurve> kernelCurve(const Element& e) {
    const GmPoint sp = kernelPoint(e.sp);
    const GmPoint ep = kernelPoint(e.ep);
    if (!isArc(e)) return std::make_unique<GmStretch>(sp, ep);
    const auto rot = e.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    return std::make_unique<GmArc>(sp, ep, kernelPoint(centre(e)), rot);
}

SimplifiedPath simplifiedForKernel(const Path& path, double shortest) {
    SimplifiedPath simplified{path, {}};
    simplified.indices = dropShortElements(simplified.path, shortest);
    if (!simplified.path.elements.empty()) return simplified;
    simplified.path = path;
    simplified.indices.resize(path.elements.size());
    std::iota(simplified.indices.begin(), simplified.indices.end(), std::size_t{0});
    return simplified;
}

Refusal fillContour(GmContour& contour, const SimplifiedPath& source) {
    for (std::size_t i = 0; i < source.path.elements.size(); ++i) {
        const std::unique_ptr<GmCurve> curve = kernelCurve(source.path.elements[i]);
        const auto id = static_cast<long>(source.indices[i]);
        if (!curve->CreationOK()) return Refusal::kTooSmall;
        if (!contour.AddElement(curve.get(), false, id)) return Refusal::kJoint;
    }
    if (contour.IsClosed() == source.path.closed) return Refusal::kNone;
    if (source.path.closed) return Refusal::kJoint;
    return contour.EP() == contour.SP() ? Refusal::kEndsAtStart : Refusal::kPassesStart;
}

IdentifiedPath pathFromKernel(const GmContour& contour, const std::string& layer) {
    IdentifiedPath result{{{}, contour.IsClosed(), layer}, {}};
    std::vector<Element>& elements = result.path.elements;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const GmContElement& element = *contour.GetContElement(i);
        const GmCurve& curve = *element.pCurve;
        if (curve.IsArc()) {
            appendKernelArc(elements, static_cast<const GmArc&>(curve));
        } else {
            elements.push_back({fromKernel(curve.SP()), fromKernel(curve.EP())});
        }
        result.identifiers.resize(elements.size(), static_cast<std::size_t>(element.lId));
    }
    meetEnds(result.path);
    return result;
}

}  // namespace gmregion
