// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "drawing/DrawingUnits.h"
#include "drawing/dxf/DxfGroups.h"

namespace gmdrawing {

/// Reads the header variables $INSUNITS and $MEASUREMENT; what is missing or broken says nothing.
DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups);

}  // namespace gmdrawing
