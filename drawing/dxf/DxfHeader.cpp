// SPDX-License-Identifier: MIT
#include "drawing/dxf/DxfHeader.h"

#include <string_view>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

constexpr int kKindCode = 0;
constexpr int kNameCode = 2;
constexpr int kVariableNameCode = 9;
constexpr int kColourCode = 62;
constexpr int kIntegerCode = 70;
constexpr int kPlotCode = 290;

std::optional<int> headerInteger(const std::vector<DxfGroup>& groups, std::string_view name) {
    for (std::size_t i = 1; i < groups.size(); ++i) {
        const DxfGroup& variable = groups[i - 1];
        if (variable.code != kVariableNameCode || trimmed(variable.value) != name) continue;
        if (groups[i].code == kIntegerCode) return parseInteger(groups[i].value);
    }
    return std::nullopt;
}

/// An entry of the table of layers.
struct LayerEntry {
    std::string name;
    bool isOff = false;
    bool isFrozen = false;
    bool isPlotted = true;

    void take(const DxfGroup& group) {
        if (group.code == kNameCode) name = std::string(trimmed(group.value));
        const int number = parseInteger(group.value).value_or(1);
        if (group.code == kColourCode) isOff = number < 0;
        if (group.code == kIntegerCode) isFrozen = (number & 1) != 0;
        if (group.code == kPlotCode) isPlotted = number != 0;
    }

    const char* reason() const {
        if (isFrozen) return kFrozenLayer;
        if (isOff) return "its layer is off";
        return isPlotted ? "" : "its layer is not plotted";
    }
};

}  // namespace

DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups, std::optional<int> option) {
    if (option) return {*option, UnitSource::kOption};
    const int code = headerInteger(groups, "$INSUNITS").value_or(kNoUnit);
    if (code != kNoUnit) return {code, UnitSource::kDrawing};
    const bool imperial = headerInteger(groups, "$MEASUREMENT").value_or(1) == 0;
    return {imperial ? kInch : kMillimetre, UnitSource::kAssumed};
}

HiddenLayers hiddenLayers(const std::vector<DxfGroup>& groups) {
    HiddenLayers hidden;
    LayerEntry entry;
    bool inside = false;
    const auto finish = [&] {
        if (inside && *entry.reason() != '\0') hidden[entry.name] = entry.reason();
    };
    for (const DxfGroup& group : groups) {
        if (group.code == kKindCode) {
            finish();
            inside = trimmed(group.value) == "LAYER";
            entry = {};
        } else if (inside) {
            entry.take(group);
        }
    }
    finish();
    return hidden;
}

}  // namespace gmdrawing
