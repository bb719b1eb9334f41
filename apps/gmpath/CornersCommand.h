// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `corners`, which rounds or chamfers the corners of every contour, writes the
/// outputs, and says how many corners were done and how many have no room.
Command addCorners(CLI::App& program);

}  // namespace gmpath
