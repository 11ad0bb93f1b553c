#include "platform/base/CommandHelp.h"

#include <gtest/gtest.h>

#include <array>

namespace orvane
{
namespace
{

constexpr CommandLineCommand kCommands[] = {
    {"",      "[OPTION...]",           "Shows things.\n\nA second paragraph.", "It ends when it ends."},
    {"open",  "open FILE [OPTION...]", "",                                     ""                     },
    {"count", "count FILE",            "Counts things.",                       ""                     },
};

const std::vector<CommandLineOption> kOptions = {
    {"demo",        "[PLACE]",       "pretend: {} (default town)",   {0b001, ""}},
    {"a-long-name", "one|two|three", "what takes a line of its own", {0b010, ""}},
    {"format",
     "FORMAT",                       "an explanation of many words that does not fit into the line in which it begins and is "
     "broken",                                         {0b100, ""}},
    {"help",        "",              "show this",                    {}         },
};

const ValueNames kNames{
    {"PLACE", {"town", "sea", "sky"}}
};

std::string help(std::size_t command)
{
    return helpText("program", kCommands, command, kOptions, kNames);
}

TEST(CommandHelpTest, TheFirstPageCoversEachCommandWithoutOneOfItsOwn)
{
    EXPECT_EQ(help(0), R"(Usage: program [OPTION...]
       program open FILE [OPTION...]
       program count FILE    (see program count --help)
Shows things.

A second paragraph.

  --demo[=PLACE]            pretend: town, sea or sky (default town)
  --a-long-name one|two|three
                            what takes a line of its own
  --help                    show this

It ends when it ends.

Exit status: 0 after a normal end, 2 for unusable arguments, 1 for any other
failure.
)");
    EXPECT_EQ(help(1), help(0));
}

TEST(CommandHelpTest, ACommandsPageHasItsOwnUsageAndOptions)
{
    EXPECT_EQ(help(2), R"(Usage: program count FILE
Counts things.

  --format FORMAT           an explanation of many words that does not fit into
                            the line in which it begins and is broken
  --help                    show this

Exit status: 0 after a normal end, 2 for unusable arguments, 1 for any other
failure.
)");
}

} // namespace
} // namespace orvane
