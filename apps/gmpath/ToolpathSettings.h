// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/ToolpathOptions.h"
#include "machining/ToolpathJob.h"
#include "machining/gcode/GcodeWriter.h"

namespace gmpath {

/// What the options ask for in a drawing of these units. Throws InputError, naming the options, for
/// passes too far out, for a depth that takes too many levels, and for units that no machine has.
gmmachining::ToolpathRequest toolpathRequest(const ToolpathOptions& options,
                                             const gmdrawing::DrawingUnits& drawing);
gmmachining::MachineSettings machineSettings(const ToolpathOptions& options,
                                             const gmdrawing::DrawingUnits& drawing);

}  // namespace gmpath
