// SPDX-License-Identifier: MIT
#pragma once

#include "apps/gmpath/ToolpathOptions.h"
#include "machining/ToolpathJob.h"
#include "machining/gcode/GcodeWriter.h"

namespace gmpath {

/// Checks what the options ask for together, as far as it needs no drawing. Throws InputError,
/// naming the options.
void checkOptions(const ToolpathOptions& options);

/// What the options, checked, ask for in a drawing of these units. Throws InputError, naming the
/// option, for a depth that takes too many levels.
gmmachining::ToolpathRequest toolpathRequest(const ToolpathOptions& options,
                                             gmmachining::Units units);
gmmachining::MachineSettings machineSettings(const ToolpathOptions& options,
                                             gmmachining::Units units);

}  // namespace gmpath
