#include "apps/gmpath/CommandLine.h"

#include <CLI/CLI.hpp>
#include <functional>
#include <map>
#include <vector>

#include "apps/gmpath/NamedOption.h"
#include "apps/gmpath/ShapeCommandLine.h"
#include "apps/gmpath/ToolpathCommandLine.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"

namespace gmpath {

namespace {

constexpr int kFaultyResult = 1;
constexpr int kBadInput = 2;

const std::map<std::string, Side>& sideNames() {
    static const std::map<std::string, Side> names = {
        {"waste", Side::kWaste},   {"right", Side::kRight},     {"left", Side::kLeft},
        {"inside", Side::kInside}, {"outside", Side::kOutside}, {"both", Side::kBoth}};
    return names;
}

void addInputOptions(CLI::App& command, InputOptions& input) {
    command.add_option("PART", input.drawing, "part drawing (DXF in text form)")->required();
    command
        .add_option("--join", input.read.joinTolerance,
                    "join ends that lie this far apart, in units of the drawing")
        ->capture_default_str();
    command.add_option("--scale", input.read.scale, "multiply all coordinates of the drawing")
        ->capture_default_str();
    command.add_flag("--strict", input.strict, "entities that cannot be used are an error");
}

CLI::App* addInfo(CLI::App& program, InputOptions& options) {
    CLI::App* info = program.add_subcommand("info", "List the contours of a part drawing");
    addInputOptions(*info, options);
    info->footer("Example: gmpath info bracket.dxf --join 0.01");
    return info;
}

CLI::App* addOffset(CLI::App& program, OffsetOptions& options) {
    CLI::App* offset = program.add_subcommand("offset", "Offset every contour of a part drawing");
    addInputOptions(*offset, options.input);
    offset->add_option("-d,--distance", options.distance, "distance of the first pass")->required();
    offset->add_option("--count", options.count, "number of passes")->capture_default_str();
    offset->add_option("--step", options.step,
                       "distance from one pass to the next [the first distance]");
    addNamedOption(*offset, "--side", options.side, sideNames(),
                   "waste (outside of outlines, inside of holes; open contours both), right, left, "
                   "inside, outside or both [waste]");
    offset->add_option("-o,--output", options.outputs, "output file (.svg or .dxf), repeatable")
        ->required()
        ->allow_extra_args(false);
    offset->footer(
        "Example: gmpath offset bracket.dxf --distance 3 --count 2 --step 2.5 -o paths.svg "
        "-o paths.dxf");
    return offset;
}

/// The options of every subcommand; one of them is used.
struct Options {
    InputOptions info;
    OffsetOptions offset;
    CornersOptions corners;
    MeltOptions melt;
    ToolpathOptions toolpath;
};

/// A subcommand, and what it does: false when a result has a fault.
struct Command {
    const CLI::App* app;
    std::function<bool(const Console&)> run;
};

bool runOffsetCommand(const CLI::App& app, OffsetOptions options, const Console& console) {
    if (app.count("--step") == 0) options.step = options.distance;
    return runOffset(options, console);
}

std::vector<Command> addCommands(CLI::App& program, Options& options) {
    const CLI::App* info = addInfo(program, options.info);
    const CLI::App* offset = addOffset(program, options.offset);
    CLI::App* corners = addCorners(program, options.corners);
    addInputOptions(*corners, options.corners.input);
    CLI::App* melt = addMelt(program, options.melt);
    addInputOptions(*melt, options.melt.first);
    melt->add_option("SECOND", options.melt.second, "the other drawing")->required();
    CLI::App* toolpath = addToolpath(program, options.toolpath);
    addInputOptions(*toolpath, options.toolpath.input);
    const auto runInfoCommand = [&](const Console& console) {
        runInfo(options.info, console);
        return true;
    };
    return {
        {info, runInfoCommand},
        {offset,
         [=, &options](const Console& console) {
             return runOffsetCommand(*offset, options.offset, console);
         }},
        {corners, [&](const Console& console) { return runCorners(options.corners, console); }},
        {melt, [&](const Console& console) { return runMelt(options.melt, console); }},
        {toolpath, [&](const Console& console) { return runToolpath(options.toolpath, console); }}};
}

int fail(const Console& console, const std::string& cause) {
    console.err << "gmpath: " << printable(cause) << "\n";
    return kBadInput;
}

/// Help and version are no errors; everything else is told in one line.
int finishParsing(const CLI::App& program, const CLI::ParseError& error, const Console& console) {
    if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success)) {
        return program.exit(error, console.out, console.err);
    }
    std::string cause = error.what();
    for (char& c : cause) {
        if (c == '\n') c = ' ';
    }
    return fail(console, std::string(trimmed(cause)) + " (see gmpath --help)");
}

}  // namespace

int runCommandLine(int argc, const char* const* argv, const Console& console) {
    CLI::App program("Offsets, corners and tool paths from part drawings.", "gmpath");
    program.set_version_flag("--version", std::string("gmpath ") + GMPATH_VERSION);
    program.require_subcommand(1);
    program.footer("Example: gmpath offset bracket.dxf --distance 3 -o bracket.svg");
    Options options;
    const std::vector<Command> commands = addCommands(program, options);
    try {
        program.parse(argc, argv);
        for (const Command& command : commands) {
            if (command.app->parsed() && !command.run(console)) return kFaultyResult;
        }
    } catch (const CLI::ParseError& error) {
        return finishParsing(program, error, console);
    } catch (const InputError& error) {
        return fail(console, error.what());
    } catch (const std::exception& error) {
        return fail(console, std::string("failed: ") + error.what());
    }
    return 0;
}

}  // namespace gmpath
