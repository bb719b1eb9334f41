// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "drawing/files/PartReader.h"

namespace gmpath {

/// The contours of a part as a table of text: number, layer, open or closed, nesting depth, number
/// of segments and arcs, length, area and sense of what is enclosed, bounding box; then its units
/// and layers, what was read by kind, what was left out and why, and what was mended.
std::string infoTable(const gmdrawing::Part& part);

/// What was left out or mended, one line each; empty when nothing was.
std::string lossLines(const gmdrawing::Part& part);

}  // namespace gmpath
