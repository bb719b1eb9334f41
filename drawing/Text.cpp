// SPDX-License-Identifier: MIT
#include "drawing/Text.h"

#include <utf8.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace gmdrawing {

namespace {

template <typename Number>
std::optional<Number> parseWhole(std::string_view text) {
    Number value{};
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, value);
    if (error != std::errc() || stop != end) return std::nullopt;
    return value;
}

std::string_view withoutPlus(std::string_view text) {
    text = trimmed(text);
    if (text.size() > 1 && text[0] == '+' && text[1] != '-') text.remove_prefix(1);
    return text;
}

/// No control character, and none of the two non-characters of the first plane.
bool isPrintable(char32_t code) {
    const bool control = code < 0x20 || (code >= 0x7F && code < 0xA0);
    return !control && code != 0xFFFE && code != 0xFFFF;
}

/// Appends valid UTF-8, with a '?' for every byte of what is not printable.
void appendPrintable(std::string& result, std::string_view valid) {
    for (auto it = valid.begin(); it != valid.end();) {
        const auto start = it;
        const bool shown = isPrintable(utf8::unchecked::next(it));
        const auto size = static_cast<std::size_t>(it - start);
        result += shown ? std::string(start, it) : std::string(size, '?');
    }
}

}  // namespace

std::string_view trimmed(std::string_view text) {
    constexpr std::string_view kBlanks = " \t\r";
    const std::size_t first = text.find_first_not_of(kBlanks);
    if (first == std::string_view::npos) return {};
    return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

std::optional<double> parseReal(std::string_view text) {
    std::string normal(withoutPlus(text));
    std::replace(normal.begin(), normal.end(), ',', '.');
    const std::optional<double> value = parseWhole<double>(normal);
    if (!value || !std::isfinite(*value)) return std::nullopt;
    return value;
}

std::optional<int> parseInteger(std::string_view text) {
    return parseWhole<int>(withoutPlus(text));
}

std::string formatReal(double value, int digits) {
    std::array<char, 64> buffer{};
    const auto [end, error] =
        std::to_chars(buffer.data(), buffer.data() + buffer.size(), value == 0.0 ? 0.0 : value,
                      std::chars_format::general, digits);
    return error == std::errc() ? std::string(buffer.data(), end) : std::string("?");
}

std::string formatFixed(double value, int decimals) {
    std::array<char, 512> buffer{};
    const auto [end, error] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value,
                                            std::chars_format::fixed, decimals);
    std::string text = error == std::errc() ? std::string(buffer.data(), end) : std::string("?");
    const bool negativeZero =
        text.front() == '-' && text.find_first_not_of("-0.") == std::string::npos;
    return negativeZero ? text.substr(1) : text;
}

std::string printable(std::string_view text) {
    std::string result;
    while (!text.empty()) {
        const auto valid =
            static_cast<std::size_t>(utf8::find_invalid(text.begin(), text.end()) - text.begin());
        appendPrintable(result, text.substr(0, valid));
        if (valid < text.size()) result += '?';
        text.remove_prefix(std::min(valid + 1, text.size()));
    }
    return result;
}

std::size_t characterCount(std::string_view text) {
    const std::string shown = printable(text);
    return static_cast<std::size_t>(utf8::distance(shown.begin(), shown.end()));
}

std::string counted(std::size_t count, std::string_view noun) {
    return std::to_string(count) + " " + std::string(noun) + (count == 1 ? "" : "s");
}

}  // namespace gmdrawing
