// SPDX-License-Identifier: MIT
#include "apps/gmpath/ToolpathSettings.h"

#include <algorithm>
#include <cmath>
#include <filesystem>

#include "apps/gmpath/OptionKinds.h"
#include "drawing/InputError.h"

namespace gmpath {

using gmdrawing::DrawingUnits;
using gmdrawing::InputError;
using gmdrawing::Length;
using gmdrawing::lengthIn;
using gmmachining::MachineSettings;
using gmmachining::machineUnits;
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

/// The lengths of the options in units of the drawing, with what takes the place of those left out.
class Lengths {
public:
    Lengths(const ToolpathOptions& options, const DrawingUnits& drawing, Units units)
        : m_options(options), m_drawing(drawing), m_defaults(defaultsOf(units)) {}

    double tool() const { return of(m_options.tool); }
    double radius() const { return 0.5 * tool(); }
    double stock() const { return of(m_options.stock); }
    double step() const { return of(m_options.step, radius()); }
    double leadLength() const { return of(m_options.leadLength, radius()); }
    double leadRadius() const { return of(m_options.leadRadius, radius()); }
    double depth() const { return of(m_options.depth, m_defaults.depth); }
    double stepDown() const { return of(m_options.stepDown, depth()); }
    double safeZ() const { return of(m_options.safeZ, m_defaults.safeZ); }
    double feed() const { return of(m_options.feed, m_defaults.feed); }
    double plunge() const {
        constexpr double kPlungeOfFeed = 1.0 / 3.0;
        return of(m_options.plunge, std::max(kPlungeOfFeed * feed(), kSmallestProgramValue));
    }

private:
    double of(Length length) const { return lengthIn(m_drawing, length); }
    double of(const std::optional<Length>& length, double otherwise) const {
        return length ? of(*length) : otherwise;
    }

    const ToolpathOptions& m_options;
    const DrawingUnits& m_drawing;
    UnitDefaults m_defaults;
};

std::vector<double> distancesOf(const ToolpathOptions& options, const Lengths& lengths) {
    std::vector<double> distances;
    for (int pass = options.count - 1; pass >= 0; --pass)
        distances.push_back(lengths.radius() + lengths.stock() + pass * lengths.step());
    if (distances.front() > kLargestNumber) {
        throw InputError("--tool, --stock, --step: the first pass lies beyond 1e9");
    }
    return distances;
}

std::vector<double> levelsOf(const Lengths& lengths) {
    const double depth = lengths.depth();
    const double stepDown = lengths.stepDown();
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

ToolpathRequest toolpathRequest(const ToolpathOptions& options, const DrawingUnits& drawing) {
    const Lengths lengths(options, drawing, machineUnits(drawing));
    ToolpathRequest request;
    request.distances = distancesOf(options, lengths);
    request.part = options.conventional ? PartSide::kLeft : PartSide::kRight;
    request.lead = {options.lead, lengths.leadLength(), lengths.leadRadius(), options.leadAngle};
    request.levels = levelsOf(lengths);
    request.safeZ = lengths.safeZ();
    return request;
}

MachineSettings machineSettings(const ToolpathOptions& options, const DrawingUnits& drawing) {
    MachineSettings settings;
    settings.units = machineUnits(drawing);
    const Lengths lengths(options, drawing, settings.units);
    settings.feed = lengths.feed();
    settings.plunge = lengths.plunge();
    settings.spindle = options.spindle;
    settings.toolDiameter = lengths.tool();
    settings.partName = std::filesystem::path(options.input.drawing).filename().string();
    return settings;
}

}  // namespace gmpath
