// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/Console.h"

namespace gmpath {

/// Parses the command line and runs the command. Returns the exit code: 0, 1 when a result has a
/// fault or could not be made, or 2 with one line on the error stream for a command line or input
/// that cannot be used.
int runCommandLine(int argc, const char* const* argv, const Console& console);

}  // namespace gmpath
