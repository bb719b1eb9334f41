// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "drawing/LayerChoice.h"
#include "drawing/Units.h"
#include "drawing/dxf/DxfGroups.h"

namespace gmdrawing {

/// The units of a drawing: those of the option, else those of the header ($INSUNITS), else inches
/// or millimetres as its customs are ($MEASUREMENT), which is an assumption. What is missing or
/// broken says nothing.
DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups, std::optional<int> option);

/// The layers that the drawing hides: switched off, frozen, or not to be plotted.
HiddenLayers hiddenLayers(const std::vector<DxfGroup>& groups);

}  // namespace gmdrawing
