// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `offset`, which offsets every contour and writes the outputs. Contours that
/// yield nothing are reported; results that have a fault are dashed in pictures.
Command addOffset(CLI::App& program);

}  // namespace gmpath
