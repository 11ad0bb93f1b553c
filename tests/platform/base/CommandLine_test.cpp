#include "platform/base/CommandLine.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

struct Chosen {
    bool wantsHelp = false;
    std::string ports;
    std::optional<std::string> file;
    std::optional<double> speed;
    std::chrono::nanoseconds period{0};
    std::size_t format = 99;
    std::string demo;
};

using ChosenOption = Option<Chosen>;

constexpr CommandSet kSecondOnly{1U << 1, "is for the second command"};

constexpr ChosenOption kTable[] = {
    ChosenOption({"help", "", ""}, &Chosen::wantsHelp),
    ChosenOption({"ports", "DIR", ""}, &Chosen::ports),
    ChosenOption({"file", "FILE", "", kSecondOnly}, &Chosen::file),
    ChosenOption({"speed", "N|max", "", {}, 0.001, 1000},
                 [](Chosen& chosen, const GivenOption& given) { chosen.speed = given.number(); }),
    ChosenOption({"period", "SECONDS", "", {}, 0.01, 60}, &Chosen::period),
    ChosenOption({"format", "csv|jsonl|text", ""},
                 [](Chosen& chosen, const GivenOption& given) { chosen.format = given.choice(); }),
    ChosenOption(
        {"demo", "[PLACE]", ""},
        [](Chosen& chosen, const GivenOption& given) { chosen.demo = given.textOrFirst(); }),
};

CommandLine parsed(const std::vector<std::string>& arguments)
{
    const ValueNames names{
        {"PLACE", {"town", "sea"}}
    };
    return {
        {std::begin(kTable), std::end(kTable)},
        arguments, names
    };
}

Chosen chosen(const std::vector<std::string>& arguments)
{
    Chosen options;
    parsed(arguments).storeIn(options, kTable);
    return options;
}

std::string errorOf(const std::vector<std::string>& arguments)
{
    try {
        chosen(arguments);
    } catch (const UsageError& error) {
        return error.what();
    }
    return "no error";
}

TEST(CommandLineTest, NothingGivenStoresNothing)
{
    const CommandLine line = parsed({});
    EXPECT_FALSE(line.has("help"));
    EXPECT_THAT(line.words(), IsEmpty());
    const Chosen options = chosen({});
    EXPECT_FALSE(options.wantsHelp);
    EXPECT_EQ(options.ports, "");
    EXPECT_FALSE(options.file);
}

TEST(CommandLineTest, AValueFollowsAsAWordOrAfterAnEqualsSign)
{
    EXPECT_EQ(chosen({"--ports", "/tmp/a"}).ports, "/tmp/a");
    EXPECT_EQ(chosen({"--ports=/tmp/a=b"}).ports, "/tmp/a=b");
    EXPECT_EQ(chosen({"--ports", "--help"}).ports, "--help");
    EXPECT_EQ(chosen({"--file", "a"}).file, "a");
}

TEST(CommandLineTest, AnOptionalValueComesOnlyAfterAnEqualsSign)
{
    EXPECT_EQ(chosen({"--demo=sea"}).demo, "sea");
    EXPECT_EQ(chosen({"--demo="}).demo, "town");
    EXPECT_EQ(chosen({"--demo", "sea"}).demo, "town"); // the first of its names
    EXPECT_THAT(parsed({"--demo", "sea"}).words(), ElementsAre("sea"));
}

TEST(CommandLineTest, WordsAndOptionsMayBeMixed)
{
    const CommandLine line = parsed({"open", "--ports", "a", "-", "x.dlf", "--help"});
    EXPECT_TRUE(line.has("help"));
    EXPECT_THAT(line.words(), ElementsAre("open", "-", "x.dlf"));
}

TEST(CommandLineTest, EverythingAfterTwoDashesIsAWord)
{
    const CommandLine line = parsed({"--help", "--", "--ports", "--", "-x"});
    EXPECT_THAT(line.words(), ElementsAre("--ports", "--", "-x"));
    EXPECT_FALSE(line.has("ports"));
}

TEST(CommandLineTest, ShortHelpIsHelp) { EXPECT_TRUE(chosen({"-h"}).wantsHelp); }

TEST(CommandLineTest, TheLastOccurrenceOfAnOptionCounts)
{
    EXPECT_EQ(chosen({"--ports=a", "--ports", "b"}).ports, "b");
    EXPECT_EQ(chosen({"--demo=sea", "--demo"}).demo, "town");
    EXPECT_EQ(chosen({"--period=never", "--period=1"}).period, 1s);
}

TEST(CommandLineTest, MistakesAreNamedWithWhatToDo)
{
    const struct {
        std::vector<std::string> arguments;
        const char* error;
    } cases[] = {
        {{"--port", "a"},       "unknown option --port; --help lists the options"                      },
        {{"--port=a"},          "unknown option --port; --help lists the options"                      },
        {{"-help"},             "unknown option -help; --help lists the options"                       },
        {{"-x"},                "unknown option -x; --help lists the options"                          },
        {{"--=a"},              "unknown option --; --help lists the options"                          },
        {{"--help=yes"},        "option --help takes no value; give it as --help alone"                },
        {{"--ports"},           "option --ports needs a value; give it as --ports=VALUE"               },
        {{"--nope", "--help="}, "unknown option --nope; --help lists the options"                      },
        {{"--ports="},          "--ports needs the name of a directory"                                },
        {{"--file="},           "--file needs the name of a file"                                      },
        {{"--format=xml"},      "--format takes csv, jsonl or text, not \"xml\""                       },
        {{"--format="},         "--format takes csv, jsonl or text, not \"\""                          },
        {{"--demo=moon"},       "--demo takes town or sea, not \"moon\""                               },
        {{"--period=0"},        "--period \"0\" is unusable; give a number from 0.01 to 60"            },
        {{"--speed=slow"},      "--speed \"slow\" is unusable; give a number from 0.001 to 1000 or max"},
    };
    for (const auto& each : cases)
        EXPECT_EQ(errorOf(each.arguments), each.error);
}

TEST(CommandLineTest, AnOptionOfAnotherCommandIsRefusedInItsWords)
{
    const CommandLine line = parsed({"--file", "a", "--help"});
    EXPECT_NO_THROW(line.checkCommand(1));
    try {
        line.checkCommand(0);
        FAIL() << "it was accepted";
    } catch (const UsageError& error) {
        EXPECT_STREQ(error.what(), "--file is for the second command");
    }
}

TEST(CommandLineTest, ANumberMustBeWholeAndInRange)
{
    EXPECT_EQ(chosen({"--speed", "0.5"}).speed, 0.5);
    EXPECT_EQ(chosen({"--period", "0.25"}).period, 250ms);
    for (const char* text : {"", "x", "1x", " 1", "0", "1000.1", "-1", "nan", "inf", "1,5"})
        EXPECT_THAT(errorOf({std::string("--speed=") + text}), HasSubstr("is unusable")) << text;
}

TEST(CommandLineTest, AChoiceIsTheValuesPlaceAmongItsNames)
{
    EXPECT_EQ(chosen({"--format=csv"}).format, 0U);
    EXPECT_EQ(chosen({"--format=text"}).format, 2U);
    EXPECT_EQ(alternatives(std::vector<std::string>{"a"}), "a");
    EXPECT_EQ(alternatives({}), "");
}

} // namespace
} // namespace orvane
