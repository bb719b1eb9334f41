// SPDX-License-Identifier: MIT
#include "apps/gmpath/OptionKinds.h"

#include <functional>

#include "drawing/Text.h"

namespace gmpath {

using gmdrawing::formatReal;
using gmdrawing::parseReal;

namespace {

/// A check that the text is a number that fits, or else is refused with the cause. Comparisons that
/// are true for the numbers wanted let no NaN pass; the checks that come with the parser would.
CLI::Validator numberThat(const std::function<bool(double)>& fits, const std::string& cause) {
    const auto check = [=](const std::string& text) {
        const auto number = parseReal(text);
        return number && fits(*number) ? std::string() : cause;
    };
    return CLI::Validator(check, "");
}

}  // namespace

CLI::Validator positiveNumber() {
    return numberThat([](double value) { return value > 0.0 && value <= kLargestNumber; },
                      "not a positive finite number");
}

CLI::Validator numberFrom(double low) {
    return numberThat([=](double value) { return value >= low && value <= kLargestNumber; },
                      "not a number from " + formatReal(low) + " to " + formatReal(kLargestNumber));
}

CLI::Validator angleUpTo(double largest) {
    return numberThat([=](double value) { return value > 0.0 && value <= largest; },
                      "not a number above 0 and up to " + formatReal(largest));
}

void addOutputs(CLI::App& command, std::vector<std::string>& outputs,
                const std::string& description) {
    command.add_option("-o,--output", outputs, description)->required()->allow_extra_args(false);
}

}  // namespace gmpath
