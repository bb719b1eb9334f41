// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `toolpath`, which computes the moves of a tool round every contour and
/// writes the outputs. Contours that the tool does not fit into, and leads without room, are
/// reported. Offsets that have a fault are not cut.
Command addToolpath(CLI::App& program);

}  // namespace gmpath
