#include "app/ExportOptions.h"

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

ExportOptions parsed(std::vector<std::string> arguments) { return parseExportOptions(arguments); }
std::string errorOf(std::vector<std::string> arguments)
{
    return parsed(std::move(arguments)).error.value_or("");
}

TEST(ExportOptionsTest, AFileAloneGivesEveryRowAsJsonLines)
{
    const ExportOptions options = parsed({"drive.dlf"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.request.file, "drive.dlf");
    EXPECT_THAT(options.request.paths, IsEmpty());
    EXPECT_EQ(options.request.period, 2s);
    EXPECT_FALSE(options.request.technology);
    EXPECT_EQ(options.format, ExportFormat::JsonLines);
    EXPECT_TRUE(options.log);
}

TEST(ExportOptionsTest, WithPathsTheFormatIsCsvUnlessGiven)
{
    const ExportOptions options = parsed({"drive.dlf", "/a", "/b/*"});
    EXPECT_THAT(options.request.paths, ElementsAre("/a", "/b/*"));
    EXPECT_EQ(options.format, ExportFormat::Csv);
    EXPECT_EQ(parsed({"drive.dlf", "/a", "--format", "jsonl"}).format, ExportFormat::JsonLines);
    EXPECT_EQ(parsed({"drive.dlf", "--format=csv"}).format, ExportFormat::Csv);
    EXPECT_EQ(parsed({"drive.dlf", "--format=jsonl"}).format, ExportFormat::JsonLines);
}

TEST(ExportOptionsTest, TakesEachOption)
{
    const ExportOptions options = parsed(
        {"--every", "0.25", "--technology=utran", "drive.dlf", "--list", "--log", "none", "/a"});
    EXPECT_FALSE(options.error);
    EXPECT_EQ(options.request.period, 250ms);
    EXPECT_EQ(options.request.technology, kTSLogChannelTechnology_Varnel_UTRAN2);
    EXPECT_EQ(options.format, ExportFormat::PathList);
    EXPECT_THAT(options.request.paths, ElementsAre("/a"));
    EXPECT_TRUE(parsed({"--help"}).wantsHelp);
}

TEST(ExportOptionsTest, UnusableArgumentsSayWhatToDo)
{
    EXPECT_THAT(errorOf({}), HasSubstr("orvane export FILE"));
    EXPECT_THAT(errorOf({""}), HasSubstr("orvane export FILE"));
    EXPECT_THAT(errorOf({"f", ""}), HasSubstr("--list"));
    EXPECT_THAT(errorOf({"f", "--format", "xml"}), HasSubstr("csv or jsonl"));
    EXPECT_THAT(errorOf({"f", "--list", "--format", "csv"}), HasSubstr("--list"));
    EXPECT_THAT(errorOf({"f", "--technology", "gprs"}), HasSubstr("lte, umts, utran"));
    EXPECT_THAT(errorOf({"f", "--ui", "json"}), HasSubstr("--ui"));
    for (const char* period : {"0", "-1", "soon", "1e9", "nan"})
        EXPECT_THAT(errorOf({"f", "--every", period}), HasSubstr("--every")) << period;
}

TEST(ExportOptionsTest, TheCommandIsTheFirstWordOfTheLine)
{
    const std::vector<std::string> arguments = {"--log", "none", "export", "f"};
    EXPECT_THAT(parseAppOptions(arguments, {}).error.value_or(""), HasSubstr("the first word"));
}

} // namespace
} // namespace orvane
