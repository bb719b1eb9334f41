// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "drawing/files/PartReader.h"

namespace gmpath {

/// The contours of a part as a table of text: number, layer, open or closed, nesting depth, number
/// of segments and arcs, length, area and sense of what is enclosed, bounding box; then what was
/// left out and why.
std::string infoTable(const gmdrawing::Part& part);

/// What was left out, one line each; empty when nothing was.
std::string skipLines(const gmdrawing::SkipReport& skipped);

/// The entities that cannot be used, by kind and layer, in one line without its end.
std::string unusableLine(const gmdrawing::SkipReport& skipped);

}  // namespace gmpath
