#pragma once

#include <vector>

#include "drawing/dxf/DxfGroups.h"

namespace gmpath {

/// Units of length that a machine can be given.
enum class Units { kMillimetres, kInches };

/// What the header of a drawing says about its units of length.
struct DrawingUnits {
    int code = 0;           ///< 0: nothing said, 1: inches, 4: millimetres, others as by name
    bool imperial = false;  ///< drawn by the customs of inches
};

/// Reads the header variables $INSUNITS and $MEASUREMENT; what is missing or broken says nothing.
DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups);

/// The units of the drawing, millimetres when it says nothing. Throws InputError, with the name of
/// the unit and what to do, for a unit that is neither.
Units machineUnits(const DrawingUnits& drawing);

}  // namespace gmpath
