// SPDX-License-Identifier: MIT
#include "apps/gmpath/ToolpathOptions.h"

#include <map>
#include <string>

#include "apps/gmpath/OptionKinds.h"

namespace gmpath {

using gmdrawing::Length;
using gmmachining::LeadKind;
using gmregion::kKernelTolerance;

namespace {

constexpr int kMaxPasses = 1000;

/// Tools thinner than this come near to what the kernel takes for the same point.
constexpr double kThinnestTool = 20.0 * kKernelTolerance;

constexpr double kLargestLeadAngle = 270.0;

const std::map<std::string, LeadKind>& leadNames() {
    static const std::map<std::string, LeadKind> names = {
        {"none", LeadKind::kNone},
        {"line", LeadKind::kLine},
        {"perpendicular", LeadKind::kPerpendicular},
        {"arc", LeadKind::kArc}};
    return names;
}

void addPassOptions(CLI::App& command, ToolpathOptions& options) {
    command.add_option("-t,--tool", options.tool, "diameter of the tool")
        ->transform(lengthFrom(kThinnestTool))
        ->required();
    command.add_option("--stock", options.stock, "material left on the part [0]")
        ->transform(lengthFrom(0.0));
    command.add_option("--count", options.count, "number of passes, the last along the part")
        ->transform(countUpTo(kMaxPasses))
        ->capture_default_str();
    command
        .add_option("--step", options.step,
                    "distance from one pass to the next [radius of the tool]")
        ->transform(positiveLength());
    CLI::Option* climb =
        command.add_flag("--climb", "the part lies right of the tool (the default)");
    command.add_flag("--conventional", options.conventional, "the part lies left of the tool")
        ->excludes(climb);
}

void addLeadOptions(CLI::App& command, ToolpathOptions& options) {
    addNamedOption(command, "--lead", options.lead, leadNames(),
                   "none, line (along the cut), perpendicular or arc [none]");
    command
        .add_option("--lead-length", options.leadLength,
                    "length of straight leads [radius of the tool]")
        ->transform(positiveLength());
    command
        .add_option("--lead-radius", options.leadRadius, "radius of arc leads [radius of the tool]")
        ->transform(positiveLength());
    command.add_option("--lead-angle", options.leadAngle, "sweep of arc leads in degrees")
        ->transform(angleUpTo(kLargestLeadAngle))
        ->capture_default_str();
}

void addMachineOptions(CLI::App& command, ToolpathOptions& options) {
    const auto add = [&](const char* name, std::optional<Length>& value, const char* description) {
        command.add_option(name, value, description)->transform(lengthFrom(kSmallestProgramValue));
    };
    add("--depth", options.depth, "depth of the cut [1 mm, 0.04 in]");
    add("--step-down", options.stepDown, "depth from one level to the next [the whole depth]");
    add("--safe-z", options.safeZ, "height of rapid moves [5 mm, 0.2 in]");
    add("--feed", options.feed, "speed of cuts a minute [1000 mm, 40 in]");
    add("--plunge", options.plunge, "speed downwards a minute [a third of --feed]");
    command.add_option("--spindle", options.spindle, "turns of the tool a minute")
        ->transform(numberFrom(kSmallestProgramValue));
}

}  // namespace

void addToolpathOptions(CLI::App& command, ToolpathOptions& options) {
    addPassOptions(command, options);
    addLeadOptions(command, options);
    addMachineOptions(command, options);
    command.add_flag("--anyway", options.anyway,
                     "write a program where contours are broken (the rest is cut), cuts come too "
                     "near to others or offsets fail");
    addOutputs(command, options.outputs,
               "output file (.ngc, .nc, .tap or .gcode for the machine, .svg for a picture), "
               "repeatable");
    addInputOptions(command, options.input);
}

}  // namespace gmpath
