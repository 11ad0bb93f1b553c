#include "app/AppOptions.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::HasSubstr;

const std::vector<std::string> kScenarios = {"lte", "umts"};

AppOptions parsed(std::vector<std::string> arguments)
{
    return parseAppOptions(arguments, kScenarios);
}

} // namespace

TEST(AppOptionsTest, WithoutArgumentsEverythingHasItsDefault)
{
    const AppOptions options = parsed({});
    EXPECT_FALSE(options.error);
    EXPECT_FALSE(options.demo);
    EXPECT_EQ(options.frontEnd, std::nullopt);
    EXPECT_EQ(options.ports, "");
    EXPECT_FALSE(options.root);
    EXPECT_EQ(options.refreshInterval, 2s);
    EXPECT_EQ(options.command, AppCommand::Live);
    const auto log = makeLog(options.log, "orvane");
    EXPECT_TRUE(log->accepts(LogPriority::Warning));
    EXPECT_FALSE(log->accepts(LogPriority::Notice));
}

TEST(AppOptionsTest, TakesEachOption)
{
    const AppOptions options = parsed({"--ui=json", "--ports", "/p", "--root", "/r", "--refresh",
                                       "0.25", "--log", "none", "--log-level", "info"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.frontEnd, FrontEndKind::Json);
    EXPECT_EQ(options.ports, "/p");
    EXPECT_EQ(options.root, "/r");
    EXPECT_EQ(options.refreshInterval, 250ms);
    EXPECT_EQ(options.log.target, LogChoice::Target::None);
    EXPECT_EQ(options.log.lowest, LogPriority::Info);
}

TEST(AppOptionsTest, TheDemoIsLteUnlessNamed)
{
    EXPECT_EQ(parsed({"--demo"}).demo, "lte");
    EXPECT_EQ(parsed({"--demo=umts"}).demo, "umts");
}

TEST(AppOptionsTest, OnceIsForTextAndJsonAndTextUnlessNamed)
{
    EXPECT_FALSE(parsed({}).once);
    EXPECT_EQ(parsed({"--once"}).once, 10s);
    EXPECT_EQ(parsed({"--once"}).frontEnd, FrontEndKind::Text);
    EXPECT_EQ(parsed({"--once=0.5", "--ui", "json"}).once, 500ms);
    EXPECT_EQ(parsed({"--once=0.5", "--ui", "json"}).frontEnd, FrontEndKind::Json);
    for (const char* ui : {"window", "terminal"})
        EXPECT_THAT(parsed({"--once", "--ui", ui}).error.value_or(""),
                    HasSubstr("--once is for --ui text and --ui json"));
    EXPECT_THAT(parsed({"--once=soon"}).error.value_or(""), HasSubstr("--once \"soon\""));
}

TEST(AppOptionsTest, EachMistakeIsToldInOneLineThatSaysWhatToDo)
{
    const struct {
        std::vector<std::string> arguments;
        const char* part;
    } kMistakes[] = {
        {{"--demo=mars"},             "--demo takes lte or umts"   },
        {{"--demo", "--ports", "/p"}, "--ports cannot be used with"},
        {{"--ui", "hologram"},        "--ui takes"                 },
        {{"--ports="},                "--ports needs"              },
        {{"--root="},                 "--root needs"               },
        {{"--refresh", "0"},          "refresh"                    },
        {{"--refresh", "x"},          "refresh"                    },
        {{"--refresh", "nan"},        "refresh"                    },
        {{"--format", "csv"},         "orvane export FILE"         },
        {{"--log", "paper"},          "--log takes"                },
        {{"--log-level", "loud"},     "--log-level takes"          },
        {{"--demo", "lte"},           "write --demo=lte"           },
        {{"watch"},                   "orvane --help"              },
        {{"--frobnicate"},            "--frobnicate"               },
    };
    for (const auto& mistake : kMistakes) {
        const AppOptions options = parsed(mistake.arguments);
        ASSERT_TRUE(options.error) << mistake.part;
        EXPECT_THAT(*options.error, HasSubstr(mistake.part));
        EXPECT_EQ(options.error->find('\n'), std::string::npos);
    }
}

TEST(AppOptionsTest, EveryFrontEndHasItsName)
{
    for (const auto& [name, kind] : {
             std::pair("window", FrontEndKind::Window),
             std::pair("terminal", FrontEndKind::Terminal),
             std::pair("text", FrontEndKind::Text),
             std::pair("json", FrontEndKind::Json),
         })
        EXPECT_EQ(parsed({"--ui", name}).frontEnd, kind) << name;
    EXPECT_FALSE(parsed({}).isFullScreen);
    EXPECT_TRUE(parsed({"--fullscreen"}).isFullScreen);
}

TEST(AppOptionsTest, DetailsAreForWhatIsShown)
{
    EXPECT_FALSE(parsed({"--ui", "json"}).printsDetails);
    EXPECT_TRUE(parsed({"--ui", "json", "--details"}).printsDetails);
    EXPECT_TRUE(parsed({"open", "a.dlf", "--details"}).printsDetails);
    EXPECT_TRUE(parsed({"export", "a.dlf", "--details"}).error);
}

TEST(AppOptionsTest, ByDefaultAWindowElseTheTerminalElseText)
{
    EXPECT_EQ(defaultFrontEnd(true, true), FrontEndKind::Window);
    EXPECT_EQ(defaultFrontEnd(true, false), FrontEndKind::Window);
    EXPECT_EQ(defaultFrontEnd(false, true), FrontEndKind::Terminal);
    EXPECT_EQ(defaultFrontEnd(false, false), FrontEndKind::Text);
}

TEST(AppOptionsTest, HelpNamesEveryOptionAndScenario)
{
    const std::string help = appHelp(AppCommand::Live, kScenarios);
    for (const char* word : {"--demo", "--ui", "--fullscreen", "--details", "--ports", "--root",
                             "--refresh", "--record", "--force", "--log", "--log-level",
                             "--technology", "--help", "--version", "lte or umts", "Exit status"})
        EXPECT_THAT(help, HasSubstr(word));
    EXPECT_TRUE(parsed({"--help"}).wantsHelp);
    EXPECT_TRUE(parsed({"-h"}).wantsHelp);
    EXPECT_EQ(appHelp(AppCommand::Open, kScenarios), help); // its options are among these
    EXPECT_TRUE(parsed({"--version"}).wantsVersion);
}

} // namespace orvane
