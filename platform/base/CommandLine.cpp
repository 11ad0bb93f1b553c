#include "platform/base/CommandLine.h"

#include "platform/base/DecimalNumber.h"

#include <algorithm>
#include <charconv>
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

std::string alternatives(std::span<const std::string> names)
{
    std::string text;
    for (std::size_t i = 0; i < names.size(); ++i)
        text += (i == 0 ? "" : i + 1 < names.size() ? ", " : " or ") + names[i];
    return text;
}

std::string_view bareArgument(const CommandLineOption& option)
{
    std::string_view argument = option.argument;
    if (argument.starts_with('['))
        argument = argument.substr(1, argument.size() - 2);
    return argument;
}

std::vector<std::string> namesOfValue(const CommandLineOption& option, const ValueNames& names)
{
    std::string_view argument = bareArgument(option);
    if (const auto found = names.find(argument); found != names.end())
        return found->second;
    std::vector<std::string> parts;
    if (argument.find('|') == std::string_view::npos)
        return parts;
    for (std::size_t end = 0; end != std::string_view::npos;) {
        end = argument.find('|');
        parts.emplace_back(argument.substr(0, end));
        argument.remove_prefix(std::min(end, argument.size() - 1) + 1);
    }
    return parts;
}

void GivenOption::fail(const std::string& problem) const
{
    throw UsageError("--" + std::string(_option.name) + " " + problem);
}

std::size_t GivenOption::choice() const
{
    const std::vector<std::string> known = namesOfValue(_option, _names);
    const auto found = std::find(known.begin(), known.end(), _value);
    if (found == known.end())
        fail("takes " + alternatives(known) + ", not \"" + _value + "\"");
    return static_cast<std::size_t>(found - known.begin());
}

std::string GivenOption::text() const
{
    const std::string_view argument = bareArgument(_option);
    if (!namesOfValue(_option, _names).empty())
        static_cast<void>(choice());
    else if (_value.empty())
        fail(argument == "DIR"      ? "needs the name of a directory"
             : argument == "DEVICE" ? "needs the name of a device"
             : argument == "FILE"   ? "needs the name of a file"
                                    : "needs a value");
    return _value;
}

std::string GivenOption::textOrFirst() const
{
    const std::vector<std::string> known = namesOfValue(_option, _names);
    return _value.empty() && !known.empty() ? known.front() : text();
}

double GivenOption::number() const
{
    const auto number = decimalNumber(_value);
    // "N|max" takes a number or "max".
    const std::size_t bar = _option.argument.find('|');
    const std::string alternative =
        bar == std::string_view::npos ? "" : " or " + std::string(_option.argument.substr(bar + 1));
    if (!number || *number < _option.least || *number > _option.most)
        fail("\"" + _value + "\" is unusable; give a number from " + shortNumber(_option.least) +
             " to " + shortNumber(_option.most) + alternative);
    return *number;
}

void GivenOption::storeIn(std::chrono::nanoseconds& seconds) const
{
    seconds = std::chrono::duration_cast<std::chrono::nanoseconds>(
        std::chrono::duration<double>(number()));
}

CommandLine::CommandLine(std::vector<CommandLineOption> known,
                         std::span<const std::string> arguments, ValueNames names)
    : _known(std::move(known)), _names(std::move(names))
{
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        const std::string& argument = arguments[i];
        if (argument == "--") {
            _words.insert(_words.end(), arguments.begin() + static_cast<std::ptrdiff_t>(i) + 1,
                          arguments.end());
            return;
        }
        const bool isOption = argument.size() > 1 && argument.front() == '-';
        if (!isOption)
            _words.push_back(argument);
        else if (takeOption(argument, i + 1 < arguments.size() ? &arguments[i + 1] : nullptr))
            ++i;
    }
}

bool CommandLine::takeOption(std::string_view argument, const std::string* following)
{
    const std::size_t equals = argument.find('=');
    const std::string dashed(argument.substr(0, equals));
    const std::string_view name = dashed == "-h"             ? std::string_view("help")
                                  : dashed.starts_with("--") ? std::string_view(dashed).substr(2)
                                                             : std::string_view();
    const auto option = std::find_if(_known.begin(), _known.end(),
                                     [&](const auto& each) { return name == each.name; });
    if (option == _known.end())
        throw UsageError("unknown option " + dashed + "; --help lists the options");

    std::string& value = _values[std::string(option->name)];
    value.clear();
    if (equals != std::string_view::npos) {
        if (option->argument.empty())
            throw UsageError("option " + dashed + " takes no value; give it as " + dashed +
                             " alone");
        value = argument.substr(equals + 1);
        return false;
    }
    if (option->argument.empty() || option->argument.starts_with('['))
        return false;
    if (!following)
        throw UsageError("option " + dashed + " needs a value; give it as " + dashed + "=VALUE");
    value = *following;
    return true;
}

std::optional<GivenOption> CommandLine::given(const CommandLineOption& option) const
{
    const auto found = _values.find(option.name);
    if (found == _values.end())
        return std::nullopt;
    return std::optional<GivenOption>(std::in_place, option, found->second, _names);
}

void CommandLine::checkCommand(std::size_t command) const
{
    for (const CommandLineOption& option : _known)
        if (has(option.name) && (option.commands.bits >> command & 1) == 0)
            throw UsageError("--" + std::string(option.name) + " " +
                             std::string(option.commands.elsewhere));
}

} // namespace orvane
