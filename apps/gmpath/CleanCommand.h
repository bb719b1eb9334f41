// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Command.h"

namespace gmpath {

/// Adds the subcommand `clean`, which makes regions of a drawing and tells what was mended.
Command addClean(CLI::App& program);

}  // namespace gmpath
