// SPDX-License-Identifier: MIT
#include "apps/gmpath/CommandLine.h"

#include <CLI/CLI.hpp>
#include <vector>

#include "apps/gmpath/CleanCommand.h"
#include "apps/gmpath/CombineCommands.h"
#include "apps/gmpath/CornersCommand.h"
#include "apps/gmpath/InfoCommand.h"
#include "apps/gmpath/OffsetCommand.h"
#include "apps/gmpath/ToolpathCommand.h"
#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/files/Libraries.h"

namespace gmpath {

using gmdrawing::InputError;
using gmdrawing::printable;
using gmdrawing::trimmed;

namespace {

constexpr int kFaultyResult = 1;
constexpr int kBadInput = 2;

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

/// The version, and what the program was built with.
std::string versionText() {
#ifdef __clang__
    const std::string compiler = __VERSION__;
#else
    const std::string compiler = "GCC " __VERSION__;
#endif
    return std::string("gmpath ") + GMPATH_VERSION + "\nbuilt with " + compiler + ", " +
           gmdrawing::drawingLibraries() + ", CLI11 " + CLI11_VERSION;
}

}  // namespace

int runCommandLine(int argc, const char* const* argv, const Console& console) {
    CLI::App program("Offsets, corners and tool paths from part drawings.", "gmpath");
    program.set_version_flag("--version", versionText());
    program.require_subcommand(1);
    program.footer("Example: gmpath offset bracket.dxf --distance 3 -o bracket.svg");
    std::vector<Command> commands = {addInfo(program), addClean(program), addOffset(program),
                                     addCorners(program), addToolpath(program)};
    for (Command& combination : addCombinations(program))
        commands.push_back(std::move(combination));
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
