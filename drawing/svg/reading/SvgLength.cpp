// SPDX-License-Identifier: MIT
#include "drawing/svg/reading/SvgLength.h"

#include <array>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

struct SvgUnit {
    std::string_view name;
    double userUnits;
    int ruler;
};

constexpr double kInInch = 96.0;

constexpr std::array<SvgUnit, 8> kUnits = {{{"", 1.0, kNoUnit},
                                            {"px", 1.0, kNoUnit},
                                            {"pt", kInInch / 72.0, kNoUnit},
                                            {"pc", kInInch / 6.0, kNoUnit},
                                            {"mm", kInInch / 25.4, kMillimetre},
                                            {"cm", kInInch / 2.54, kMillimetre},
                                            {"q", kInInch / 101.6, kMillimetre},
                                            {"in", kInInch, kInch}}};

/// Number and unit of a length.
struct Parts {
    std::string_view number;
    std::string_view unit;
};

Parts partsOf(std::string_view text) {
    text = trimmed(text);
    const std::size_t last = text.find_last_of("0123456789.");
    const std::size_t end = last == std::string_view::npos ? 0 : last + 1;
    return {text.substr(0, end), text.substr(end)};
}

const SvgUnit* unitOf(const Parts& parts) {
    for (const SvgUnit& unit : kUnits) {
        if (unit.name == parts.unit) return &unit;
    }
    return nullptr;
}

}  // namespace

std::optional<double> svgLength(std::string_view text) {
    const Parts parts = partsOf(text);
    const SvgUnit* unit = unitOf(parts);
    const std::optional<double> number = parseReal(parts.number);
    if (unit == nullptr || !number) return std::nullopt;
    return *number * unit->userUnits;
}

int rulerUnit(std::string_view text) {
    const SvgUnit* unit = unitOf(partsOf(text));
    return unit == nullptr ? kNoUnit : unit->ruler;
}

}  // namespace gmdrawing
