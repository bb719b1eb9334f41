// SPDX-License-Identifier: MIT
/// @file
/// Offsetting a drawing, in passes.
///
/// The side becomes a few sets of regions, each with the way that it is offset. Every pass offsets
/// all of them, and then the contours that have no regions.

#include "part/offset/PartOffset.h"

#include "part/offset/LoopsOfSet.h"
#include "part/offset/OffsetTasks.h"
#include "part/offset/OpenOffset.h"

namespace gmpart {

using gmregion::Outcome;
using gmregion::Verdict;
using gmregion::Workspace;

namespace {

class PartOffsetter {
public:
    PartOffsetter(const std::vector<Path>& contours, const OffsetRequest& request)
        : m_contours(contours), m_request(request) {
        m_offsets.marginal.resize(request.distances.size());
    }

    void offset(const OffsetTask& task, std::size_t pass) {
        const double distance = m_request.distances[pass] * (task.outward ? 1.0 : -1.0);
        if (task.source.refusal || !gmregion::offset(task.source.regions, distance,
                                                     m_request.options, m_workspace, m_outcome)) {
            const gmregion::Refusal& refusal =
                task.source.refusal ? task.source.refusal : m_outcome.refusal;
            m_offsets.refusals.push_back({pass, refusal.reason, refusal.at, task.contour});
            return;
        }
        const std::size_t before = m_offsets.paths.size();
        appendLoops(m_outcome, pass, m_contours, m_offsets);
        if (verifyOffset(task.source.regions, distance, m_outcome.regions, m_request.options,
                         m_workspace, m_verdict)) {
            return;
        }
        m_offsets.faults.push_back({pass, m_verdict.faults.front(), m_verdict.count, task.contour});
        for (std::size_t i = before; i < m_offsets.paths.size(); ++i)
            m_offsets.paths[i].doubtful = true;
    }

    PartOffsets& offsets() { return m_offsets; }

private:
    const std::vector<Path>& m_contours;
    const OffsetRequest& m_request;
    Workspace m_workspace;
    Outcome m_outcome;
    Verdict m_verdict;
    PartOffsets m_offsets;
};

}  // namespace

PartOffsets offsetPart(const std::vector<Path>& contours, const OffsetRequest& request,
                       const ProgressCall& progress) {
    return offsetPart(contours, PartRegions(contours), request, progress);
}

PartOffsets offsetPart(const std::vector<Path>& contours, const PartRegions& regions,
                       const OffsetRequest& request, const ProgressCall& progress) {
    const std::vector<OffsetTask> tasks =
        offsetTasks(contours, regions, request.side, request.each);
    const OpenOffset open(contours, regions.withoutRegions(), regions.tolerance());
    PartOffsetter offsetter(contours, request);
    const std::size_t total = request.distances.size() * (tasks.size() + 1);
    std::size_t done = 0;
    for (std::size_t pass = 0; pass < request.distances.size(); ++pass) {
        for (const OffsetTask& task : tasks) {
            offsetter.offset(task, pass);
            progress(++done, total);
        }
        open.append(pass, request.distances[pass], request, offsetter.offsets());
        progress(++done, total);
    }
    return std::move(offsetter.offsets());
}

}  // namespace gmpart
