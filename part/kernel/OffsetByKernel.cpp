// SPDX-License-Identifier: MIT
#include "part/kernel/OffsetByKernel.h"

#include "gmkernel/GmContour.h"
#include "part/kernel/PathConversion.h"

namespace gmpart {

namespace {

/// Every element of the source stays in view, whatever its length.
constexpr int kWholeContour = 1'000'000;

}  // namespace

KernelOffset offsetByKernel(const Path& path, double d, double shortest) {
    KernelOffset offset;
    GmContour contour;
    offset.refusal = fillContour(contour, simplifiedForKernel(path, shortest));
    if (!offset.accepted()) return offset;
    const bool keepOpen = !path.closed;
    const int count = contour.Offsetting(d, kWholeContour, keepOpen);
    for (int i = 0; i < count; ++i) {
        const GmContour& result = *contour.GetSubContour(i);
        if (result.ElementCount() == 0) continue;
        IdentifiedPath found = pathFromKernel(result, path.layer);
        offset.results.push_back(std::move(found.path));
        offset.origins.push_back(std::move(found.identifiers));
    }
    return offset;
}

}  // namespace gmpart
