// SPDX-License-Identifier: MIT
#include "tests/support/TwoEngines.h"

#include <cmath>
#include <random>
#include <vector>

#include "gmregion/Offset.h"
#include "gmregion/Questions.h"

#include "part/kernel/OffsetByKernel.h"
#include "part/model/Area.h"
#include "part/offset/KernelOffset.h"
#include "part/regions/ContourRegions.h"

namespace engines {

using gmpart::KernelVerdict;
using gmpart::kPi;
using gmpart::Path;
using gmpart::Sense;
using gmregion::Element;
using gmregion::Outcome;
using gmregion::RegionSet;
using gmregion::Vec2;

namespace {

/// What lengths and areas may differ by: the kernel keeps distances within its tolerance, and where
/// offsets meet at a small angle that moves their crossing.
constexpr double kLengthSlack = 0.02;
constexpr double kAreaSlackOfLength = 2e-3;

/// Number, length and area of the loops that the check of the kernel's offsets cannot pass over.
struct Sums {
    std::size_t loops = 0;
    double length = 0.0;
    double area = 0.0;
};

Sums sumsOf(const RegionSet& set) {
    constexpr double kThinnest = 4e-3;
    Sums sums;
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        const gmregion::LoopRange range = gmregion::loopAlone(loop);
        const double length = perimeter(set, range);
        const double enclosed = area(set, range);
        if (std::abs(enclosed) <= kThinnest * length) continue;
        ++sums.loops;
        sums.length += length;
        sums.area += enclosed;
    }
    return sums;
}

std::string differenceOf(const RegionSet& byKernel, const RegionSet& byRegions) {
    const Sums one = sumsOf(byKernel);
    const Sums other = sumsOf(byRegions);
    if (one.loops != other.loops) {
        return std::to_string(one.loops) + " loops, and " + std::to_string(other.loops) +
               " by regions";
    }
    const double longer = std::abs(one.length - other.length);
    if (longer > kLengthSlack + 1e-4 * other.length) return "length by " + std::to_string(longer);
    const double larger = std::abs(one.area - other.area);
    if (larger > kAreaSlackOfLength * other.length + 1e-6) {
        return "area by " + std::to_string(larger);
    }
    return {};
}

}  // namespace

Comparison compare(const Path& contour, double distance) {
    const double tolerance = gmpart::partTolerance({contour});
    const RegionSet source = gmpart::contourRegions({contour}, tolerance).front();
    if (source.loops().size() != 1) return {false, false, {}, false, {}};
    const bool outsideIsRight = sense(contour) == Sense::kCounterClockwise;
    const gmpart::KernelOffset made =
        gmpart::offsetByKernel(contour, outsideIsRight ? distance : -distance);
    if (!made.accepted()) return {true, false, "refused", false, {}};
    const KernelVerdict checked = gmpart::checkKernelOffset(source, distance, made.results);
    if (!checked.verdict.isSound()) {
        return {true, false, textOf(checked.verdict.faults.front().kind), false, {}};
    }
    const Outcome byRegions = gmregion::offset(source, distance);
    if (byRegions.refusal) return {true, true, {}, false, textOf(byRegions.refusal.reason)};
    const std::string difference = differenceOf(checked.regions, byRegions.regions);
    return {true, true, {}, difference.empty(), difference};
}

void Tally::add(const Comparison& found) {
    if (!found.suits) return;
    ++asked;
    compared += found.kernelHolds ? 1 : 0;
    differ += found.kernelHolds && !found.agree ? 1 : 0;
}

Path randomContour(unsigned seed, std::size_t elements) {
    std::mt19937 dice(seed);
    const auto number = [&](double low, double high) {
        return low + (high - low) * (static_cast<double>(dice()) / 4294967296.0);
    };
    std::vector<Vec2> corners;
    for (std::size_t i = 0; i < elements; ++i) {
        const double angle =
            2.0 * kPi * (static_cast<double>(i) + number(0.0, 0.7)) / static_cast<double>(elements);
        const double r = number(15.0, 50.0);
        corners.push_back({r * std::cos(angle), r * std::sin(angle)});
    }
    Path contour{{}, true, {}};
    for (std::size_t i = 0; i < elements; ++i) {
        const bool isArc = dice() % 3 == 0;
        const double bulge = isArc ? number(-0.3, 0.3) : 0.0;
        contour.elements.push_back({corners[i], corners[(i + 1) % elements], bulge});
    }
    return contour;
}

}  // namespace engines
