#pragma once

#include <chrono>
#include <cstddef>
#include <map>
#include <optional>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace orvane
{

// A program's command line as data. One table describes the options, one the commands; parsing,
// --help (CommandHelp.h) and error messages come from them.

// Unusable arguments: what() is one line that says what is wrong and what to do.
class UsageError : public std::runtime_error
{
    using std::runtime_error::runtime_error;
};

// The names that a value may have, by the word that stands for it in --help ("SCENARIO").
using ValueNames = std::map<std::string, std::vector<std::string>, std::less<>>;

// The commands that an option belongs to: bit N is the command at index N of the program's table.
struct CommandSet {
    unsigned bits = ~0U;
    // The error where the option is given to another command, after the option's name.
    std::string_view elsewhere;
};

struct CommandLineOption {
    std::string_view name; // without the dashes
    // The word that stands for the value: "FILE", or the values themselves: "csv|jsonl". Empty
    // where the option takes none; in brackets, "[SCENARIO]", where it may be left out, and then a
    // value is given as --name=VALUE only.
    std::string_view argument;
    std::string_view help; // "{}" stands for the value's names
    CommandSet commands = {};
    double least = 0; // of a number
    double most = 0;
};

// An option that was given. The functions throw UsageError where its value is unusable. Refers to
// the command line that it comes from.
class GivenOption
{
public:
    GivenOption(const CommandLineOption& option, const std::string& value, const ValueNames& names)
        : _option(option), _value(value), _names(names)
    {
    }

    // As it was given; empty where it was left out.
    [[nodiscard]] const std::string& value() const { return _value; }
    // Not empty, and one of the value's names where it has names.
    [[nodiscard]] std::string text() const;
    // The same, but where it was left out the first of the names.
    [[nodiscard]] std::string textOrFirst() const;
    // Within the option's range.
    [[nodiscard]] double number() const;
    // The value's place among its names.
    [[nodiscard]] std::size_t choice() const;

    void storeIn(bool& isGiven) const { isGiven = true; }
    void storeIn(std::string& target) const { target = text(); }
    void storeIn(std::optional<std::string>& target) const { target = text(); }
    void storeIn(std::chrono::nanoseconds& seconds) const;

private:
    [[noreturn]] void fail(const std::string& problem) const;

    const CommandLineOption& _option;
    const std::string& _value;
    const ValueNames& _names;
};

// A row of a program's table: an option, and the member of the program's options that takes it, or
// a function where a member is not enough.
template <typename Options>
struct Option : CommandLineOption {
    using Take = void (*)(Options&, const GivenOption&);
    using Target =
        std::variant<bool Options::*, std::string Options::*, std::optional<std::string> Options::*,
                     std::chrono::nanoseconds Options::*, Take>;

    constexpr Option(const CommandLineOption& option, Target storedIn)
        : CommandLineOption(option), target(storedIn)
    {
    }

    Target target;
};

// A program's arguments, sorted into options and words.
//
// Options and words may be mixed; after "--" everything is a word, and "-" is one. An option given
// more than once counts as its last occurrence. -h is --help.
class CommandLine
{
public:
    // `arguments` are those after the program's name. Throws UsageError where an option is unknown,
    // lacks its value or takes none.
    CommandLine(std::vector<CommandLineOption> known, std::span<const std::string> arguments,
                ValueNames names = {});

    [[nodiscard]] bool has(std::string_view name) const { return _values.contains(name); }
    [[nodiscard]] std::optional<GivenOption> given(const CommandLineOption& option) const;
    [[nodiscard]] const std::vector<std::string>& words() const { return _words; }

    // Throws UsageError where an option is given that does not belong to the command of that index.
    void checkCommand(std::size_t command) const;

    // Stores each option that was given.
    template <typename Options, std::size_t count>
    void storeIn(Options& options, const Option<Options> (&table)[count]) const
    {
        for (const Option<Options>& option : table)
            if (const auto given = this->given(option))
                std::visit([&](auto target) { store(options, target, *given); }, option.target);
    }

private:
    // Returns whether the following argument was used up as its value.
    bool takeOption(std::string_view argument, const std::string* following);

    template <typename Options>
    static void store(Options& options, typename Option<Options>::Take take,
                      const GivenOption& given)
    {
        take(options, given);
    }
    template <typename Options, typename Value>
    static void store(Options& options, Value Options::*member, const GivenOption& given)
    {
        given.storeIn(options.*member);
    }

    std::vector<CommandLineOption> _known;
    ValueNames _names;
    std::map<std::string, std::string, std::less<>> _values;
    std::vector<std::string> _words;
};

// "a", "a or b", "a, b or c".
std::string alternatives(std::span<const std::string> names);
// The names that an option's value may have, in order; empty where it is free.
std::vector<std::string> namesOfValue(const CommandLineOption& option, const ValueNames& names);
// The argument without the brackets of a value that may be left out.
std::string_view bareArgument(const CommandLineOption& option);

} // namespace orvane
