#pragma once

#include <CLI/CLI.hpp>

#include "apps/gmpath/CornersCommand.h"
#include "apps/gmpath/MeltCommand.h"

namespace gmpath {

/// Add the subcommands `corners` and `melt`; their input options are added by the caller.
CLI::App* addCorners(CLI::App& program, CornersOptions& options);
CLI::App* addMelt(CLI::App& program, MeltOptions& options);

}  // namespace gmpath
