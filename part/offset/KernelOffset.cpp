// SPDX-License-Identifier: MIT
#include "part/offset/KernelOffset.h"

#include <cmath>
#include <utility>

#include "gmregion/CleanUp.h"

#include "part/kernel/OffsetByKernel.h"
#include "part/model/Area.h"
#include "part/offset/OffsetTasks.h"
#include "part/regions/ContourRegions.h"

namespace gmpart {

using gmregion::Fault;
using gmregion::FaultKind;
using gmregion::FillRule;
using gmregion::Outcome;
using gmregion::Paths;
using gmregion::Reason;
using gmregion::RegionSet;

namespace {

/// Half of what the distance of an offset of the kernel may be off.
constexpr double kCheckTolerance = 5e-4;

std::vector<double> signedDistances(const Path& contour, std::size_t depth, Side side,
                                    double distance) {
    if (side == Side::kRight) return {distance};
    if (side == Side::kLeft) return {-distance};
    const Sense turn = sense(contour);
    if (side == Side::kBoth || turn == Sense::kNone) {
        if (std::abs(distance) < kKernelTolerance) return {distance};
        return {distance, -distance};
    }
    const bool outsideIsRight = turn == Sense::kCounterClockwise;
    return {leadsOutward(side, contour, depth) == outsideIsRight ? distance : -distance};
}

KernelVerdict failed(FaultKind kind, const std::vector<Path>& loops) {
    return {{{{kind, loops.front().elements.front().sp}}, 1}, {}};
}

class KernelOffsetter {
public:
    explicit KernelOffsetter(const std::vector<Path>& contours, std::size_t passes)
        : m_contours(contours), m_regions(contours) {
        m_offsets.marginal.resize(passes);
    }

    void offset(std::size_t contour, std::size_t pass, Side side, double distance) {
        const Path& path = m_contours[contour];
        const std::size_t depth = m_regions.nesting().depths[contour];
        for (const double d : signedDistances(path, depth, side, distance))
            offset(contour, pass, d);
    }

    PartOffsets take() { return std::move(m_offsets); }

private:
    void offset(std::size_t contour, std::size_t pass, double d) {
        KernelOffset found = offsetByKernel(m_contours[contour], d);
        if (!found.accepted()) {
            const gmregion::Point at = m_contours[contour].elements.front().sp;
            m_offsets.refusals.push_back({pass, Reason::kGap, at, contour});
            return;
        }
        const bool doubtful = !isSound(contour, pass, d, found.results);
        for (Path& result : found.results)
            m_offsets.paths.push_back({pass, std::move(result), {contour}, contour, doubtful});
    }

    bool isSound(std::size_t contour, std::size_t pass, double d, const std::vector<Path>& loops) {
        const RegionSet& source = m_regions.alone()[contour];
        if (source.empty()) return true;
        const bool outsideIsRight = sense(m_contours[contour]) == Sense::kCounterClockwise;
        const KernelVerdict found = checkKernelOffset(source, outsideIsRight ? d : -d, loops);
        if (found.verdict.isSound()) return true;
        m_offsets.faults.push_back(
            {pass, found.verdict.faults.front(), found.verdict.count, contour});
        return false;
    }

    const std::vector<Path>& m_contours;
    PartRegions m_regions;
    PartOffsets m_offsets;
};

}  // namespace

KernelVerdict checkKernelOffset(const RegionSet& source, double distance,
                                const std::vector<Path>& loops) {
    Paths heap;
    for (const Path& loop : loops) {
        if (!loop.closed) return failed(FaultKind::kOpenLoop, loops);
        heap.add(loop.elements, true);
    }
    Outcome cleaned = cleanUp(heap, {FillRule::kEvenOdd, kCheckTolerance});
    if (cleaned.refusal) return failed(FaultKind::kUndefined, loops);
    if (cleaned.regions.loops().size() != loops.size()) {
        return failed(FaultKind::kCrossing, loops);
    }
    KernelVerdict found{verifyOffset(source, distance, cleaned.regions), {}};
    found.regions = std::move(cleaned.regions);
    return found;
}

PartOffsets offsetPartByKernel(const std::vector<Path>& contours, const OffsetRequest& request,
                               const ProgressCall& progress) {
    KernelOffsetter offsetter(contours, request.distances.size());
    const std::size_t total = request.distances.size() * contours.size();
    std::size_t done = 0;
    for (std::size_t pass = 0; pass < request.distances.size(); ++pass) {
        for (std::size_t i = 0; i < contours.size(); ++i) {
            offsetter.offset(i, pass, request.side, request.distances[pass]);
            progress(++done, total);
        }
    }
    return offsetter.take();
}

}  // namespace gmpart
