// SPDX-License-Identifier: MIT
/// @file
/// Offsets of sets and of paths.
///
/// What is near a threshold, or was found with another tolerance, is laid over itself once more.
#include "gmregion/Offset.h"

#include <algorithm>
#include <cmath>

#include "region/offset/OffsetAttempts.h"
#include "region/operations/Scratch.h"
#include "region/overlay/Intake.h"
#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

/// In tolerances: an offset by no more is a copy.
constexpr double kCopies = 0.5;

/// The offset of the source that a scratch holds.
bool offsetSource(Scratch& scratch, const OriginSource& origins, double distance, double tolerance,
                  const OffsetOptions& options, bool isOpen, Outcome& outcome) {
    if (!offsetInAttempts(scratch.overlay, scratch.offset, origins, distance, tolerance, options,
                          isOpen, outcome))
        return false;
    if (outcome.regions.tolerance() < tolerance || !outcome.marginal.empty())
        consolidate(scratch.overlay, std::max(tolerance, outcome.regions.tolerance()), outcome);
    return true;
}

}  // namespace

bool offset(const RegionSet& source, double distance, const OffsetOptions& options,
            Workspace& workspace, Outcome& outcome) {
    return offsetSeries(source, &distance, 1, options, workspace, &outcome);
}

Outcome offset(const RegionSet& source, double distance, const OffsetOptions& options) {
    Workspace workspace;
    Outcome outcome;
    offset(source, distance, options, workspace, outcome);
    return outcome;
}

bool offsetSeries(const RegionSet& source, const double* distances, std::size_t count,
                  const OffsetOptions& options, Workspace& workspace, Outcome* outcomes) {
    Scratch& scratch = workspace.begin();
    scratch.offset.source.take(source);
    OriginSource origins;
    origins.first = &source;
    for (std::size_t i = 0; i < count; ++i) {
        const Refusal refusal = checkedOffset(distances[i], options);
        if (refusal) return refuse(outcomes[i], refusal);
        const bool isCopy = std::fabs(distances[i]) <= kCopies * source.tolerance();
        if (source.empty() || isCopy) {
            outcomes[i].regions = source;
            outcomes[i].marginal.clear();
            outcomes[i].refusal = {};
        } else if (!offsetSource(scratch, origins, distances[i], source.tolerance(), options, false,
                                 outcomes[i])) {
            return false;
        }
    }
    return true;
}

bool thicken(const Paths& paths, double halfWidth, double tolerance, const OffsetOptions& options,
             Workspace& workspace, Outcome& outcome) {
    Scratch& scratch = workspace.begin();
    const Extent extent = extentOf(paths);
    Refusal refusal = extent.refusal ? extent.refusal : checkedOffset(halfWidth, options);
    if (!refusal && !(halfWidth > 0.0)) refusal = {Reason::kOutOfRange, {}, 0};
    const double coincident = toleranceFor(extent, tolerance);
    if (!refusal) refusal = checkedTolerance(extent, coincident);
    if (!refusal && extent.size > 0.0 && halfWidth <= kCopies * coincident)
        refusal = {Reason::kTolerance, {}, 0};
    if (refusal) return refuse(outcome, refusal);
    Strands& strands = scratch.overlay.arrangement.strands();
    strands.clear();
    scratch.overlay.origins.clear();
    refusal = takePaths(paths, coincident, false, {1, 0}, strands, scratch.overlay.origins);
    if (refusal) return refuse(outcome, refusal);
    scratch.overlay.order.improve(strands, kNone);
    scratch.offset.source.take(strands);
    if (scratch.offset.source.elements().empty()) {
        beginOutcome(outcome, coincident);
        return true;
    }
    OriginSource origins;
    origins.list = &scratch.overlay.origins;
    return offsetSource(scratch, origins, halfWidth, coincident, options, true, outcome);
}

bool opened(const RegionSet& source, double radius, Workspace& workspace, Outcome& outcome) {
    if (!(radius >= 0.0)) return refuse(outcome, {Reason::kOutOfRange, {}, 0});
    Outcome shrunk;
    if (!offset(source, -radius, {}, workspace, shrunk)) return refuse(outcome, shrunk.refusal);
    return offset(shrunk.regions, radius, {}, workspace, outcome);
}

bool closed(const RegionSet& source, double radius, Workspace& workspace, Outcome& outcome) {
    if (!(radius >= 0.0)) return refuse(outcome, {Reason::kOutOfRange, {}, 0});
    Outcome grown;
    if (!offset(source, radius, {}, workspace, grown)) return refuse(outcome, grown.refusal);
    return offset(grown.regions, -radius, {}, workspace, outcome);
}

}  // namespace gmregion
