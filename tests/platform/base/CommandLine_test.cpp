#include "platform/base/CommandLine.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

constexpr CommandLineOption kKnown[] = {
    {"help",  CommandLineOption::Value::None    },
    {"ports", CommandLineOption::Value::Required},
    {"speed", CommandLineOption::Value::Required},
    {"demo",  CommandLineOption::Value::Optional},
};

CommandLine parsed(std::vector<std::string> arguments) { return CommandLine(kKnown, arguments); }

TEST(CommandLineTest, NothingGivenHasNothing)
{
    const CommandLine line = parsed({});
    EXPECT_FALSE(line.error());
    EXPECT_FALSE(line.has("help"));
    EXPECT_FALSE(line.value("ports"));
    EXPECT_THAT(line.words(), IsEmpty());
}

TEST(CommandLineTest, AValueFollowsAsAWordOrAfterAnEqualsSign)
{
    EXPECT_EQ(parsed({"--ports", "/tmp/a"}).value("ports"), "/tmp/a");
    EXPECT_EQ(parsed({"--ports=/tmp/a=b"}).value("ports"), "/tmp/a=b");
    EXPECT_EQ(parsed({"--ports="}).value("ports"), "");
    EXPECT_EQ(parsed({"--ports", "--help"}).value("ports"), "--help");
}

TEST(CommandLineTest, AnOptionalValueComesOnlyAfterAnEqualsSign)
{
    EXPECT_EQ(parsed({"--demo=umts"}).value("demo"), "umts");
    const CommandLine line = parsed({"--demo", "umts"});
    EXPECT_EQ(line.value("demo"), "");
    EXPECT_THAT(line.words(), ElementsAre("umts"));
}

TEST(CommandLineTest, WordsAndOptionsMayBeMixed)
{
    const CommandLine line = parsed({"open", "--ports", "a", "-", "x.dlf", "--help"});
    EXPECT_FALSE(line.error());
    EXPECT_TRUE(line.has("help"));
    EXPECT_THAT(line.words(), ElementsAre("open", "-", "x.dlf"));
}

TEST(CommandLineTest, EverythingAfterTwoDashesIsAWord)
{
    const CommandLine line = parsed({"--help", "--", "--ports", "--", "-x"});
    EXPECT_FALSE(line.error());
    EXPECT_THAT(line.words(), ElementsAre("--ports", "--", "-x"));
    EXPECT_FALSE(line.has("ports"));
}

TEST(CommandLineTest, TheLastOccurrenceOfAnOptionCounts)
{
    EXPECT_EQ(parsed({"--ports=a", "--ports", "b"}).value("ports"), "b");
    EXPECT_EQ(parsed({"--demo=umts", "--demo"}).value("demo"), "");
}

TEST(CommandLineTest, MistakesAreNamedWithWhatToDo)
{
    const struct {
        std::vector<std::string> arguments;
        const char* error;
    } cases[] = {
        {{"--port", "a"},       "unknown option --port; --help lists the options"       },
        {{"--port=a"},          "unknown option --port; --help lists the options"       },
        {{"-help"},             "unknown option -help; --help lists the options"        },
        {{"-x"},                "unknown option -x; --help lists the options"           },
        {{"--=a"},              "unknown option --; --help lists the options"           },
        {{"--help=yes"},        "option --help takes no value; give it as --help alone" },
        {{"--ports"},           "option --ports needs a value; give it as --ports=VALUE"},
        {{"--nope", "--help="}, "unknown option --nope; --help lists the options"       },
    };
    for (const auto& each : cases)
        EXPECT_EQ(parsed(each.arguments).error(), each.error);
}

TEST(CommandLineTest, TheFirstErrorIsKept)
{
    CommandLine line = parsed({"--nope"});
    line.fail("another");
    EXPECT_THAT(*line.error(), HasSubstr("--nope"));
    CommandLine other = parsed({});
    other.fail("first");
    other.fail("second");
    EXPECT_EQ(other.error(), "first");
}

TEST(CommandLineTest, ANumberMustBeWholeAndInRange)
{
    CommandLine good = parsed({"--speed", "0.5"});
    EXPECT_EQ(good.number("speed", 0.001, 1000), 0.5);
    EXPECT_FALSE(good.error());
    EXPECT_FALSE(good.number("demo", 0, 1));
    EXPECT_FALSE(good.error()); // not given is no mistake

    for (const char* text : {"", "x", "1x", " 1", "0", "1000.1", "-1", "nan", "inf", "1,5"}) {
        CommandLine bad = parsed({std::string("--speed=") + text});
        EXPECT_FALSE(bad.number("speed", 0.001, 1000)) << text;
        EXPECT_EQ(bad.error(), std::string("--speed \"") + text +
                                   "\" is unusable; give a number from 0.001 to 1000");
    }
}

TEST(CommandLineTest, DecimalNumbersAreTakenWholeOrNotAtAll)
{
    EXPECT_EQ(decimalNumber("-2.5e3"), -2500.0);
    EXPECT_EQ(decimalNumber("7"), 7.0);
    for (const char* text : {"", "+1", "1 ", "0x10", "1e999", "infinity"})
        EXPECT_FALSE(decimalNumber(text)) << text;
}

} // namespace
} // namespace orvane
