// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "gmkernel/GmContour.h"
#include "part/kernel/KernelLimits.h"
#include "part/model/Path.h"

namespace gmpart {

/// A path without the elements below a length, and the indices that the others had. A path that
/// small altogether stays as it is.
struct SimplifiedPath {
    Path path;
    std::vector<std::size_t> indices;
};
SimplifiedPath simplifiedForKernel(const Path& path, double shortest = kShortestForKernel);

/// Fills an empty contour with a path, the indices as identifiers. Where it is refused the contour
/// holds the elements before the one that is at fault.
KernelRefusal fillContour(GmContour& contour, const SimplifiedPath& source);

/// A contour of the kernel as a path, and for each of its elements the identifier it comes with. An
/// arc may become two elements.
struct IdentifiedPath {
    Path path;
    std::vector<std::size_t> identifiers;
};
IdentifiedPath pathFromKernel(const GmContour& contour, const std::string& layer);

}  // namespace gmpart
