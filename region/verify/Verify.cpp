// SPDX-License-Identifier: MIT
#include "gmregion/Verify.h"

#include <algorithm>
#include <cmath>

#include "region/verify/BooleanVerifier.h"
#include "region/verify/LoopCheck.h"
#include "region/verify/OffsetVerifier.h"

namespace gmregion {

namespace {

/// The loops of a set as a view; owns their ends.
class SetView {
public:
    explicit SetView(const RegionSet& set) : m_set(&set) {
        for (const Loop& loop : set.loops())
            m_ends.push_back(loop.last);
    }
    LoopsView view() const { return {&m_set->elements(), &m_ends}; }

private:
    const RegionSet* m_set;
    std::vector<Index> m_ends;
};

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
    Verdict verdict;
    FaultList faults(verdict);
    if (!(std::fabs(distance) <= 1e12)) {
        faults.add(FaultKind::kUndefined, {}, 0.0, 0);
        return verdict;
    }
    const SetView sourceView(source);
    const SetView resultView(result);
    OffsetVerifier verifier;
    verifier.verify(sourceView.view(), distance, resultView.view(), options,
                    std::max(source.tolerance(), result.tolerance()), faults);
    return verdict;
}

Verdict verifyBoolean(const RegionSet& first, const RegionSet& second, Combination combination,
                      const RegionSet& result) {
    Verdict verdict;
    FaultList faults(verdict);
    const SetView firstView(first);
    const SetView secondView(second);
    const SetView resultView(result);
    const double tolerance = std::max({first.tolerance(), second.tolerance(), result.tolerance()});
    BooleanVerifier verifier;
    verifier.verify(firstView.view(), secondView.view(), combination, resultView.view(), tolerance,
                    faults);
    return verdict;
}

}  // namespace gmregion
