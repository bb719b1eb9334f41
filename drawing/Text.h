// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace gmdrawing {

/// The text without leading and trailing blanks, tabs and carriage returns.
std::string_view trimmed(std::string_view text);

/// The whole text as a finite number with a decimal point (a comma is taken for one); nothing for
/// anything else, "nan" and "inf" included. The locale plays no part.
std::optional<double> parseReal(std::string_view text);

/// The whole text as a decimal integer; nothing for anything else.
std::optional<int> parseInteger(std::string_view text);

/// The number with a decimal point and at most `digits` significant digits, the shortest such form.
/// The locale plays no part.
std::string formatReal(double value, int digits = 12);

/// The number with a decimal point and exactly `decimals` digits behind it.
std::string formatFixed(double value, int decimals);

/// The text with every byte replaced by '?' that belongs to no printable character of UTF-8, so
/// that names from a drawing can go to a terminal or into XML.
std::string printable(std::string_view text);

/// Number of characters of UTF-8 text as `printable` shows it.
std::size_t characterCount(std::string_view text);

/// "1 arc", "2 arcs".
std::string counted(std::size_t count, std::string_view noun);

}  // namespace gmdrawing
