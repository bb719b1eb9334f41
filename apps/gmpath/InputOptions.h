// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <string>

#include "apps/gmpath/Console.h"
#include "drawing/files/PartReader.h"

namespace gmpath {

/// The drawing to read, and how.
struct InputOptions {
    std::string drawing;
    gmdrawing::ReadOptions read;
    bool strict = false;  ///< entities that cannot be used are an error
};

/// Adds the name of the drawing and the options of reading it to a command.
void addInputOptions(CLI::App& command, InputOptions& input);

/// Those of them that say how drawings are read.
void addReadOptions(CLI::App& command, InputOptions& input);

/// Reads the drawing and reports what of it cannot be used. Throws InputError for input that cannot
/// be used.
gmdrawing::Part readInput(const InputOptions& options, const Console& console);

}  // namespace gmpath
