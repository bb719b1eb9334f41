#include "apps/gmpath/ToolpathCommandLine.h"

#include <map>
#include <string>

#include "apps/gmpath/NamedOption.h"

namespace gmpath {

namespace {

const std::map<std::string, LeadKind>& leadNames() {
    static const std::map<std::string, LeadKind> names = {
        {"none", LeadKind::kNone},
        {"line", LeadKind::kLine},
        {"perpendicular", LeadKind::kPerpendicular},
        {"arc", LeadKind::kArc}};
    return names;
}

const std::map<std::string, Units>& unitNames() {
    static const std::map<std::string, Units> names = {{"mm", Units::kMillimetres},
                                                       {"inch", Units::kInches}};
    return names;
}

void addPassOptions(CLI::App& command, ToolpathOptions& options) {
    command.add_option("-t,--tool", options.tool, "diameter of the tool")->required();
    command.add_option("--stock", options.stock, "material left on the part")
        ->capture_default_str();
    command.add_option("--count", options.count, "number of passes, the last along the part")
        ->capture_default_str();
    command.add_option("--step", options.step,
                       "distance from one pass to the next [radius of the tool]");
    CLI::Option* climb =
        command.add_flag("--climb", "the part lies right of the tool (the default)");
    command.add_flag("--conventional", options.conventional, "the part lies left of the tool")
        ->excludes(climb);
}

void addLeadOptions(CLI::App& command, ToolpathOptions& options) {
    addNamedOption(command, "--lead", options.lead, leadNames(),
                   "none, line (along the cut), perpendicular or arc [none]");
    command.add_option("--lead-length", options.leadLength,
                       "length of straight leads [radius of the tool]");
    command.add_option("--lead-radius", options.leadRadius,
                       "radius of arc leads [radius of the tool]");
    command.add_option("--lead-angle", options.leadAngle, "sweep of arc leads in degrees")
        ->capture_default_str();
}

void addMachineOptions(CLI::App& command, ToolpathOptions& options) {
    command.add_option("--depth", options.depth, "depth of the cut [1 mm, 0.04 in]");
    command.add_option("--step-down", options.stepDown,
                       "depth from one level to the next [the whole depth]");
    command.add_option("--safe-z", options.safeZ, "height of rapid moves [5 mm, 0.2 in]");
    command.add_option("--feed", options.feed, "speed of cuts a minute [1000 mm, 40 in]");
    command.add_option("--plunge", options.plunge, "speed downwards a minute [a third of --feed]");
    command.add_option("--spindle", options.spindle, "turns of the tool a minute");
    addNamedOption(command, "--units", options.units, unitNames(),
                   "mm or inch [those of the drawing, else mm]");
}

}  // namespace

CLI::App* addToolpath(CLI::App& program, ToolpathOptions& options) {
    CLI::App* toolpath =
        program.add_subcommand("toolpath", "Cut out the contours of a part drawing with a tool");
    addPassOptions(*toolpath, options);
    addLeadOptions(*toolpath, options);
    addMachineOptions(*toolpath, options);
    toolpath
        ->add_option("-o,--output", options.outputs,
                     "output file (.ngc for the machine, .svg for a picture), repeatable")
        ->required()
        ->allow_extra_args(false);
    toolpath->footer(
        "Example: gmpath toolpath bracket.dxf --tool 6 --lead arc --depth 8 --step-down 2 "
        "-o bracket.ngc -o bracket.svg");
    return toolpath;
}

}  // namespace gmpath
