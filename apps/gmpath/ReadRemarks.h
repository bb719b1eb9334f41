// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "apps/gmpath/Report.h"
#include "drawing/files/PartReader.h"

namespace gmpath {

/// Tells what of a drawing was left out, what was mended so that it looks otherwise than it is
/// drawn, and what may turn the part inside out. Nothing of what concerns every drawing.
void tellReading(const gmdrawing::Part& part, Report& report);

/// What cannot be used, in one line.
std::string unusableLine(const gmdrawing::ReadReport& report);

/// "mm (as the drawing says)" and the like.
std::string unitsText(const gmdrawing::DrawingUnits& units);

}  // namespace gmpath
