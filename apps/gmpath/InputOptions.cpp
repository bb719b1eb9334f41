// SPDX-License-Identifier: MIT
#include "apps/gmpath/InputOptions.h"

#include "apps/gmpath/InfoTable.h"
#include "apps/gmpath/OptionKinds.h"
#include "apps/gmpath/Report.h"
#include "drawing/InputError.h"

namespace gmpath {

using gmdrawing::InputError;
using gmdrawing::Part;
using gmdrawing::readPart;

void addInputOptions(CLI::App& command, InputOptions& input) {
    command.add_option("PART", input.drawing, "part drawing (DXF in text form)")->required();
    addReadOptions(command, input);
}

void addReadOptions(CLI::App& command, InputOptions& input) {
    command
        .add_option("--join", input.read.joinTolerance,
                    "join ends that lie this far apart, in units of the drawing")
        ->transform(positiveNumber())
        ->capture_default_str();
    command.add_option("--scale", input.read.scale, "multiply all coordinates of the drawing")
        ->transform(positiveNumber())
        ->capture_default_str();
    command.add_flag("--strict", input.strict, "entities that cannot be used are an error");
}

Part readInput(const InputOptions& options, const Console& console) {
    Part part = readPart(options.drawing, options.read);
    if (part.skipped.unusable.empty()) return part;
    const std::string line = unusableLine(part.skipped);
    if (options.strict) throw InputError(options.drawing + ": " + line);
    Report(console.err, options.drawing).tell(line);
    return part;
}

}  // namespace gmpath
