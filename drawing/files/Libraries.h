// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace gmdrawing {

/// The libraries that drawings are read and written by, with their versions, in one line.
std::string drawingLibraries();

}  // namespace gmdrawing
