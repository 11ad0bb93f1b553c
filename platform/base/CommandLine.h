#pragma once

#include <map>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// An option that a program knows, by its name without the dashes.
struct CommandLineOption {
    enum class Value {
        None,     // --name
        Required, // --name VALUE or --name=VALUE
        Optional, // --name or --name=VALUE; a word after it is an argument of its own
    };
    std::string_view name;
    Value value = Value::None;
};

// A program's arguments, sorted into options and the other words.
//
// Options and words may be mixed; after "--" everything is a word, and "-" is one. An option given
// more than once counts as its last occurrence. Reading stops at the first mistake.
class CommandLine
{
public:
    // `arguments` are those after the program's name.
    CommandLine(std::span<const CommandLineOption> known, std::span<const std::string> arguments);

    // One line without newline that says what is wrong and what to do, where an option is unknown,
    // lacks its value or has one too many. Programs put theirs there with fail() as well.
    [[nodiscard]] const std::optional<std::string>& error() const { return _error; }
    // Keeps the first error only.
    void fail(std::string error);

    [[nodiscard]] bool has(std::string_view name) const { return _options.contains(name); }
    // The option's value; empty where it was given without one, nothing where it was not given.
    [[nodiscard]] std::optional<std::string> value(std::string_view name) const;
    // The option's value if it lies in the range, nothing where the option was not given or its
    // value is no such number, which is then the error.
    [[nodiscard]] std::optional<double> number(std::string_view name, double least, double most);
    // The words that are no options.
    [[nodiscard]] const std::vector<std::string>& words() const { return _words; }

private:
    // Returns whether the following argument was used up as its value.
    bool takeOption(std::span<const CommandLineOption> known, std::string_view argument,
                    const std::string* following);

    std::map<std::string, std::string, std::less<>> _options;
    std::vector<std::string> _words;
    std::optional<std::string> _error;
};

// The whole text as a finite decimal number with '.' as its point, in any locale; nothing if it is
// none.
std::optional<double> decimalNumber(std::string_view text);

} // namespace orvane
