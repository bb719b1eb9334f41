// SPDX-License-Identifier: MIT
#include "drawing/dxf/DxfUnits.h"

#include <optional>
#include <string_view>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

constexpr int kVariableNameCode = 9;
constexpr int kIntegerCode = 70;

std::optional<int> headerInteger(const std::vector<DxfGroup>& groups, std::string_view name) {
    for (std::size_t i = 1; i < groups.size(); ++i) {
        const DxfGroup& variable = groups[i - 1];
        if (variable.code != kVariableNameCode || trimmed(variable.value) != name) continue;
        if (groups[i].code == kIntegerCode) return parseInteger(groups[i].value);
    }
    return std::nullopt;
}

}  // namespace

DrawingUnits drawingUnits(const std::vector<DxfGroup>& groups) {
    return {headerInteger(groups, "$INSUNITS").value_or(0),
            headerInteger(groups, "$MEASUREMENT").value_or(1) == 0};
}

}  // namespace gmdrawing
