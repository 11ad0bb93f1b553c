// Options of `orvane export FILE`.

#include "app/AppOptions.h"
#include "platform/base/TelephonyConstants.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

AppOptions parsed(std::vector<std::string> arguments)
{
    arguments.insert(arguments.begin(), "export");
    return parseAppOptions(arguments, {});
}
std::string errorOf(std::vector<std::string> arguments)
{
    return parsed(std::move(arguments)).error.value_or("");
}

TEST(ExportOptionsTest, AFileAloneGivesEveryRowAsJsonLines)
{
    const AppOptions options = parsed({"drive.dlf"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.file, "drive.dlf");
    EXPECT_THAT(options.paths, IsEmpty());
    EXPECT_EQ(options.refreshInterval, 2s);
    EXPECT_FALSE(options.technology);
    EXPECT_EQ(options.format, ExportFormat::JsonLines);
    EXPECT_EQ(options.log.target, LogChoice::Target::Syslog);
    EXPECT_EQ(options.log.lowest, LogPriority::Warning);
}

TEST(ExportOptionsTest, WithPathsTheFormatIsCsvUnlessGiven)
{
    const AppOptions options = parsed({"drive.dlf", "/a", "/b/*"});
    EXPECT_THAT(options.paths, ElementsAre("/a", "/b/*"));
    EXPECT_EQ(options.format, ExportFormat::Csv);
    EXPECT_EQ(parsed({"drive.dlf", "/a", "--format", "jsonl"}).format, ExportFormat::JsonLines);
    EXPECT_EQ(parsed({"drive.dlf", "--format=csv"}).format, ExportFormat::Csv);
    EXPECT_EQ(parsed({"drive.dlf", "--format=jsonl"}).format, ExportFormat::JsonLines);
}

TEST(ExportOptionsTest, TakesEachOption)
{
    const AppOptions options = parsed(
        {"--every", "0.25", "--technology=utran", "drive.dlf", "--list", "--log", "none", "/a"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.refreshInterval, 250ms);
    EXPECT_EQ(options.technology, kTSLogChannelTechnology_Varnel_UTRAN2);
    EXPECT_EQ(options.format, ExportFormat::PathList);
    EXPECT_THAT(options.paths, ElementsAre("/a"));
    EXPECT_TRUE(parsed({"--help"}).wantsHelp);
}

TEST(ExportOptionsTest, CsvCanBeForASpreadsheet)
{
    EXPECT_FALSE(parsed({"f", "/a"}).isForSpreadsheet);
    for (const AppOptions& options :
         {parsed({"f", "/a", "--spreadsheet"}), parsed({"f", "--format=csv", "--spreadsheet"})}) {
        EXPECT_FALSE(options.error);
        EXPECT_TRUE(options.isForSpreadsheet);
    }
}

TEST(ExportOptionsTest, UnusableArgumentsSayWhatToDo)
{
    EXPECT_THAT(errorOf({}), HasSubstr("orvane export FILE"));
    EXPECT_THAT(errorOf({""}), HasSubstr("orvane export FILE"));
    EXPECT_THAT(errorOf({"f", ""}), HasSubstr("--list"));
    EXPECT_THAT(errorOf({"f", "--format", "xml"}), HasSubstr("csv or jsonl"));
    EXPECT_THAT(errorOf({"f", "--list", "--format", "csv"}), HasSubstr("--list"));
    EXPECT_THAT(errorOf({"f", "--spreadsheet"}), HasSubstr("--format csv"));
    EXPECT_THAT(errorOf({"f", "--spreadsheet", "--list", "/a"}), HasSubstr("--format csv"));
    EXPECT_THAT(errorOf({"f", "--spreadsheet", "--format=jsonl", "/a"}), HasSubstr("--format csv"));
    EXPECT_THAT(errorOf({"f", "--technology", "gprs"}), HasSubstr("lte, umts, utran"));
    EXPECT_THAT(errorOf({"f", "--ui", "json"}), HasSubstr("--ui"));
    for (const char* period : {"0", "-1", "soon", "1e9", "nan"})
        EXPECT_THAT(errorOf({"f", "--every", period}), HasSubstr("--every")) << period;
}

TEST(ExportOptionsTest, OptionsMayStandBeforeTheCommand)
{
    const std::vector<std::string> arguments = {"--log", "none", "export", "f"};
    const AppOptions options = parseAppOptions(arguments, {});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.command, AppCommand::Export);
    EXPECT_EQ(options.file, "f");
    EXPECT_EQ(options.log.target, LogChoice::Target::None);
}

TEST(ExportOptionsTest, HelpIsOnTheCommandAlone)
{
    EXPECT_TRUE(parsed({"--help"}).wantsHelp);
    const std::string help = appHelp(AppCommand::Export, {});
    EXPECT_THAT(help, HasSubstr("Usage: orvane export FILE [OPTION...] [PATH...]\nWrites rows"));
    for (const char* option : {"--format csv|jsonl", "--every", "--list", "--technology", "--log ",
                               "--log-level", "--help", "Exit status"})
        EXPECT_THAT(help, HasSubstr(option));
    for (const char* option : {"--demo", "--ui", "--ports", "--record"})
        EXPECT_THAT(help, Not(HasSubstr(option)));
}

} // namespace
} // namespace orvane
