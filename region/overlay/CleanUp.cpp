// SPDX-License-Identifier: MIT
#include "gmregion/CleanUp.h"

#include "region/overlay/Intake.h"
#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

Covers coveredBy(FillRule rule) {
    switch (rule) {
        case FillRule::kEvenOdd:
            return [](Weight w) { return w.a % 2 != 0; };
        case FillRule::kPositive:
            return [](Weight w) { return w.a > 0; };
        default:
            return [](Weight w) { return w.a != 0; };
    }
}

}  // namespace

double defaultTolerance(const Paths& paths) {
    return toleranceFor(extentOf(paths), 0.0);
}

bool cleanUp(const Paths& paths, const CleanUpOptions& options, Workspace& workspace,
             Outcome& outcome) {
    Scratch& scratch = workspace.scratch();
    const Extent extent = extentOf(paths);
    if (extent.refusal) return refuse(outcome, extent.refusal);
    const double tolerance = toleranceFor(extent, options.tolerance);
    const bool isFine = !(tolerance >= extent.largest * kFinestTolerance) || tolerance < 0.0;
    if (isFine || !(tolerance <= kLargestCoordinate))
        return refuse(outcome, {Reason::kTolerance, {}, 0});
    Strands& strands = scratch.arrangement.strands();
    strands.clear();
    scratch.origins.clear();
    const Refusal refusal = takePaths(paths, tolerance, true, strands, scratch.origins);
    if (refusal) return refuse(outcome, refusal);
    if (strands.elements.empty()) {
        beginOutcome(outcome, tolerance);
        return true;
    }
    OriginSource source;
    source.list = &scratch.origins;
    return overlay(scratch, tolerance, kNone, source, coveredBy(options.rule), outcome);
}

Outcome cleanUp(const Paths& paths, const CleanUpOptions& options) {
    Workspace workspace;
    Outcome outcome;
    cleanUp(paths, options, workspace, outcome);
    return outcome;
}

}  // namespace gmregion
