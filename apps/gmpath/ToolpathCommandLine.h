#pragma once

#include <CLI/CLI.hpp>

#include "apps/gmpath/ToolpathCommand.h"

namespace gmpath {

/// Adds the subcommand `toolpath` with all options but those of the input.
CLI::App* addToolpath(CLI::App& program, ToolpathOptions& options);

}  // namespace gmpath
