#pragma once

#include "apps/gmpath/ToolpathCommand.h"
#include "machining/ToolpathJob.h"
#include "machining/gcode/GcodeWriter.h"

namespace gmpath {

/// Checks the options that need no drawing. Throws InputError, naming the option.
void checkOptions(const ToolpathOptions& options);

/// What the options, checked, ask for in a drawing of these units. Throws InputError, naming the
/// option, for a depth that takes too many levels.
ToolpathRequest toolpathRequest(const ToolpathOptions& options, Units units);
MachineSettings machineSettings(const ToolpathOptions& options, Units units);

}  // namespace gmpath
