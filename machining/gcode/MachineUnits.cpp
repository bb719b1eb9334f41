// SPDX-License-Identifier: MIT
#include "machining/gcode/MachineUnits.h"

#include "drawing/InputError.h"

namespace gmmachining {

using gmdrawing::DrawingUnits;
using gmdrawing::InputError;

Units machineUnits(const DrawingUnits& drawing) {
    if (drawing.code == gmdrawing::kInch) return Units::kInches;
    if (drawing.code == gmdrawing::kMillimetre) return Units::kMillimetres;
    throw InputError("the drawing is in " + gmdrawing::unitText(drawing.code) +
                     ": give --units, and --scale to get there");
}

}  // namespace gmmachining
