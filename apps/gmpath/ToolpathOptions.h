// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "apps/gmpath/InputOptions.h"
#include "machining/gcode/MachineUnits.h"
#include "machining/leads/Leads.h"

namespace gmpath {

/// Options of `toolpath`, in units of the drawing. What is left out has a default that depends on
/// the tool or on the units.
struct ToolpathOptions {
    InputOptions input;
    double tool = 0.0;  ///< diameter
    double stock = 0.0;
    int count = 1;
    std::optional<double> step;
    gmmachining::LeadKind lead = gmmachining::LeadKind::kNone;
    std::optional<double> leadLength;
    std::optional<double> leadRadius;
    double leadAngle = 90.0;  ///< degrees
    std::optional<double> depth;
    std::optional<double> stepDown;
    std::optional<double> safeZ;
    std::optional<double> feed;
    std::optional<double> plunge;
    std::optional<double> spindle;
    bool conventional = false;
    std::optional<gmmachining::Units> units;
    std::vector<std::string> outputs;
};

/// The least of what goes into a program for a machine with few decimals, and must not vanish
/// there.
constexpr double kSmallestProgramValue = 1e-3;

/// Adds the options to a command, each with the check of its own range.
void addToolpathOptions(CLI::App& command, ToolpathOptions& options);

}  // namespace gmpath
