#include "region/bridge/OffsetByKernel.h"

namespace gmpath {

namespace {

/// Every element of the source stays in view, whatever its length.
constexpr int kWholeContour = 1'000'000;

/// Where the kernel starts a path along the offsets that the contour holds.
std::optional<Vec2> startPoint(const GmContour& contour, int count, double d) {
    int sub = 0;
    int elem = 0;
    if (!FindTPCCont(&contour, count, d, sub, elem)) return std::nullopt;
    return fromKernel(contour.GetSubContour(sub)->GetElement(elem)->SP());
}

}  // namespace

KernelOffset offsetByKernel(const Path& path, double d, double shortest) {
    KernelOffset offset;
    GmContour contour;
    offset.accepted = fillContour(contour, simplifiedForKernel(path, shortest));
    if (!offset.accepted) return offset;
    const bool keepOpen = !path.closed;
    const int count = contour.Offsetting(d, kWholeContour, keepOpen);
    for (int i = 0; i < count; ++i) {
        const GmContour& result = *contour.GetSubContour(i);
        if (result.ElementCount() == 0) continue;
        IdentifiedPath found = pathFromKernel(result, path.layer);
        offset.results.push_back(std::move(found.path));
        offset.origins.push_back(std::move(found.identifiers));
    }
    offset.start = startPoint(contour, count, d);
    return offset;
}

}  // namespace gmpath
