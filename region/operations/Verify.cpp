// SPDX-License-Identifier: MIT
#include "gmregion/Verify.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "region/operations/Scratch.h"
#include "region/verify/BooleanVerifier.h"
#include "region/verify/OffsetVerifier.h"

namespace gmregion {

namespace {

/// The loops of a set as a view.
/// @param ends gets the ends of the loops
LoopsView viewOf(const RegionSet& set, std::vector<Index>& ends) {
    ends.clear();
    for (const Loop& loop : set.loops())
        ends.push_back(loop.last);
    return {&set.elements(), &ends};
}

}  // namespace

const char* textOf(FaultKind kind) {
    switch (kind) {
        case FaultKind::kTooNear:
            return "nearer to the source than the distance";
        case FaultKind::kTooFar:
            return "farther from the source than the distance";
        case FaultKind::kMissing:
            return "a piece of the true boundary is missing";
        case FaultKind::kWrongSide:
            return "on the other side of the source";
        case FaultKind::kWrongSense:
            return "runs the wrong way";
        case FaultKind::kOpenLoop:
            return "a loop is not closed";
        case FaultKind::kShort:
            return "an element is shorter than the tolerance";
        case FaultKind::kCrossing:
            return "elements cross or run along each other";
        case FaultKind::kNesting:
            return "a loop does not nest";
        case FaultKind::kForeign:
            return "on no boundary of an operand";
        case FaultKind::kWinding:
            return "covers what it must not, or not what it must";
        case FaultKind::kArea:
            return "the area does not fit";
        case FaultKind::kUndefined:
            return "a number is not finite";
    }
    return "unknown fault";
}

Verdict verifyOffset(const RegionSet& source, double distance, const RegionSet& result,
                     const OffsetOptions& options) {
    Workspace workspace;
    Verdict verdict;
    verifyOffset(source, distance, result, options, workspace, verdict);
    return verdict;
}

bool verifyOffset(const RegionSet& source, double distance, const RegionSet& result,
                  const OffsetOptions& options, Workspace& workspace, Verdict& verdict) {
    verdict.faults.clear();
    verdict.count = 0;
    FaultList faults(verdict);
    if (!(std::fabs(distance) <= 1e12)) {
        faults.add(FaultKind::kUndefined, {}, 0.0, 0);
        return false;
    }
    VerifyScratch& scratch = workspace.begin().verify;
    scratch.offset.verify(viewOf(source, scratch.sourceEnds), distance,
                          viewOf(result, scratch.resultEnds), options,
                          std::max(source.tolerance(), result.tolerance()), faults);
    return verdict.isSound();
}

Verdict verifyBoolean(const RegionSet& first, const RegionSet& second, Combination combination,
                      const RegionSet& result) {
    Verdict verdict;
    FaultList faults(verdict);
    std::array<std::vector<Index>, 3> ends;
    const double tolerance = std::max({first.tolerance(), second.tolerance(), result.tolerance()});
    BooleanVerifier verifier;
    verifier.verify(viewOf(first, ends[0]), viewOf(second, ends[1]), combination,
                    viewOf(result, ends[2]), tolerance, faults);
    return verdict;
}

}  // namespace gmregion
