#include "platform/base/CommandLine.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <utility>

namespace orvane
{

namespace
{

std::string shortNumber(double number)
{
    char text[32];
    const auto end = std::to_chars(text, text + sizeof text, number).ptr;
    return {text, end};
}

} // namespace

CommandLine::CommandLine(std::span<const CommandLineOption> known,
                         std::span<const std::string> arguments)
{
    for (std::size_t i = 0; i < arguments.size() && !_error; ++i) {
        const std::string& argument = arguments[i];
        if (argument == "--") {
            _words.insert(_words.end(), arguments.begin() + static_cast<std::ptrdiff_t>(i) + 1,
                          arguments.end());
            return;
        }
        const bool isOption = argument.size() > 1 && argument.front() == '-';
        if (!isOption)
            _words.push_back(argument);
        else if (takeOption(known, argument,
                            i + 1 < arguments.size() ? &arguments[i + 1] : nullptr))
            ++i;
    }
}

bool CommandLine::takeOption(std::span<const CommandLineOption> known, std::string_view argument,
                             const std::string* following)
{
    const std::size_t equals = argument.find('=');
    const std::string_view dashed = argument.substr(0, equals);
    const auto option = std::find_if(known.begin(), known.end(), [&](const auto& each) {
        return dashed.starts_with("--") && dashed.substr(2) == each.name;
    });
    if (option == known.end()) {
        fail("unknown option " + std::string(dashed) + "; --help lists the options");
        return false;
    }

    using Value = CommandLineOption::Value;
    std::string& value = _options[std::string(option->name)];
    value.clear();
    if (equals != std::string_view::npos) {
        if (option->value == Value::None)
            fail("option " + std::string(dashed) + " takes no value; give it as " +
                 std::string(dashed) + " alone");
        value = argument.substr(equals + 1);
        return false;
    }
    if (option->value != Value::Required)
        return false;
    if (!following) {
        fail("option " + std::string(dashed) + " needs a value; give it as " + std::string(dashed) +
             "=VALUE");
        return false;
    }
    value = *following;
    return true;
}

void CommandLine::fail(std::string error)
{
    if (!_error)
        _error = std::move(error);
}

std::optional<std::string> CommandLine::value(std::string_view name) const
{
    const auto found = _options.find(name);
    return found == _options.end() ? std::nullopt : std::optional(found->second);
}

std::optional<double> CommandLine::number(std::string_view name, double least, double most)
{
    const auto text = value(name);
    if (!text)
        return std::nullopt;
    const auto number = decimalNumber(*text);
    if (number && *number >= least && *number <= most)
        return number;
    fail("--" + std::string(name) + " \"" + *text + "\" is unusable; give a number from " +
         shortNumber(least) + " to " + shortNumber(most));
    return std::nullopt;
}

std::optional<double> decimalNumber(std::string_view text)
{
    double number = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stop != end || !std::isfinite(number))
        return std::nullopt;
    return number;
}

} // namespace orvane
