#include "CommandLine.h"

#include <CLI/CLI.hpp>
#include <map>

#include "InputError.h"
#include "Text.h"
#include "ToolpathCommandLine.h"

namespace gmpath {

namespace {

constexpr int kFaultyOffsets = 1;
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
    offset
        ->add_option("--side", options.side,
                     "waste (outside of outlines, inside of holes; open contours both), right, "
                     "left, inside, outside or both")
        ->type_name("NAME")
        ->transform(CLI::Transformer(sideNames()).description(""))
        ->default_str("waste");
    offset->add_option("-o,--output", options.outputs, "output file (.svg or .dxf), repeatable")
        ->required()
        ->allow_extra_args(false);
    offset->footer(
        "Example: gmpath offset bracket.dxf --distance 3 --count 2 --step 2.5 -o paths.svg "
        "-o paths.dxf");
    return offset;
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
    CLI::App program("Offset contours from part drawings.", "gmpath");
    program.set_version_flag("--version", std::string("gmpath ") + GMPATH_VERSION);
    program.require_subcommand(1);
    program.footer("Example: gmpath offset bracket.dxf --distance 3 -o bracket.svg");
    InputOptions infoOptions;
    OffsetOptions offsetOptions;
    ToolpathOptions toolpathOptions;
    const CLI::App* info = addInfo(program, infoOptions);
    const CLI::App* offset = addOffset(program, offsetOptions);
    CLI::App* toolpath = addToolpath(program, toolpathOptions);
    addInputOptions(*toolpath, toolpathOptions.input);
    try {
        program.parse(argc, argv);
        if (offset->count("--step") == 0) offsetOptions.step = offsetOptions.distance;
        if (info->parsed()) runInfo(infoOptions, console);
        if (toolpath->parsed()) runToolpath(toolpathOptions, console);
        if (offset->parsed() && !runOffset(offsetOptions, console)) return kFaultyOffsets;
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
