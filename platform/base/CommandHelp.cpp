#include "platform/base/CommandHelp.h"

namespace orvane
{

namespace
{

constexpr std::size_t kColumns = 80;
constexpr std::size_t kHelpColumn = 28;

constexpr std::string_view kExitStatus =
    "Exit status: 0 after a normal end, 2 for unusable arguments, 1 for any other failure.";

// Paragraphs of words, broken at the width of a terminal; lines after the first begin at `indent`.
std::string wrapped(std::string_view text, std::size_t indent)
{
    std::string lines;
    std::size_t column = indent;
    std::size_t newlines = 0;
    while (!text.empty()) {
        const std::size_t blanks = std::min(text.find_first_not_of(" \n"), text.size());
        for (const char blank : text.substr(0, blanks))
            newlines += blank == '\n' ? 1 : 0;
        text.remove_prefix(blanks);
        const std::string_view word = text.substr(0, text.find_first_of(" \n"));
        text.remove_prefix(word.size());
        if (word.empty())
            break;
        const bool isFirst = lines.empty();
        const bool endsParagraph = newlines > 1;
        if (!isFirst && (endsParagraph || column + 1 + word.size() > kColumns)) {
            lines += (endsParagraph ? "\n\n" : "\n") + std::string(indent, ' ');
            column = indent;
        } else if (!isFirst) {
            lines += ' ';
            ++column;
        }
        lines += word;
        column += word.size();
        newlines = 0;
    }
    return lines + "\n";
}

std::string optionHelp(const CommandLineOption& option, const ValueNames& names)
{
    std::string call = "  --" + std::string(option.name);
    if (option.argument.starts_with('['))
        call += "[=" + std::string(bareArgument(option)) + "]";
    else if (!option.argument.empty())
        call += " " + std::string(option.argument);
    call += call.size() < kHelpColumn - 1 ? std::string(kHelpColumn - call.size(), ' ')
                                          : "\n" + std::string(kHelpColumn, ' ');
    std::string help(option.help);
    if (const std::size_t place = help.find("{}"); place != std::string::npos)
        help.replace(place, 2, alternatives(namesOfValue(option, names)));
    return call + wrapped(help, kHelpColumn);
}

} // namespace

std::string helpText(std::string_view program, std::span<const CommandLineCommand> commands,
                     std::size_t command, std::span<const CommandLineOption> options,
                     const ValueNames& names)
{
    const std::size_t page = commands[command].about.empty() ? 0 : command;
    std::string text;
    unsigned commandsOfPage = 0;
    for (std::size_t i = 0; i < commands.size(); ++i) {
        const bool isExplained = i == page || (page == 0 && commands[i].about.empty());
        if (isExplained)
            commandsOfPage |= 1U << i;
        if (!isExplained && page != 0)
            continue;
        text += (text.empty() ? "Usage: " : "       ") + std::string(program) + " " +
                std::string(commands[i].usage);
        if (!isExplained)
            text += "    (see " + std::string(program) + " " + std::string(commands[i].name) +
                    " --help)";
        text += '\n';
    }
    text += wrapped(commands[page].about, 0) + "\n";
    for (const CommandLineOption& option : options)
        if ((option.commands.bits & commandsOfPage) != 0)
            text += optionHelp(option, names);
    if (!commands[page].notes.empty())
        text += "\n" + wrapped(commands[page].notes, 0);
    return text + "\n" + wrapped(kExitStatus, 0);
}

} // namespace orvane
