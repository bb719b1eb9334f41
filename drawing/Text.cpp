#include "drawing/Text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace gmpath {

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

/// Length of the printable UTF-8 character that starts the text, 0 when there is none. Leaves out
/// control characters, overlong forms, surrogates and the two non-characters of the first plane.
std::size_t printableLength(std::string_view text) {
    const auto byteAt = [&](std::size_t i) -> unsigned {
        return i < text.size() ? static_cast<unsigned char>(text[i]) : 0U;
    };
    const unsigned lead = byteAt(0);
    if (lead >= 0x20 && lead < 0x7F) return 1;
    const std::size_t size = lead >= 0xC2 && lead < 0xE0   ? 2
                             : lead >= 0xE0 && lead < 0xF0 ? 3
                             : lead >= 0xF0 && lead < 0xF5 ? 4
                                                           : 0;
    if (size == 0) return 0;
    unsigned code = lead & (0xFFU >> (size + 1));
    for (std::size_t i = 1; i < size; ++i) {
        if ((byteAt(i) & 0xC0U) != 0x80U) return 0;
        code = (code << 6U) | (byteAt(i) & 0x3FU);
    }
    constexpr std::array<unsigned, 5> kSmallestOfSize = {0, 0, 0xA0, 0x800, 0x10000};
    const bool surrogate = code >= 0xD800 && code < 0xE000;
    const bool nonCharacter = code == 0xFFFE || code == 0xFFFF || code > 0x10FFFF;
    return code < kSmallestOfSize[size] || surrogate || nonCharacter ? 0 : size;
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
        const std::size_t size = printableLength(text);
        result += size == 0 ? "?" : text.substr(0, size);
        text.remove_prefix(std::max<std::size_t>(size, 1));
    }
    return result;
}

std::string xmlEscaped(std::string_view text) {
    std::string result;
    for (const char c : text) {
        switch (c) {
            case '&':
                result += "&amp;";
                break;
            case '<':
                result += "&lt;";
                break;
            case '>':
                result += "&gt;";
                break;
            case '"':
                result += "&quot;";
                break;
            default:
                result += c;
        }
    }
    return result;
}

std::size_t characterCount(std::string_view text) {
    const auto startsCharacter = [](char c) {
        return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U;
    };
    return static_cast<std::size_t>(std::count_if(text.begin(), text.end(), startsCharacter));
}

std::string counted(std::size_t count, std::string_view noun) {
    return std::to_string(count) + " " + std::string(noun) + (count == 1 ? "" : "s");
}

}  // namespace gmpath
