#pragma once

#include <CLI/CLI.hpp>

#include "CornersCommand.h"
#include "MeltCommand.h"

namespace gmpath {

/// Add the subcommands `corners` and `melt`; their input options are added by the caller.
CLI::App* addCorners(CLI::App& program, CornersOptions& options);
CLI::App* addMelt(CLI::App& program, MeltOptions& options);

}  // namespace gmpath
