// SPDX-License-Identifier: MIT
/// @file
/// What is tried in which order.
///
/// Round joins and ends go by raw parallels. Should the result not pass its check, the same is
/// tried without trimmed neighbours, then a third of a tolerance beside the distance, where no
/// threshold is the same, then with parts of the tolerance, then as a union of strips, and at last
/// so with parts of the tolerance. Other joins and ends are unions of strips from the start.
#include "region/offset/OffsetAttempts.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "region/overlay/Intake.h"

namespace gmregion {

namespace {

/// In distances: the coarsest tolerance that an offset is computed with.
constexpr double kCoarsest = 1.0 / 64.0;
/// In tolerances: how far beside the distance a second attempt goes.
constexpr double kBeside = 1.0 / 3.0;
/// Of the tolerance, for the last attempts.
constexpr std::array<double, 3> kFinerShares{1.0 / 2.0, 1.0 / 16.0, 1.0 / 1024.0};

/// The finest tolerance that the numbers of an offset bear.
double finestFor(const OffsetSource& source, double distance) {
    const Box box = source.bounds().grown(std::fabs(distance));
    return std::max({-box.low.x, -box.low.y, box.high.x, box.high.y}) * kFinestTolerance;
}

bool isRound(const OffsetOptions& options, bool isOpen) {
    return options.join == Join::kRound && (!isOpen || options.end == End::kRound);
}

}  // namespace

Refusal checkedOffset(double distance, const OffsetOptions& options) {
    if (!std::isfinite(distance) || !std::isfinite(options.miterLimit))
        return {Reason::kNotFinite, {}, 0};
    if (std::fabs(distance) > kLargestCoordinate || options.miterLimit < 1.0)
        return {Reason::kOutOfRange, {}, 0};
    return {};
}

const MadeOf* offsetInAttempts(OverlayScratch& scratch, OffsetScratch& offsets,
                               const OriginSource& origins, double distance, double tolerance,
                               const OffsetOptions& options, bool isOpen, Outcome& outcome) {
    const double fine = std::max(std::min(tolerance, std::fabs(distance) * kCoarsest),
                                 finestFor(offsets.source, distance));
    const double beside = distance + (distance > 0.0 ? kBeside * fine : -kBeside * fine);
    const auto byParallels = [&](double d, double share, bool trims) {
        return roundOffset(scratch, offsets, origins, d, share * fine, trims, outcome);
    };
    const auto byStrips = [&](double d, double share) {
        return stripOffset(scratch, offsets, origins, d, share * fine, options, outcome);
    };
    if (isRound(options, isOpen)) {
        bool isMade = byParallels(distance, 1.0, true) || byParallels(distance, 1.0, false);
        isMade = isMade || byParallels(beside, 1.0, false);
        for (std::size_t i = 0; !isMade && i < kFinerShares.size(); ++i)
            isMade = byParallels(beside, kFinerShares[i], false);
        if (isMade) return &offsets.raw.madeOf();
    }
    bool isMade = byStrips(distance, 1.0);
    for (std::size_t i = 0; !isMade && i < kFinerShares.size(); ++i)
        isMade = byStrips(beside, kFinerShares[i]);
    return isMade ? &offsets.strips.madeOf() : nullptr;
}

}  // namespace gmregion
