#include "drawing/dxf/DrawingUnits.h"

#include <array>
#include <optional>
#include <string>

#include "drawing/InputError.h"
#include "drawing/Text.h"

namespace gmpath {

namespace {

constexpr int kVariableNameCode = 9;
constexpr int kIntegerCode = 70;

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

std::optional<int> headerInteger(const std::vector<DxfGroup>& groups, std::string_view name) {
    for (std::size_t i = 1; i < groups.size(); ++i) {
        const DxfGroup& variable = groups[i - 1];
        if (variable.code != kVariableNameCode || trimmed(variable.value) != name) continue;
        if (groups[i].code == kIntegerCode) return parseInteger(groups[i].value);
    }
    return std::nullopt;
}

std::string unitName(int code) {
    const auto index = static_cast<std::size_t>(code);
    if (code < 0 || index >= kUnitNames.size()) return "unit " + std::to_string(code);
    return kUnitNames[index];
}

}  // namespace

DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups) {
    return {headerInteger(groups, "$INSUNITS").value_or(0),
            headerInteger(groups, "$MEASUREMENT").value_or(1) == 0};
}

Units machineUnits(const DrawingUnits& drawing) {
    if (drawing.code == kInchCode) return Units::kInches;
    if (drawing.code == kMillimetreCode) return Units::kMillimetres;
    if (drawing.code == 0) return drawing.imperial ? Units::kInches : Units::kMillimetres;
    throw InputError("the drawing is in " + unitName(drawing.code) +
                     ": give --units, and --scale to get there");
}

}  // namespace gmpath
