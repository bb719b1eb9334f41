// SPDX-License-Identifier: MIT
#include "part/offset/OpenOffset.h"

#include <cmath>
#include <utility>

#include "gmregion/Parallels.h"

#include "part/offset/LoopsOfSet.h"

namespace gmpart {

using gmregion::Outcome;
using gmregion::ParallelPart;
using gmregion::Parallels;
using gmregion::Paths;
using gmregion::Workspace;

OpenOffset::OpenOffset(const std::vector<Path>& contours, std::vector<std::size_t> which,
                       double tolerance)
    : m_contours(contours), m_which(std::move(which)), m_tolerance(tolerance) {}

void OpenOffset::append(std::size_t pass, double distance, const OffsetRequest& request,
                        PartOffsets& offsets) const {
    if (m_which.empty()) return;
    if (std::abs(distance) <= m_tolerance) {
        copyAll(pass, offsets);
    } else if (request.side == Side::kRight || request.side == Side::kLeft) {
        runBeside(pass, request.side == Side::kRight ? distance : -distance, request, offsets);
    } else if (request.each) {
        for (const std::size_t contour : m_which)
            runRound(pass, std::abs(distance), request, {contour}, offsets);
    } else {
        runRound(pass, std::abs(distance), request, m_which, offsets);
    }
}

void OpenOffset::copyAll(std::size_t pass, PartOffsets& offsets) const {
    for (const std::size_t contour : m_which)
        offsets.paths.push_back({pass, m_contours[contour], {contour}, contour});
}

void OpenOffset::runBeside(std::size_t pass, double distance, const OffsetRequest& request,
                           PartOffsets& offsets) const {
    Workspace workspace;
    Parallels found;
    if (!makeParallels(heapOf(m_which), distance, m_tolerance, request.options, workspace, found)) {
        offsets.refusals.push_back({pass, found.refusal.reason, found.refusal.at});
        return;
    }
    for (const ParallelPart& part : found.parts) {
        const auto contour = static_cast<std::size_t>(found.origins[part.first].path);
        Path path{{found.elements.begin() + part.first, found.elements.begin() + part.last},
                  part.closed,
                  m_contours[contour].layer};
        offsets.paths.push_back({pass, std::move(path), {contour}, contour});
    }
    offsets.marginal[pass].insert(offsets.marginal[pass].end(), found.marginal.begin(),
                                  found.marginal.end());
}

void OpenOffset::runRound(std::size_t pass, double distance, const OffsetRequest& request,
                          const Group& group, PartOffsets& offsets) const {
    Workspace workspace;
    Outcome found;
    if (!thicken(heapOf(group), distance, m_tolerance, request.options, workspace, found)) {
        offsets.refusals.push_back({pass, found.refusal.reason, found.refusal.at});
        return;
    }
    appendLoops(found, pass, m_contours, offsets);
}

Paths OpenOffset::heapOf(const Group& group) const {
    Paths heap;
    for (const std::size_t i : group) {
        const Path& contour = m_contours[i];
        heap.add(contour.elements, contour.closed, static_cast<std::int64_t>(i));
    }
    return heap;
}

}  // namespace gmpart
