// SPDX-License-Identifier: MIT
#include "machining/gcode/MachineUnits.h"

#include <array>
#include <string>

#include "drawing/InputError.h"

namespace gmmachining {

using gmdrawing::DrawingUnits;
using gmdrawing::InputError;

namespace {

constexpr int kInchCode = 1;
constexpr int kMillimetreCode = 4;

/// Names of the codes from 0.
constexpr std::array<const char*, 21> kUnitNames = {"no unit",
                                                    "inches",
                                                    "feet",
                                                    "miles",
                                                    "millimetres",
                                                    "centimetres",
                                                    "metres",
                                                    "kilometres",
                                                    "microinches",
                                                    "mils",
                                                    "yards",
                                                    "angstroms",
                                                    "nanometres",
                                                    "microns",
                                                    "decimetres",
                                                    "decametres",
                                                    "hectometres",
                                                    "gigametres",
                                                    "astronomical units",
                                                    "light years",
                                                    "parsecs"};

std::string unitName(int code) {
    const auto index = static_cast<std::size_t>(code);
    if (code < 0 || index >= kUnitNames.size()) return "unit " + std::to_string(code);
    return kUnitNames[index];
}

}  // namespace

Units machineUnits(const DrawingUnits& drawing) {
    if (drawing.code == kInchCode) return Units::kInches;
    if (drawing.code == kMillimetreCode) return Units::kMillimetres;
    if (drawing.code == 0) return drawing.imperial ? Units::kInches : Units::kMillimetres;
    throw InputError("the drawing is in " + unitName(drawing.code) +
                     ": give --units, and --scale to get there");
}

}  // namespace gmmachining
