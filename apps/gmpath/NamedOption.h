#pragma once

#include <CLI/CLI.hpp>
#include <map>
#include <string>

namespace gmpath {

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

}  // namespace gmpath
