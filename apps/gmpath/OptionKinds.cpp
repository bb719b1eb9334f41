// SPDX-License-Identifier: MIT
#include "apps/gmpath/OptionKinds.h"

#include <cmath>
#include <functional>
#include <optional>

#include "drawing/Text.h"
#include "drawing/Units.h"

namespace gmpath {

using gmdrawing::formatReal;
using gmdrawing::parseLength;
using gmdrawing::parseReal;

namespace {

/// Refuses a text that is no number or does not fit, with the cause, and rewrites others plainly,
/// so that the parser reads the number that was checked. Comparisons that are true for the numbers
/// wanted let no NaN pass.
CLI::Validator numberThat(const std::function<bool(double)>& fits, const std::string& cause) {
    const auto check = [=](std::string& text) {
        constexpr int kAllDigits = 17;
        const bool hasComma = text.find(',') != std::string::npos;
        const auto number = hasComma ? std::nullopt : parseReal(text);
        if (!number || !fits(*number)) return cause;
        text = formatReal(*number, kAllDigits);
        return std::string();
    };
    return CLI::Validator(check, "");
}

/// The same for a length, whose text stays.
CLI::Validator lengthThat(const std::function<bool(double)>& fits, const std::string& cause) {
    const auto check = [=](std::string& text) {
        const bool hasComma = text.find(',') != std::string::npos;
        const auto length = hasComma ? std::nullopt : parseLength(text);
        return length && fits(length->value) ? std::string() : cause;
    };
    return CLI::Validator(check, "");
}

bool isPositive(double value) {
    return value > 0.0 && value <= kLargestNumber;
}

std::function<bool(double)> isFrom(double low) {
    return [=](double value) { return value >= low && value <= kLargestNumber; };
}

std::string rangeText(double low) {
    return "from " + formatReal(low) + " to " + formatReal(kLargestNumber);
}

std::string positiveText() {
    return "above 0 and up to " + formatReal(kLargestNumber);
}

}  // namespace

CLI::Validator positiveNumber() {
    return numberThat(isPositive, "not a number " + positiveText());
}

CLI::Validator numberFrom(double low) {
    return numberThat(isFrom(low), "not a number " + rangeText(low));
}

CLI::Validator finiteLength() {
    return lengthThat([](double value) { return std::abs(value) <= kLargestNumber; },
                      "not a length up to " + formatReal(kLargestNumber));
}

CLI::Validator positiveLength() {
    return lengthThat(isPositive, "not a length " + positiveText());
}

CLI::Validator lengthFrom(double low) {
    return lengthThat(isFrom(low), "not a length " + rangeText(low));
}

CLI::Validator angleUpTo(double largest) {
    return numberThat([=](double value) { return value > 0.0 && value <= largest; },
                      "not a number above 0 and up to " + formatReal(largest));
}

CLI::Validator countUpTo(int largest) {
    const auto fits = [=](double value) {
        return value >= 1.0 && value <= largest && value == std::floor(value);
    };
    return numberThat(fits, "not a whole number from 1 to " + std::to_string(largest));
}

void addOutputs(CLI::App& command, std::vector<std::string>& outputs,
                const std::string& description) {
    command.add_option("-o,--output", outputs, description)->required()->allow_extra_args(false);
}

}  // namespace gmpath
