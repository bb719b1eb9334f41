// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>

#include "machining/gcode/MachineUnits.h"
#include "machining/moves/Toolpath.h"

namespace gmmachining {

/// What a program for a milling machine says besides the moves.
struct MachineSettings {
    Units units = Units::kMillimetres;
    double feed = 1000.0;  ///< speed of cuts and leads, units a minute
    double plunge = 300.0;
    std::optional<double> spindle;  ///< turns a minute
    double toolDiameter = 0.0;
    std::string partName;
};

/// The moves as a program in G-code (ISO 6983): absolute coordinates with six decimals, arcs by
/// their centre relative to their start.
///
/// Every arc is computed from its ends as written, so that both lie at the same radius within two
/// units of the last decimal. Arcs of more than 180 degrees come in halves, arcs that leave their
/// chord by less than 1e-4 as straight moves.
std::string gcodeOf(const Toolpath& moves, const MachineSettings& settings);

}  // namespace gmmachining
