// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string_view>

#include "drawing/Units.h"

namespace gmdrawing {

/// A length of an SVG attribute in user units, of which an inch has 96: a number with px, pt, pc,
/// mm, cm, in, q or nothing behind it. Nothing for anything else, as percentages are.
std::optional<double> svgLength(std::string_view text);

/// The unit that the length is written in, inches or millimetres (also for cm and q); none where it
/// is not written in one of a ruler.
int rulerUnit(std::string_view text);

}  // namespace gmdrawing
