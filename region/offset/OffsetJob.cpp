// SPDX-License-Identifier: MIT
/// @file
/// Offsetting all contours of a drawing, in passes.
///
/// The side that is asked for becomes the sign of the distance by the sense of the contour, and for
/// the waste side by its nesting depth: outlines are left on the outside, holes on the inside.
/// Contours are offset one by one: offsets of neighbours that cross are not joined.

#include "region/offset/OffsetJob.h"

#include "region/model/Area.h"
#include "region/offset/CheckedOffset.h"

namespace gmregion {

namespace {

std::vector<double> bothSides(double distance) {
    // A path that is not moved at all has only one copy of itself.
    if (std::abs(distance) < kKernelTolerance) return {distance};
    return {distance, -distance};
}

bool goesOutside(Side side, int depth) {
    return side == Side::kOutside || (side == Side::kWaste && depth % 2 == 0);
}

void addOffset(ContourOffsets& offsets, std::size_t pass, const Path& contour, double d) {
    CheckedOffset found = offsetChecked(contour, d);
    const bool doubtful = found.fault != OffsetFault::kNone;
    if (offsets.refusal == Refusal::kNone) offsets.refusal = found.offset.refusal;
    if (doubtful) offsets.faults.push_back({d, found.fault});
    for (Path& path : found.offset.results)
        offsets.paths.push_back({pass, std::move(path), doubtful});
}

ContourOffsets offsetContour(const Path& contour, int depth, const OffsetRequest& request,
                             const std::function<void()>& passDone) {
    ContourOffsets offsets;
    for (std::size_t pass = 0; pass < request.distances.size(); ++pass) {
        const std::size_t before = offsets.paths.size() + offsets.faults.size();
        const double distance = request.distances[pass];
        for (const double d : signedDistances(contour, depth, request.side, distance)) {
            addOffset(offsets, pass, contour, d);
        }
        const bool empty = offsets.paths.size() + offsets.faults.size() == before;
        if (empty) offsets.emptyPasses.push_back(pass);
        passDone();
    }
    return offsets;
}

}  // namespace

std::vector<double> signedDistances(const Path& contour, int depth, Side side, double distance) {
    if (side == Side::kRight) return {distance};
    if (side == Side::kLeft) return {-distance};
    const Sense turn = sense(contour);
    if (side == Side::kBoth || turn == Sense::kNone) return bothSides(distance);
    const bool outsideIsRight = turn == Sense::kCounterClockwise;
    return {goesOutside(side, depth) == outsideIsRight ? distance : -distance};
}

std::vector<ContourOffsets> offsetContours(const std::vector<Path>& contours,
                                           const std::vector<std::optional<int>>& depths,
                                           const OffsetRequest& request,
                                           const ProgressCall& progress) {
    const std::size_t total = contours.size() * request.distances.size();
    std::size_t done = 0;
    const auto passDone = [&] { progress(++done, total); };
    std::vector<ContourOffsets> offsets;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        offsets.push_back(offsetContour(contours[i], depths[i].value_or(0), request, passDone));
    }
    return offsets;
}

}  // namespace gmregion
