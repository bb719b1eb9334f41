// SPDX-License-Identifier: MIT
#include "apps/gmpath/InfoCommand.h"

#include <memory>

#include "apps/gmpath/InfoTable.h"
#include "apps/gmpath/InputOptions.h"

namespace gmpath {

Command addInfo(CLI::App& program) {
    CLI::App* info = program.add_subcommand("info", "List the contours of a part drawing");
    const auto options = std::make_shared<InputOptions>();
    addInputOptions(*info, *options);
    info->footer("Example: gmpath info bracket.dxf --join 0.01");
    const auto run = [=](const Console& console) {
        console.out << infoTable(readInput(*options, console));
        return true;
    };
    return {info, run};
}

}  // namespace gmpath
