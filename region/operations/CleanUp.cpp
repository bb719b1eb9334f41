// SPDX-License-Identifier: MIT
#include "gmregion/CleanUp.h"

#include "region/operations/Scratch.h"
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
    OverlayScratch& scratch = workspace.begin().overlay;
    const Extent extent = extentOf(paths);
    if (extent.refusal) return refuse(outcome, extent.refusal);
    const double tolerance = toleranceFor(extent, options.tolerance);
    Refusal refusal = checkedTolerance(extent, tolerance);
    if (refusal) return refuse(outcome, refusal);
    OriginSource source;
    source.list = &scratch.origins;
    const auto fill = [&](Strands& strands) {
        scratch.origins.clear();
        refusal = takePaths(paths, tolerance, true, {1, 0}, strands, scratch.origins);
        if (refusal) strands.clear();
        return kNone;
    };
    const bool found =
        overlayInAttempts(scratch, tolerance, fill, source, coveredBy(options.rule), outcome);
    return refusal ? refuse(outcome, refusal) : found;
}

Outcome cleanUp(const Paths& paths, const CleanUpOptions& options) {
    Workspace workspace;
    Outcome outcome;
    cleanUp(paths, options, workspace, outcome);
    return outcome;
}

}  // namespace gmregion
