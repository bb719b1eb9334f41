// SPDX-License-Identifier: MIT
#pragma once

#include <ostream>

namespace gmpath {

/// Streams of a command.
struct Console {
    std::ostream& out;
    std::ostream& err;
    bool showProgress = false;  ///< `err` is a terminal
};

}  // namespace gmpath
