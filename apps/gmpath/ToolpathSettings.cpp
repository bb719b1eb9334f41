// SPDX-License-Identifier: MIT
#include "apps/gmpath/ToolpathSettings.h"

#include <algorithm>
#include <cmath>
#include <filesystem>

#include "apps/gmpath/OptionKinds.h"
#include "drawing/InputError.h"

namespace gmpath {

using gmdrawing::InputError;
using gmmachining::MachineSettings;
using gmmachining::PartSide;
using gmmachining::ToolpathRequest;
using gmmachining::Units;

namespace {

constexpr int kMaxLevels = 1000;

/// Defaults that depend on the units.
struct UnitDefaults {
    double depth;
    double safeZ;
    double feed;
};

UnitDefaults defaultsOf(Units units) {
    constexpr UnitDefaults kMetric{1.0, 5.0, 1000.0};
    constexpr UnitDefaults kInch{0.04, 0.2, 40.0};
    return units == Units::kInches ? kInch : kMetric;
}

std::vector<double> distancesOf(const ToolpathOptions& options) {
    const double radius = 0.5 * options.tool;
    const double step = options.step.value_or(radius);
    std::vector<double> distances;
    for (int pass = options.count - 1; pass >= 0; --pass)
        distances.push_back(radius + options.stock + pass * step);
    return distances;
}

std::vector<double> levelsOf(const ToolpathOptions& options, Units units) {
    const double depth = options.depth.value_or(defaultsOf(units).depth);
    const double stepDown = options.stepDown.value_or(depth);
    // A last level that differs from the one before by rounding alone is none.
    constexpr double kRounding = 1e-9;
    const double count = std::max(1.0, std::ceil(depth / stepDown - kRounding));
    if (count > kMaxLevels) {
        throw InputError("--step-down: takes more than " + std::to_string(kMaxLevels) + " levels");
    }
    std::vector<double> levels;
    for (int level = 1; level < count; ++level)
        levels.push_back(-level * stepDown);
    levels.push_back(-depth);
    return levels;
}

}  // namespace

void checkOptions(const ToolpathOptions& options) {
    if (distancesOf(options).front() > kLargestNumber) {
        throw InputError("--tool, --stock, --step: the first pass lies beyond 1e9");
    }
}

ToolpathRequest toolpathRequest(const ToolpathOptions& options, Units units) {
    const double radius = 0.5 * options.tool;
    ToolpathRequest request;
    request.distances = distancesOf(options);
    request.part = options.conventional ? PartSide::kLeft : PartSide::kRight;
    request.lead = {options.lead, options.leadLength.value_or(radius),
                    options.leadRadius.value_or(radius), options.leadAngle};
    request.levels = levelsOf(options, units);
    request.safeZ = options.safeZ.value_or(defaultsOf(units).safeZ);
    return request;
}

MachineSettings machineSettings(const ToolpathOptions& options, Units units) {
    constexpr double kPlungeOfFeed = 1.0 / 3.0;
    MachineSettings settings;
    settings.units = units;
    settings.feed = options.feed.value_or(defaultsOf(units).feed);
    settings.plunge =
        options.plunge.value_or(std::max(kPlungeOfFeed * settings.feed, kSmallestProgramValue));
    settings.spindle = options.spindle;
    settings.toolDiameter = options.tool;
    settings.partName = std::filesystem::path(options.input.drawing).filename().string();
    return settings;
}

}  // namespace gmpath
