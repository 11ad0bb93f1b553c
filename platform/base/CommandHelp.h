#pragma once

#include "platform/base/CommandLine.h"

namespace orvane
{

struct CommandLineCommand {
    std::string_view name;  // the word that asks for it; empty for the first
    std::string_view usage; // its line of usage, after the program's name
    // What --help says before and after its options. A command without `about` is explained on the
    // page of the first. Paragraphs are parted by an empty line and broken where they fit.
    std::string_view about;
    std::string_view notes;
};

// The text of --help: how the program is called, and the options of one command.
std::string helpText(std::string_view program, std::span<const CommandLineCommand> commands,
                     std::size_t command, std::span<const CommandLineOption> options,
                     const ValueNames& names);

} // namespace orvane
