// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `melt`, which melts the closed contours of two drawings, pair by pair,
/// writes the loops and says what came of every pair. Loops that do not have the areas that they
/// must have are faults, dashed in pictures.
Command addMelt(CLI::App& program);

}  // namespace gmpath
