// SPDX-License-Identifier: MIT
#pragma once

#include <istream>
#include <optional>
#include <string>
#include <string_view>

namespace gmdrawing {

/// Where the units of a drawing come from.
enum class UnitSource {
    kDrawing,  ///< it says so
    kOption,   ///< whoever reads it says so
    kAssumed   ///< nobody says so
};

/// Units of length go by the numbers that drawings have for them: 0 none, 1 inches, 2 feet,
/// 4 millimetres, 5 centimetres, 6 metres and others.
constexpr int kNoUnit = 0;
constexpr int kInch = 1;
constexpr int kMillimetre = 4;

/// The units of length of a drawing.
struct DrawingUnits {
    int code = kMillimetre;
    UnitSource source = UnitSource::kAssumed;
};

/// The number that somebody said, none where the units are assumed.
inline int saidUnits(const DrawingUnits& units) {
    return units.source == UnitSource::kAssumed ? kNoUnit : units.code;
}

/// Millimetres in a unit; of a number that stands for no length, 1.
double millimetresIn(int unit);

/// "mm", "in" and so on, the plural of the name for others; of a number that stands for none, the
/// number.
std::string unitText(int unit);

/// The unit by its short name or its number, upper or lower case; nothing for anything else.
std::optional<int> unitNamed(std::string_view name);

/// A length with a unit of its own, or in units of the drawing.
struct Length {
    double value = 0.0;
    int unit = kNoUnit;
};

/// The length in units of the drawing.
double lengthIn(const DrawingUnits& units, Length length);

/// A number, decimal or a fraction as 1/4 or 1 1/4, with a unit behind it or without: mm, cm, m,
/// in, inch, ", ft or '. Nothing for anything else and for numbers that are not finite.
std::optional<Length> parseLength(std::string_view text);

/// The same from the whole rest of a stream, which fails for anything else.
std::istream& operator>>(std::istream& stream, Length& length);

}  // namespace gmdrawing
