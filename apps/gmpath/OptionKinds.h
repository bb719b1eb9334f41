// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <map>
#include <string>
#include <vector>

namespace gmpath {

/// Numbers beyond this leave the plane in which the kernel can tell points apart.
constexpr double kLargestNumber = 1e9;

/// Numbers as options take them, to be given to `transform`: decimal, with a point, refused with
/// the range in words where they lie outside. They do not show in the help.

/// A number above 0 and up to 1e9.
CLI::Validator positiveNumber();

/// A number from `low` to 1e9.
CLI::Validator numberFrom(double low);

/// The same for lengths, for options of type `gmdrawing::Length`: they may be fractions as 1/4 and
/// have a unit behind them. The range is that of the number alone.
CLI::Validator finiteLength();
CLI::Validator positiveLength();
CLI::Validator lengthFrom(double low);

/// An angle in degrees above 0, up to `largest`.
CLI::Validator angleUpTo(double largest);

/// A whole number from 1 to `largest`.
CLI::Validator countUpTo(int largest);

/// Adds an option whose values have names; anything but the names is refused. `value` and `names`
/// are used when the command line is parsed.
template <typename Value, typename Target>
CLI::Option* addNamedOption(CLI::App& command, const std::string& option, Target& value,
                            const std::map<std::string, Value>& names,
                            const std::string& description) {
    const auto assign = [&value, &names](const std::string& name) { value = names.at(name); };
    return command.add_option_function<std::string>(option, assign, description)
        ->check(CLI::IsMember(&names).description(""))
        ->type_name("NAME");
}

/// Adds the option for the files to write, of which there is at least one.
void addOutputs(CLI::App& command, std::vector<std::string>& outputs,
                const std::string& description = "output file (.svg or .dxf), repeatable");

}  // namespace gmpath
