// SPDX-License-Identifier: MIT
/// @file
/// Offsets, with what is tried in which order.
///
/// Round joins and ends go by raw parallels. Should the result not pass its check, the same is
/// tried without trimmed neighbours, then a third of a tolerance beside the distance, where no
/// threshold is the same, then as a union of strips, and at last so with parts of the tolerance.
/// Other joins and ends are unions of strips from the start. What is near a threshold, or was found
/// with another tolerance, is laid over itself once more.
#include "gmregion/Offset.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "region/operations/Scratch.h"
#include "region/overlay/Intake.h"
#include "region/overlay/Overlay.h"

namespace gmregion {

namespace {

/// In distances: the coarsest tolerance that an offset is computed with.
constexpr double kCoarsest = 1.0 / 64.0;
/// In tolerances: an offset by no more is a copy.
constexpr double kCopies = 0.5;
/// In tolerances: how far beside the distance a second attempt goes.
constexpr double kBeside = 1.0 / 3.0;
/// Of the tolerance, for the last attempts.
constexpr std::array<double, 3> kFinerShares{1.0 / 2.0, 1.0 / 16.0, 1.0 / 1024.0};

Refusal checked(double distance, const OffsetOptions& options) {
    if (!std::isfinite(distance) || !std::isfinite(options.miterLimit))
        return {Reason::kNotFinite, {}, 0};
    if (std::fabs(distance) > kLargestCoordinate || options.miterLimit < 1.0)
        return {Reason::kOutOfRange, {}, 0};
    return {};
}

bool isRound(const OffsetOptions& options, bool isOpen) {
    return options.join == Join::kRound && (!isOpen || options.end == End::kRound);
}

/// Tries one way after the other.
bool attempt(Scratch& scratch, const OriginSource& origins, double distance, double fine,
             const OffsetOptions& options, bool isOpen, Outcome& outcome) {
    OverlayScratch& overlay = scratch.overlay;
    OffsetScratch& offsets = scratch.offset;
    const double beside = distance > 0.0 ? kBeside * fine : -kBeside * fine;
    if (isRound(options, isOpen)) {
        if (roundOffset(overlay, offsets, origins, distance, fine, true, outcome)) return true;
        if (roundOffset(overlay, offsets, origins, distance, fine, false, outcome)) return true;
        if (roundOffset(overlay, offsets, origins, distance + beside, fine, false, outcome))
            return true;
    }
    if (stripOffset(overlay, offsets, origins, distance, fine, options, outcome)) return true;
    for (const double share : kFinerShares) {
        if (stripOffset(overlay, offsets, origins, distance + beside, share * fine, options,
                        outcome))
            return true;
    }
    return false;
}

/// The finest tolerance that the numbers of an offset bear.
double finestFor(const OffsetSource& source, double distance) {
    const Box box = source.bounds().grown(std::fabs(distance));
    const Vec2 low = box.low;
    const Vec2 high = box.high;
    return std::max({-low.x, -low.y, high.x, high.y}) * kFinestTolerance;
}

/// The offset of the source that a scratch holds.
bool offsetSource(Scratch& scratch, const OriginSource& origins, double distance, double tolerance,
                  const OffsetOptions& options, bool isOpen, Outcome& outcome) {
    const double fine = std::max(std::min(tolerance, std::fabs(distance) * kCoarsest),
                                 finestFor(scratch.offset.source, distance));
    if (!attempt(scratch, origins, distance, fine, options, isOpen, outcome)) return false;
    if (outcome.regions.tolerance() < tolerance || !outcome.marginal.empty())
        consolidate(scratch.overlay, std::max(tolerance, fine), outcome);
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
        const Refusal refusal = checked(distances[i], options);
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
    Refusal refusal = extent.refusal ? extent.refusal : checked(halfWidth, options);
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
