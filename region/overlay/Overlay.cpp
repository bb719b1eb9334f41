// SPDX-License-Identifier: MIT
/// @file
/// Strands laid over each other.
///
/// They are cut at each other, the winding numbers on both sides of every run are found, and those
/// runs that are covered on one side only bound the result.
#include "region/overlay/Overlay.h"

#include <utility>

#include "region/overlay/Intake.h"

namespace gmregion {

bool refuse(Outcome& outcome, const Refusal& refusal) {
    SetWriter::clear(outcome.regions, 0.0);
    outcome.marginal.clear();
    outcome.refusal = refusal;
    return false;
}

bool refuseUnsettled(const Arrangement& arrangement, Outcome& outcome) {
    const Reason reason = arrangement.isAtLimit() ? Reason::kWorkLimit : Reason::kUnsettled;
    return refuse(outcome, {reason, {}, 0});
}

void beginOutcome(Outcome& outcome, double tolerance) {
    SetWriter::clear(outcome.regions, tolerance);
    outcome.marginal.clear();
    outcome.refusal = {};
}

bool overlay(OverlayScratch& scratch, double tolerance, Index split, Care care,
             const OriginSource& source, Covers covers, Outcome& outcome) {
    Arrangement& arrangement = scratch.arrangement;
    beginOutcome(outcome, tolerance);
    if (arrangement.strands().elements.empty()) return true;
    if (!arrangement.settle(tolerance, split, care)) return refuseUnsettled(arrangement, outcome);
    scratch.fans.build(arrangement);
    if (!scratch.windings.find(arrangement, scratch.fans))
        return refuse(outcome, {Reason::kUncertified, scratch.windings.conflict(), 0});
    scratch.loops.begin(arrangement, scratch.fans);
    for (Index run = 0; run < arrangement.runs().size(); ++run) {
        if (!scratch.fans.stands(run)) continue;
        const bool onLeft = covers(scratch.windings.onLeft(run));
        const bool onRight = covers(scratch.windings.onRight(run));
        if (onLeft != onRight) scratch.loops.choose(run, onRight);
    }
    if (!scratch.loops.link())
        return refuse(outcome, {Reason::kUncertified, scratch.loops.conflict(), 0});
    if (scratch.writer.write(arrangement, scratch.fans, scratch.loops, source, outcome.regions))
        return true;
    return refuse(outcome, {Reason::kUncertified, scratch.writer.conflict(), 0});
}

void consolidate(OverlayScratch& scratch, double tolerance, Outcome& outcome) {
    std::swap(scratch.loose, outcome);
    OriginSource source;
    source.first = &scratch.loose.regions;
    Strands& strands = scratch.arrangement.strands();
    strands.clear();
    takeSet(scratch.loose.regions, {1, 0}, 0, strands);
    const Covers covers = [](Weight w) { return w.a > 0; };
    if (overlay(scratch, tolerance, kNone, Care::kUsual, source, covers, outcome))
        std::swap(outcome.marginal, scratch.loose.marginal);
    else
        std::swap(scratch.loose, outcome);
}

}  // namespace gmregion
