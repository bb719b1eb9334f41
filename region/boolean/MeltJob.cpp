// SPDX-License-Identifier: MIT
/// @file
/// Melting pairs of contours, with a check of what comes of it.
///
/// The loops come from the kernel, which walks from crossing to crossing. What a loop runs round
/// follows from the side on which it lies of the contour that it does not follow. The check needs
/// no crossings: samples of an outline lie inside neither contour, those of a common part outside
/// neither, and by inclusion and exclusion the areas of all loops add up to those of both contours.
/// It finds loops that are wrong or missing; it mends none. Cost: the kernel's, plus the product of
/// the numbers of elements.

#include "region/boolean/MeltJob.h"

#include <cmath>

#include "region/bridge/MeltByKernel.h"
#include "region/model/Area.h"
#include "region/model/Box.h"
#include "region/model/Winding.h"

namespace gmregion {

namespace {

/// The areas of the loops may differ from those of the contours by this share.
constexpr double kAreaPrecision = 1e-6;

/// Points nearer to a path than this count as points of it.
constexpr double kPlacePrecision = 10.0 * kKernelTolerance;

Path counterClockwise(const Path& path) {
    return sense(path) == Sense::kClockwise ? reversed(path) : path;
}

/// Where a point lies to a closed path; points nearer than the tolerance lie on it.
enum class Place { kInside, kOutside, kOn };

Place placeOf(Vec2 p, const Path& path) {
    if (distance(path, p) < kPlacePrecision) return Place::kOn;
    return windingNumber(path, p) != 0 ? Place::kInside : Place::kOutside;
}

/// Points spread over the elements of a path.
std::vector<Vec2> samplesOf(const Path& path) {
    std::vector<Vec2> samples;
    for (const Element& e : path.elements) {
        for (const double t : {0.02, 0.2, 0.4, 0.6, 0.8, 0.98})
            samples.push_back(pointAt(e, t));
    }
    return samples;
}

/// How many sample points of a path lie where, seen from another one.
struct Places {
    std::size_t inside = 0;
    std::size_t outside = 0;
};

Places placesOf(const Path& path, const Path& other) {
    Places places;
    for (const Vec2 p : samplesOf(path)) {
        const Place place = placeOf(p, other);
        places.inside += place == Place::kInside ? 1 : 0;
        places.outside += place == Place::kOutside ? 1 : 0;
    }
    return places;
}

/// A loop follows one contour where it is inside the other one, or where it is outside. Its longest
/// element tells most surely.
LoopKind kindOf(const Path& loop, const Path& a, const Path& b) {
    const Vec2 p = halvingPoint(longestElement(loop));
    const Path& other = distance(a, p) < distance(b, p) ? b : a;
    return windingNumber(other, p) != 0 ? LoopKind::kCommon : LoopKind::kOutline;
}

bool isSound(const MeltLoop& loop, const Path& a, const Path& b) {
    const Places inA = placesOf(loop.path, a);
    const Places inB = placesOf(loop.path, b);
    if (loop.kind == LoopKind::kOutline) return inA.inside + inB.inside == 0;
    return inA.outside + inB.outside == 0;
}

bool areSound(const std::vector<MeltLoop>& loops, const Path& a, const Path& b) {
    std::size_t outlines = 0;
    for (const MeltLoop& loop : loops) {
        const bool around = loop.kind == LoopKind::kOutline && signedArea(loop.path) > 0.0;
        outlines += around ? 1 : 0;
        if (!isSound(loop, a, b)) return false;
    }
    return outlines == 1;
}

bool areasAddUp(const std::vector<MeltLoop>& loops, const Path& a, const Path& b) {
    double sum = 0.0;
    for (const MeltLoop& loop : loops)
        sum += signedArea(loop.path);
    const double expected = signedArea(a) + signedArea(b);
    return std::abs(sum - expected) <= kAreaPrecision * expected;
}

/// What to say of contours whose boundaries give no loops.
MeltOutcome outcomeWithoutLoops(const Path& a, const Path& b) {
    const Places ofA = placesOf(a, b);
    const Places ofB = placesOf(b, a);
    if (ofA.inside + ofA.outside == 0) return MeltOutcome::kSame;
    if (ofA.inside > 0 && ofA.outside == 0) return MeltOutcome::kFirstInside;
    if (ofB.inside > 0 && ofB.outside == 0) return MeltOutcome::kSecondInside;
    return ofA.inside + ofB.inside == 0 ? MeltOutcome::kApart : MeltOutcome::kFailed;
}

MeltedPair melt(const Path& a, const Path& b) {
    MeltedPair pair{};
    KernelLoops melted = meltByKernel(a, b);
    pair.refusal = melted.refusal;
    if (pair.refusal != Refusal::kNone) {
        pair.outcome = MeltOutcome::kRefused;
        return pair;
    }
    for (Path& loop : melted.loops) {
        const LoopKind kind = kindOf(loop, a, b);
        pair.loops.push_back({kind, std::move(loop)});
    }
    if (!melted.meet) {
        pair.outcome = outcomeWithoutLoops(a, b);
    } else {
        const bool sound = areSound(pair.loops, a, b) && areasAddUp(pair.loops, a, b);
        pair.outcome = sound ? MeltOutcome::kLoops : MeltOutcome::kFailed;
    }
    return pair;
}

}  // namespace

std::vector<MeltedPair> meltContours(const std::vector<Path>& first,
                                     const std::vector<Path>& second) {
    std::vector<MeltedPair> pairs;
    for (std::size_t i = 0; i < first.size(); ++i) {
        for (std::size_t j = 0; j < second.size(); ++j) {
            if (sense(first[i]) == Sense::kNone || sense(second[j]) == Sense::kNone) continue;
            if (!boundingBox(first[i]).overlaps(boundingBox(second[j]))) continue;
            MeltedPair pair = melt(counterClockwise(first[i]), counterClockwise(second[j]));
            pair.first = i;
            pair.second = j;
            pairs.push_back(std::move(pair));
        }
    }
    return pairs;
}

}  // namespace gmregion
