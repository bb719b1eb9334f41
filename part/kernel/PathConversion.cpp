// SPDX-License-Identifier: MIT
/// @file
/// Paths as contours of the kernel, and back.
///
/// The kernel holds arcs by centre and radius and counts ends within its tolerance as one point; a
/// path holds arcs by their bulge, with exact ends. So on the way in elements too short for the
/// kernel are left out, and on the way back the ends are made to meet. Identifiers of the kernel
/// carry the indices of the source's elements.

#include "part/kernel/PathConversion.h"

#include <numeric>

#include "gmbridge/Curves.h"
#include "part/model/ShortElements.h"

namespace gmpart {

using gmbridge::curveOf;

SimplifiedPath simplifiedForKernel(const Path& path, double shortest) {
    SimplifiedPath simplified{path, {}};
    simplified.indices = dropShortElements(simplified.path, shortest);
    if (!simplified.path.elements.empty()) return simplified;
    simplified.path = path;
    simplified.indices.resize(path.elements.size());
    std::iota(simplified.indices.begin(), simplified.indices.end(), std::size_t{0});
    return simplified;
}

KernelRefusal fillContour(GmContour& contour, const SimplifiedPath& source) {
    for (std::size_t i = 0; i < source.path.elements.size(); ++i) {
        const std::unique_ptr<GmCurve> curve = curveOf(source.path.elements[i]);
        const auto id = static_cast<long>(source.indices[i]);
        if (!curve->CreationOK()) return KernelRefusal::kTooSmall;
        if (!contour.AddElement(curve.get(), false, id)) return KernelRefusal::kJoint;
    }
    if (contour.IsClosed() == source.path.closed) return KernelRefusal::kNone;
    if (source.path.closed) return KernelRefusal::kJoint;
    return contour.EP() == contour.SP() ? KernelRefusal::kEndsAtStart : KernelRefusal::kPassesStart;
}

IdentifiedPath pathFromKernel(const GmContour& contour, const std::string& layer) {
    IdentifiedPath result{{{}, contour.IsClosed(), layer}, {}};
    std::vector<Element>& elements = result.path.elements;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const GmContElement& element = *contour.GetContElement(i);
        gmbridge::appendElements(*element.pCurve, elements);
        result.identifiers.resize(elements.size(), static_cast<std::size_t>(element.lId));
    }
    meetEnds(result.path);
    return result;
}

}  // namespace gmpart
