// SPDX-License-Identifier: MIT
#include "apps/gmpath/InputOptions.h"

#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/ReadRemarks.h"
#include "apps/gmpath/Report.h"
#include "drawing/InputError.h"

namespace gmpath {

using gmdrawing::InputError;
using gmdrawing::Part;
using gmdrawing::readPart;

namespace {

void addUnitOption(CLI::App& command, InputOptions& input) {
    const auto check = [](const std::string& text) {
        return gmdrawing::unitNamed(text) ? std::string() : "not a unit of length";
    };
    const auto assign = [&input](const std::string& text) {
        input.read.units = gmdrawing::unitNamed(text);
    };
    command
        .add_option_function<std::string>(
            "--units", assign, "units of the drawing: mm, cm, m, in, ft [as it says, else mm]")
        ->check(CLI::Validator(check, ""))
        ->type_name("NAME");
}

}  // namespace

void addInputOptions(CLI::App& command, InputOptions& input) {
    command.add_option("PART", input.drawing, "part drawing (DXF in text form, or SVG)")
        ->required();
    addReadOptions(command, input);
}

void addReadOptions(CLI::App& command, InputOptions& input) {
    command
        .add_option("--join", input.read.join,
                    "join ends that lie this far apart [0.001mm, or 0.0005in]")
        ->transform(positiveLength());
    command
        .add_option("--curve-tolerance", input.read.curves,
                    "how far arcs may be from splines and ellipses [0.01mm, or 0.0005in]")
        ->transform(positiveLength());
    addUnitOption(command, input);
    command
        .add_option("--layer", input.read.layers.wanted,
                    "only layers with names like this (* and ? stand for any), repeatable")
        ->allow_extra_args(false);
    command
        .add_option("--skip-layer", input.read.layers.unwanted,
                    "no layers with names like this, repeatable")
        ->allow_extra_args(false);
    command.add_option("--scale", input.read.scale, "multiply all coordinates of the drawing")
        ->transform(positiveNumber())
        ->capture_default_str();
    command.add_flag("--strict", input.strict, "entities that cannot be used are an error");
}

Part readInput(const InputOptions& options, const Console& console) {
    Part part = readPart(options.drawing, options.read);
    if (options.strict && !part.report.unusable.empty()) {
        throw InputError(options.drawing + ": " + unusableLine(part.report));
    }
    Report report(console.err, options.drawing, part.contours);
    tellReading(part, report);
    return part;
}

}  // namespace gmpath
