// SPDX-License-Identifier: MIT
/// @file
/// Two ways to an offset.
///
/// By raw parallels: cut at each other, chosen by their distance from the source, linked. What
/// comes out has to be consistent in itself (nodes, nesting) and with the source: between it and
/// the source lies no more than what the source sweeps, and no less than about a disc of the same
/// area, which of all shapes grows least (Brunn and Minkowski).
///
/// By strips: the union of all that the source sweeps, laid over it by winding numbers.
#include "region/offset/RoundOffset.h"

#include <algorithm>
#include <cmath>

#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

/// The least area by which something of an area grows.
double leastGrowth(double area, double distance) {
    return 2.0 * distance * std::sqrt(kPi * area) + kPi * distance * distance;
}

/// Whether the area of an offset agrees with that of its source.
bool areasAgree(const OffsetScratch& offsets, double result, double distance, double tolerance) {
    const double source = offsets.source.area();
    const double swept = offsets.raw.sweptArea();
    const double radius = std::fabs(distance);
    const double length = offsets.source.length() + 8.0 * swept / std::max(radius, tolerance);
    const double slack = 4.0 * tolerance * length + 1e-9 * (source + swept);
    if (offsets.source.loopEnds().empty()) return result == 0.0;
    if (distance > 0.0) {
        const double least = source + leastGrowth(std::max(0.0, source), radius);
        return result >= least - slack && result <= source + swept + slack;
    }
    const double most = result > 0.0 ? source - leastGrowth(result, radius) : source;
    return result <= most + slack && result >= source - swept - slack;
}

OriginSource withKinds(OriginSource origins, const MadeOf& madeOf) {
    origins.owners = &madeOf.owners;
    origins.kinds = &madeOf.kinds;
    return origins;
}

}  // namespace

bool roundOffset(OverlayScratch& scratch, OffsetScratch& offsets, const OriginSource& origins,
                 double distance, double tolerance, bool trims, Outcome& outcome) {
    Arrangement& arrangement = scratch.arrangement;
    offsets.raw.make(offsets.source, distance, tolerance, trims, arrangement.strands());
    beginOutcome(outcome, tolerance);
    if (!arrangement.settle(tolerance)) return refuseUnsettled(arrangement, outcome);
    scratch.fans.build(arrangement);
    scratch.loops.begin(arrangement, scratch.fans);
    if (!offsets.choice.choose(arrangement, scratch.fans, offsets.source, offsets.raw,
                               scratch.loops))
        return refuse(outcome, {Reason::kUncertified, offsets.choice.conflict(), 0});
    if (!scratch.loops.link())
        return refuse(outcome, {Reason::kUncertified, scratch.loops.conflict(), 0});
    if (!scratch.writer.write(arrangement, scratch.fans, scratch.loops,
                              withKinds(origins, offsets.raw.madeOf()), outcome.regions))
        return refuse(outcome, {Reason::kUncertified, scratch.writer.conflict(), 0});
    if (!areasAgree(offsets, scratch.writer.area(), distance, tolerance))
        return refuse(outcome, {Reason::kUncertified, {}, 0});
    outcome.marginal = offsets.choice.marginal();
    return true;
}

bool stripOffset(OverlayScratch& scratch, OffsetScratch& offsets, const OriginSource& origins,
                 double distance, double tolerance, const OffsetOptions& options,
                 Outcome& outcome) {
    Strands& strands = scratch.arrangement.strands();
    const bool grows = distance > 0.0;
    offsets.strips.make(offsets.source, distance, options, grows ? Weight{1, 0} : Weight{0, 1},
                        strands);
    offsets.strips.addSource(offsets.source, {1, 0}, strands);
    const Covers covers = grows ? Covers([](Weight w) { return w.a > 0; })
                                : Covers([](Weight w) { return w.a > 0 && w.b <= 0; });
    return overlay(scratch, tolerance, kNone, Care::kThorough,
                   withKinds(origins, offsets.strips.madeOf()), covers, outcome);
}

}  // namespace gmregion
