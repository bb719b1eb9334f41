#pragma once

#include <optional>

#include "apps/gmpath/Commands.h"
#include "drawing/dxf/DrawingUnits.h"
#include "machining/leads/Leads.h"

namespace gmpath {

/// Options of `toolpath`, in units of the drawing. What is left out has a default that depends on
/// the tool or on the units.
struct ToolpathOptions {
    InputOptions input;
    double tool = 0.0;  ///< diameter
    double stock = 0.0;
    int count = 1;
    std::optional<double> step;
    LeadKind lead = LeadKind::kNone;
    std::optional<double> leadLength;
    std::optional<double> leadRadius;
    double leadAngle = 90.0;  ///< degrees
    std::optional<double> depth;
    std::optional<double> stepDown;
    std::optional<double> safeZ;
    std::optional<double> feed;
    std::optional<double> plunge;
    std::optional<double> spindle;
    bool conventional = false;
    std::optional<Units> units;
    std::vector<std::string> outputs;
};

/// Computes the moves of a tool round every contour and writes the outputs. Contours that the tool
/// does not fit into, and leads without room, are reported. Throws InputError for input, options
/// and outputs that cannot be used; then no output is written. False when some offset has a fault,
/// and is not cut, or could not be made, and when a cut comes too near to another contour.
bool runToolpath(const ToolpathOptions& options, const Console& console);

}  // namespace gmpath
