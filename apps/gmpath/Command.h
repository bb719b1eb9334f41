// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <functional>

#include "apps/gmpath/Console.h"

namespace gmpath {

/// A subcommand of the program.
struct Command {
    const CLI::App* app;  ///< tells whether it was asked for
    /// Does what the parsed options say. False when a result has a fault or could not be made; it
    /// is reported, and the outputs are written all the same. Throws InputError for input, options
    /// and outputs that cannot be used; then no output is written.
    std::function<bool(const Console&)> run;
};

}  // namespace gmpath
