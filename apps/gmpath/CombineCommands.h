// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "apps/gmpath/Command.h"

namespace gmpath {

/// The commands that make one part of several: `union`, `intersect`, `subtract`, and `melt`, which
/// is the union with what is common beside it.
std::vector<Command> addCombinations(CLI::App& program);

}  // namespace gmpath
