// SPDX-License-Identifier: MIT
/// @file
/// Cutting contours one after the other.
///
/// Runs of all contours are made first. Then, of the units that may be cut, the one that starts
/// nearest to the tool comes next, with all its passes and levels. That is a short way, not the
/// shortest: no exchange of contours is tried afterwards.

#include "machining/ToolpathJob.h"

#include <algorithm>
#include <utility>

#include "machining/moves/MoveRecorder.h"
#include "machining/order/CutOrder.h"
#include "machining/order/CutUnits.h"
#include "part/model/PathStart.h"
#include "part/regions/ContourRegions.h"
#include "part/regions/PartRegions.h"

namespace gmmachining {

using gmpart::PartRegions;
using gmpart::Path;
using gmregion::Vec2;

namespace {

using Pass = std::vector<ToolRun>;

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

/// What bounds the part, and the contours that bound nothing. What of contours lies inside the
/// part, or in a hole of others, is no edge.
std::vector<Path> edgesOf(const std::vector<Path>& contours, const PartRegions& regions) {
    std::vector<Path> edges;
    const gmregion::Outcome part = regions.part();
    for (std::size_t loop = 0; loop < part.regions.loops().size(); ++loop)
        edges.push_back(gmpart::loopPath(part.regions, loop));
    for (const std::size_t i : regions.withoutRegions())
        edges.push_back(contours[i]);
    return edges;
}

class ToolpathJob {
public:
    ToolpathJob(const std::vector<Path>& contours, const PartRegions& regions,
                const ToolpathRequest& request)
        : m_request(request),
          m_obstacles(edgesOf(contours, regions), regions.tolerance()),
          m_recorder(request.safeZ),
          m_cuts(contours.size()) {}

    void cutUnit(const CutUnit& unit) {
        for (Pass pass : unit.passes) {
            while (!pass.empty()) {
                const auto nearest = nearestRun(pass, m_recorder.place());
                cutRun(*nearest);
                pass.erase(nearest);
            }
        }
    }

    Vec2 place() const { return m_recorder.place(); }
    Toolpath takeMoves() { return m_recorder.takeMoves(); }
    std::vector<ContourCut> takeCuts() { return std::move(m_cuts); }

private:
    /// What the tool's centre keeps from every contour.
    double clearance() const { return m_request.distances.back(); }

    void cutRun(const ToolRun& run) {
        const std::size_t contour = run.contours.front();
        m_recorder.serve(contour);
        const Cut cut = prepared(run, m_cuts[contour].leads);
        const bool keepsAway = m_obstacles.keepClear(cut.path, clearance());
        m_cuts[contour].keepsAway = m_cuts[contour].keepsAway && keepsAway;
        cutThroughAllLevels(cut);
    }

    Cut prepared(const ToolRun& run, LeadTally& tally) const {
        Cut cut;
        cut.path = run.startFixed ? run.path
                                  : startedAt(run.path, nearestPlace(run.path, m_recorder.place()));
        cut.approach = lead(cut.path, LeadEnd::kApproach, tally);
        cut.departure = lead(cut.path, LeadEnd::kDeparture, tally);
        return cut;
    }

    Path lead(const Path& cut, LeadEnd end, LeadTally& tally) const {
        if (m_request.lead.kind == LeadKind::kNone) return {};
        Lead lead = clearLead(cut, end, m_request.lead, m_request.part, m_obstacles, clearance());
        const bool made = !lead.path.elements.empty();
        std::size_t& missing = lead.tooSmall ? tally.tooSmall : tally.dropped;
        ++(made ? tally.made : missing);
        if (lead.shortened) {
            ++tally.shortened;
            tally.smallest = std::min(tally.smallest, lead.size);
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
    std::vector<ContourCut> m_cuts;
};

/// Of the ready units the one that starts nearest to p; those without runs come at once.
std::size_t nextUnit(const std::vector<std::size_t>& ready, const std::vector<CutUnit>& units,
                     Vec2 p) {
    const auto distanceTo = [&](std::size_t i) {
        for (const Pass& pass : units[i].passes) {
            if (!pass.empty()) return distanceToStart(*nearestRun(pass, p), p);
        }
        return 0.0;
    };
    return *std::min_element(ready.begin(), ready.end(), [&](std::size_t a, std::size_t b) {
        return distanceTo(a) < distanceTo(b);
    });
}

/// What the runs of the last pass tell of the contours: which fit, and which are cut as one.
void judgeLastPass(const std::vector<CutUnit>& units, ToolpathResult& result) {
    for (ContourCut& cut : result.contours)
        cut.fits = false;
    for (const CutUnit& unit : units) {
        for (const ToolRun& run : unit.passes.back()) {
            if (run.contours.size() > 1) result.together.push_back(run.contours);
            for (const std::size_t contour : run.contours)
                result.contours[contour].fits = true;
        }
    }
}

}  // namespace

ToolpathResult makeToolpath(
    const std::vector<Path>& contours, const ToolpathRequest& request,
    const std::function<void(std::size_t done, std::size_t total)>& progress) {
    const PartRegions regions(contours);
    ToolRuns runs = toolRuns(contours, regions, request.distances, request.part, progress);
    const std::vector<CutUnit> units = cutUnits(contours.size(), std::move(runs.passes));
    CutOrder order(holdersOfUnits(units, regions.nesting().holders));
    ToolpathJob job(contours, regions, request);
    for (auto ready = order.ready(); !ready.empty(); ready = order.ready()) {
        const std::size_t next = nextUnit(ready, units, job.place());
        job.cutUnit(units[next]);
        order.finish(next);
    }
    ToolpathResult result{job.takeMoves(), job.takeCuts(), {}, std::move(runs.rest)};
    judgeLastPass(units, result);
    for (std::size_t i = 0; i < contours.size(); ++i)
        result.contours[i].runRound = !contours[i].closed;
    return result;
}

}  // namespace gmmachining
