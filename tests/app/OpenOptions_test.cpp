// Options of `orvane open FILE`.

#include "app/AppOptions.h"
#include "platform/base/TelephonyConstants.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::HasSubstr;

AppOptions parsed(const std::vector<std::string>& arguments)
{
    return parseAppOptions(arguments, std::vector<std::string>{"lte"});
}

TEST(OpenOptionsTest, ARecordingIsOpenedInsteadOfTheLiveView)
{
    const AppOptions options = parsed({"open", "a.dlf"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.file, "a.dlf");
    EXPECT_FALSE(options.technology);
    EXPECT_EQ(options.command, AppCommand::Open);
    EXPECT_EQ(parsed({}).command, AppCommand::Live);
}

TEST(OpenOptionsTest, OptionsMayStandAnywhere)
{
    for (const auto& arguments : std::vector<std::vector<std::string>>{
             {"--ui", "json", "open", "--technology=umts",   "a.dlf",     "--refresh",    "0.5"},
             {"open",      "a.dlf",       "--refresh=0.5", "--ui=json", "--technology", "umts"}
    }) {
        const AppOptions options = parsed(arguments);
        EXPECT_FALSE(options.error) << *options.error;
        EXPECT_EQ(options.file, "a.dlf");
        EXPECT_EQ(options.technology, kTSLogChannelTechnology_Varnel_GSM);
        EXPECT_EQ(options.refreshInterval, 500ms);
        EXPECT_EQ(options.frontEnd, FrontEndKind::Json);
    }
}

TEST(OpenOptionsTest, AFileNameAloneIsOpened)
{
    for (const char* file : {"drive.dlf", "./drive", "/tmp/a", "-"}) {
        const AppOptions options = parsed({"--ui", "json", file});
        EXPECT_FALSE(options.error) << file;
        EXPECT_EQ(options.command, AppCommand::Open) << file;
        EXPECT_EQ(options.file, file);
    }
    EXPECT_THAT(parsed({"drive"}).error.value_or(""),
                HasSubstr("to open a file of that name write orvane open drive"));
    EXPECT_THAT(parsed({"a.dlf", "b.dlf"}).error.value_or(""), HasSubstr("one recording"));
    EXPECT_EQ(parsed({"open", "-"}).file, "-");
}

TEST(OpenOptionsTest, AFileMayHaveAnyName)
{
    EXPECT_EQ(parsed({"open", "open"}).file, "open");
    EXPECT_EQ(parsed({"open", "--", "--demo"}).file, "--demo");
}

TEST(OpenOptionsTest, EachMistakeIsToldInOneLineThatSaysWhatToDo)
{
    const struct {
        std::vector<std::string> arguments;
        const char* error;
    } cases[] = {
        {{"open"},                             "open needs the name of one recording"       },
        {{"open", ""},                         "open needs the name of one recording"       },
        {{"open", "a", "b"},                   "orvane open FILE"                           },
        {{"open", "a", "--technology", "gsm"}, "takes lte, umts, utran, cdma or cellmonitor"},
        {{"--technology", "lte"},              "orvane open FILE --technology NAME"         },
        {{"open", "a", "--demo"},              "--demo is for the live view"                },
        {{"open", "a", "--ports", "p"},        "--ports is for the live view"               },
        {{"open", "a", "--root", "r"},         "--root is for the live view"                },
        {{"open", "a", "--record", "r"},       "--record is for the live view"              },
        {{"open", "a", "--refresh", "0"},      "--refresh \"0\" is unusable"                },
    };
    for (const auto& each : cases)
        EXPECT_THAT(parsed(each.arguments).error.value_or(""), HasSubstr(each.error));
}

} // namespace
} // namespace orvane
