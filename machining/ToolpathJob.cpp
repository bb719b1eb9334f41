// SPDX-License-Identifier: MIT
/// @file
/// Cutting contours one after the other.
///
/// Runs of all contours are made first. Then, of those that may be cut, the one that starts nearest
/// to the tool comes next, with all its passes and levels. That is a short way, not the shortest:
/// no exchange of contours is tried afterwards.

#include "machining/ToolpathJob.h"

#include <algorithm>

#include "drawing/contours/Nesting.h"
#include "machining/moves/MoveRecorder.h"
#include "machining/order/CutOrder.h"
#include "region/model/PathStart.h"

namespace gmmachining {

using gmdrawing::enclosingPaths;
using gmregion::FaultyOffset;
using gmregion::OffsetFault;
using gmregion::Path;
using gmregion::Refusal;
using gmregion::Side;
using gmregion::Vec2;

namespace {

using Pass = std::vector<ToolRun>;

/// A contour's runs, pass by pass.
struct ContourRuns {
    std::vector<Pass> passes;  ///< none of them empty
    Refusal refusal = Refusal::kNone;
    bool fits = true;
    bool bothSides = false;
    std::vector<FaultyOffset> faults;
    std::vector<Path> doubtful;

    void setAside(double d, ToolRuns found) {
        faults.push_back({d, found.fault});
        for (ToolRun& run : found.runs)
            doubtful.push_back(std::move(run.path));
    }
};

ContourRuns runsOf(const Path& contour, int depth, const ToolpathRequest& request) {
    ContourRuns result;
    for (const double distance : request.distances) {
        const std::vector<double> sides = signedDistances(contour, depth, Side::kWaste, distance);
        const std::size_t faultsBefore = result.faults.size();
        Pass pass;
        for (const double d : sides) {
            ToolRuns found = toolRuns(contour, d, request.part);
            if (result.refusal == Refusal::kNone) result.refusal = found.refusal;
            if (found.fault != OffsetFault::kNone) {
                result.setAside(d, std::move(found));
            } else {
                std::move(found.runs.begin(), found.runs.end(), std::back_inserter(pass));
            }
        }
        result.bothSides = sides.size() > 1;
        result.fits = !pass.empty() || result.faults.size() > faultsBefore;
        if (!pass.empty()) result.passes.push_back(std::move(pass));
    }
    return result;
}

double distanceToStart(const ToolRun& run, Vec2 p) {
    return run.startFixed ? distance(run.path.elements.front().sp, p) : distance(run.path, p);
}

Pass::const_iterator nearestRun(const Pass& pass, Vec2 p) {
    return std::min_element(pass.begin(), pass.end(), [&](const ToolRun& a, const ToolRun& b) {
        return distanceToStart(a, p) < distanceToStart(b, p);
    });
}

/// A run with the start at which it begins, and its leads.
struct Cut {
    Path path;
    Path approach;
    Path departure;

    Vec2 start() const { return (approach.elements.empty() ? path : approach).elements.front().sp; }
};

class ToolpathJob {
public:
    ToolpathJob(const std::vector<Path>& contours, const ToolpathRequest& request)
        : m_request(request), m_obstacles(contours), m_recorder(request.safeZ) {}

    ContourCut cutContour(std::size_t index, const ContourRuns& runs) {
        m_recorder.serve(index);
        m_cut = {};
        m_cut.refusal = runs.refusal;
        m_cut.fits = runs.fits;
        m_cut.bothSides = runs.bothSides;
        m_cut.faults = runs.faults;
        m_cut.doubtful = runs.doubtful;
        for (Pass pass : runs.passes) {
            while (!pass.empty()) {
                const auto nearest = nearestRun(pass, m_recorder.place());
                m_cut.keepsOthers =
                    m_cut.keepsOthers && m_obstacles.keepClear(nearest->path, clearance(), index);
                cutThroughAllLevels(prepared(*nearest));
                pass.erase(nearest);
            }
        }
        return m_cut;
    }

    Vec2 place() const { return m_recorder.place(); }
    Toolpath takeMoves() { return m_recorder.takeMoves(); }

private:
    /// What the tool's centre keeps from every contour.
    double clearance() const { return m_request.distances.back(); }

    Cut prepared(const ToolRun& run) {
        Cut cut;
        cut.path = run.startFixed ? run.path
                                  : startedAt(run.path, nearestPlace(run.path, m_recorder.place()));
        cut.approach = lead(cut.path, LeadEnd::kApproach);
        cut.departure = lead(cut.path, LeadEnd::kDeparture);
        return cut;
    }

    Path lead(const Path& cut, LeadEnd end) {
        if (m_request.lead.kind == LeadKind::kNone) return {};
        Lead lead = clearLead(cut, end, m_request.lead, m_request.part, m_obstacles, clearance());
        const bool made = !lead.path.elements.empty();
        std::size_t& missing = lead.tooSmall ? m_cut.leads.tooSmall : m_cut.leads.dropped;
        ++(made ? m_cut.leads.made : missing);
        if (lead.shortened) {
            ++m_cut.leads.shortened;
            m_cut.leads.smallest = std::min(m_cut.leads.smallest, lead.size);
        }
        return std::move(lead.path);
    }

    /// From one level to the next the tool goes straight down where the cut ends where it starts.
    void cutThroughAllLevels(const Cut& cut) {
        for (const double z : m_request.levels) {
            m_recorder.rapidTo(cut.start());
            m_recorder.plungeTo(z);
            m_recorder.follow(MoveKind::kLead, cut.approach);
            m_recorder.follow(MoveKind::kCut, cut.path);
            m_recorder.follow(MoveKind::kLead, cut.departure);
        }
        m_recorder.lift();
    }

    const ToolpathRequest& m_request;
    Obstacles m_obstacles;
    MoveRecorder m_recorder;
    ContourCut m_cut;  ///< of the contour being cut
};

/// Of the ready contours the one that starts nearest to p; contours without runs come at once.
std::size_t nextContour(const std::vector<std::size_t>& ready, const std::vector<ContourRuns>& runs,
                        Vec2 p) {
    const auto distanceTo = [&](std::size_t i) {
        if (runs[i].passes.empty()) return 0.0;
        return distanceToStart(*nearestRun(runs[i].passes.front(), p), p);
    };
    return *std::min_element(ready.begin(), ready.end(), [&](std::size_t a, std::size_t b) {
        return distanceTo(a) < distanceTo(b);
    });
}

}  // namespace

ToolpathResult makeToolpath(
    const std::vector<Path>& contours, const ToolpathRequest& request,
    const std::function<void(std::size_t done, std::size_t total)>& progress) {
    const std::vector<std::vector<std::size_t>> holders = enclosingPaths(contours);
    std::vector<ContourRuns> runs;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        runs.push_back(runsOf(contours[i], static_cast<int>(holders[i].size()), request));
        progress(i + 1, contours.size());
    }
    CutOrder order(holders);
    ToolpathJob job(contours, request);
    ToolpathResult result{{}, std::vector<ContourCut>(contours.size())};
    for (auto ready = order.ready(); !ready.empty(); ready = order.ready()) {
        const std::size_t next = nextContour(ready, runs, job.place());
        result.contours[next] = job.cutContour(next, runs[next]);
        order.finish(next);
    }
    result.moves = job.takeMoves();
    return result;
}

}  // namespace gmmachining
