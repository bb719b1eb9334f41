// SPDX-License-Identifier: MIT
/// @file
/// Offsets of paths to one side.
#include "gmregion/Parallels.h"

#include <cmath>

#include "region/offset/OffsetAttempts.h"
#include "region/operations/Scratch.h"
#include "region/overlay/Intake.h"

namespace gmregion {

namespace {

void clear(Parallels& parallels) {
    parallels.parts.clear();
    parallels.elements.clear();
    parallels.origins.clear();
    parallels.marginal.clear();
    parallels.refusal = {};
}

bool refuse(Parallels& parallels, const Refusal& refusal) {
    clear(parallels);
    parallels.refusal = refusal;
    return false;
}

/// Appends what lies beside one path.
bool appendParallels(Scratch& scratch, const Strands& path, double distance, double tolerance,
                     const OffsetOptions& options, Parallels& parallels) {
    Outcome& outcome = scratch.outcome;
    scratch.offset.source.take(path);
    if (scratch.offset.source.elements().empty()) return true;
    OriginSource origins;
    origins.list = &scratch.overlay.origins;
    const MadeOf* madeOf = offsetInAttempts(scratch.overlay, scratch.offset, origins,
                                            std::fabs(distance), tolerance, options, true, outcome);
    if (madeOf == nullptr) return refuse(parallels, outcome.refusal);
    parallels.marginal.insert(parallels.marginal.end(), outcome.marginal.begin(),
                              outcome.marginal.end());
    scratch.sides.write(scratch.overlay, scratch.offset.source, *madeOf, distance < 0.0, parallels);
    return true;
}

}  // namespace

bool makeParallels(const Paths& paths, double distance, double tolerance,
                   const OffsetOptions& options, Workspace& workspace, Parallels& parallels) {
    Scratch& scratch = workspace.begin();
    clear(parallels);
    const Extent extent = extentOf(paths);
    Refusal refusal = extent.refusal ? extent.refusal : checkedOffset(distance, options);
    const double coincident = toleranceFor(extent, tolerance);
    if (!refusal) refusal = checkedTolerance(extent, coincident);
    if (!refusal && extent.size > 0.0 && std::fabs(distance) <= 0.5 * coincident)
        refusal = {Reason::kTolerance, {}, 0};
    Strands& strands = scratch.paths;
    strands.clear();
    scratch.overlay.origins.clear();
    if (!refusal)
        refusal = takePaths(paths, coincident, false, {1, 0}, strands, scratch.overlay.origins);
    if (refusal) return refuse(parallels, refusal);
    OffsetOptions round = options;
    round.end = End::kRound;
    Strands& path = scratch.path;
    for (const Strand& strand : strands.strands) {
        path.clear();
        path.elements.assign(strands.elements.begin() + strand.first,
                             strands.elements.begin() + strand.last);
        path.endStrand(strand.closed, strand.weight);
        if (!appendParallels(scratch, path, distance, coincident, round, parallels)) return false;
    }
    return true;
}

Parallels makeParallels(const Paths& paths, double distance, const OffsetOptions& options) {
    Workspace workspace;
    Parallels parallels;
    makeParallels(paths, distance, 0.0, options, workspace, parallels);
    return parallels;
}

}  // namespace gmregion
