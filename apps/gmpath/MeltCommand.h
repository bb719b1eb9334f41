#pragma once

#include <string>
#include <vector>

#include "apps/gmpath/Commands.h"

namespace gmpath {

/// Options of `melt`.
struct MeltOptions {
    InputOptions first;  ///< its reading options hold for both drawings
    std::string second;
    std::vector<std::string> outputs;
};

/// Melts the closed contours of two drawings, pair by pair, writes the loops and says what came of
/// every pair. Throws InputError for input and outputs that cannot be used; then no output is
/// written. False when the loops of a pair do not have the areas that they must have; they are
/// written all the same, dashed in pictures.
bool runMelt(const MeltOptions& options, const Console& console);

}  // namespace gmpath
