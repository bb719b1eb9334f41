// SPDX-License-Identifier: MIT
#include "drawing/Units.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cmath>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

constexpr double kMillimetresInInch = 25.4;

struct Unit {
    const char* name;
    double millimetres;
};

/// By their numbers.
constexpr std::array<Unit, 22> kUnits = {{{"no unit", 1.0},
                                          {"in", kMillimetresInInch},
                                          {"ft", 12.0 * kMillimetresInInch},
                                          {"miles", 63360.0 * kMillimetresInInch},
                                          {"mm", 1.0},
                                          {"cm", 10.0},
                                          {"m", 1e3},
                                          {"km", 1e6},
                                          {"microinches", 1e-6 * kMillimetresInInch},
                                          {"mil", 1e-3 * kMillimetresInInch},
                                          {"yd", 36.0 * kMillimetresInInch},
                                          {"angstroms", 1e-7},
                                          {"nm", 1e-6},
                                          {"um", 1e-3},
                                          {"dm", 100.0},
                                          {"dam", 1e4},
                                          {"hm", 1e5},
                                          {"gigametres", 1e12},
                                          {"astronomical units", 1.495978707e14},
                                          {"light years", 9.4607304725808e18},
                                          {"parsecs", 3.0856775814913673e19},
                                          {"survey feet", 1200.0 / 3937.0 * 1e3}}};

bool isUnit(int code) {
    return code > kNoUnit && static_cast<std::size_t>(code) < kUnits.size();
}

std::string lowered(std::string_view text) {
    std::string result(text);
    std::transform(result.begin(), result.end(), result.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return result;
}

/// A decimal number or a fraction of two.
std::optional<double> parseFraction(std::string_view text) {
    const std::size_t slash = text.find('/');
    if (slash == std::string_view::npos) return parseReal(text);
    const auto upper = parseReal(text.substr(0, slash));
    const auto lower = parseReal(text.substr(slash + 1));
    if (!upper || !lower || !(*lower > 0.0)) return std::nullopt;
    return *upper / *lower;
}

/// A number, or a whole number and a fraction beside it.
std::optional<double> parseMixed(std::string_view text) {
    const std::size_t gap = text.find_first_of(" -", 1);
    if (gap == std::string_view::npos || text.find('/') == std::string_view::npos) {
        return parseFraction(text);
    }
    const auto whole = parseInteger(text.substr(0, gap));
    const auto part = parseFraction(trimmed(text.substr(gap + 1)));
    if (!whole || !part || *part < 0.0) return std::nullopt;
    return *whole + (text.front() == '-' ? -*part : *part);
}

}  // namespace

double millimetresIn(int unit) {
    return isUnit(unit) ? kUnits[static_cast<std::size_t>(unit)].millimetres : 1.0;
}

std::string unitText(int unit) {
    if (unit == kNoUnit || isUnit(unit)) return kUnits[static_cast<std::size_t>(unit)].name;
    return "unit " + std::to_string(unit);
}

std::optional<int> unitNamed(std::string_view name) {
    const std::string wanted = lowered(name);
    if (wanted == "inch" || wanted == "inches" || wanted == "\"") return kInch;
    if (wanted == "'") return unitNamed("ft");
    for (std::size_t code = 1; code < kUnits.size(); ++code) {
        if (wanted == kUnits[code].name) return static_cast<int>(code);
    }
    const auto code = parseInteger(wanted);
    return code && isUnit(*code) ? code : std::nullopt;
}

double lengthIn(const DrawingUnits& units, Length length) {
    if (length.unit == kNoUnit || length.unit == units.code) return length.value;
    return length.value * millimetresIn(length.unit) / millimetresIn(units.code);
}

std::optional<Length> parseLength(std::string_view text) {
    text = trimmed(text);
    const std::size_t last = text.find_last_of("0123456789.");
    if (last == std::string_view::npos) return std::nullopt;
    const std::string_view name = trimmed(text.substr(last + 1));
    const auto value = parseMixed(trimmed(text.substr(0, last + 1)));
    if (!value || !std::isfinite(*value)) return std::nullopt;
    if (name.empty()) return Length{*value};
    const auto unit = unitNamed(name);
    return unit ? std::optional<Length>(Length{*value, *unit}) : std::nullopt;
}

std::istream& operator>>(std::istream& stream, Length& length) {
    std::string text;
    std::getline(stream, text);
    const auto parsed = parseLength(text);
    if (parsed) {
        length = *parsed;
    } else {
        stream.setstate(std::ios::failbit);
    }
    return stream;
}

}  // namespace gmdrawing
