// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "apps/gmpath/InputOptions.h"
#include "machining/leads/Leads.h"

namespace gmpath {

/// Options of `toolpath`. What is left out has a default that depends on the tool or on the units.
struct ToolpathOptions {
    InputOptions input;
    gmdrawing::Length tool;  ///< diameter
    gmdrawing::Length stock;
    int count = 1;
    std::optional<gmdrawing::Length> step;
    gmmachining::LeadKind lead = gmmachining::LeadKind::kNone;
    std::optional<gmdrawing::Length> leadLength;
    std::optional<gmdrawing::Length> leadRadius;
    double leadAngle = 90.0;  ///< degrees
    std::optional<gmdrawing::Length> depth;
    std::optional<gmdrawing::Length> stepDown;
    std::optional<gmdrawing::Length> safeZ;
    std::optional<gmdrawing::Length> feed;
    std::optional<gmdrawing::Length> plunge;
    std::optional<double> spindle;
    bool conventional = false;
    bool anyway = false;  ///< writes the program in spite of what is wrong
    std::vector<std::string> outputs;
};

/// The least of what goes into a program for a machine with few decimals, and must not vanish
/// there.
constexpr double kSmallestProgramValue = 1e-3;

/// Adds the options to a command, each with the check of its own range.
void addToolpathOptions(CLI::App& command, ToolpathOptions& options);

}  // namespace gmpath
