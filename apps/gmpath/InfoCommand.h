// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `info`, which prints the table of contours.
Command addInfo(CLI::App& program);

}  // namespace gmpath
