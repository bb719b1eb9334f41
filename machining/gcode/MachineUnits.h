// SPDX-License-Identifier: MIT
#pragma once

#include "drawing/Units.h"

namespace gmmachining {

/// Units of length that a machine can be given.
enum class Units { kMillimetres, kInches };

/// The units of the drawing, millimetres when it says nothing. Throws InputError, with the name of
/// the unit and what to do, for a unit that is neither.
Units machineUnits(const gmdrawing::DrawingUnits& drawing);

}  // namespace gmmachining
