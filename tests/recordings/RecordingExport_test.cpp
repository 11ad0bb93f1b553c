#include "recordings/RecordingExport.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "platform/plist/PropertyList.h"
#include "platform/services/FileSystem.h"
#include "recordings/CsvRowWriter.h"
#include "recordings/JsonRowWriter.h"
#include "recordings/support/LogFiles.h"
#include "support/Paths.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using ::testing::AllOf;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Le;
using ::testing::StartsWith;

constexpr const char* kChannel = "/Serving Cell Measurements/E-ARFCN";

class RecordingExportTest : public ::testing::Test
{
protected:
    RecordingExportTest() { services.useShippedResources(); }

    void write(const Bytes& content) { ASSERT_TRUE(writeFile(request.file, content)); }
    // The error, or "".
    std::string run(RowWriter& writer)
    {
        RecordingExport recordingExport(request, writer,
                                        [this](double done) { progress.push_back(done); });
        const auto problem = recordingExport.run();
        remarks = recordingExport.remarks();
        return problem.value_or("");
    }
    std::string runCsv()
    {
        written.clear();
        CsvRowWriter csv(output());
        return run(csv);
    }
    std::string runJson()
    {
        written.clear();
        JsonRowWriter json(output());
        return run(json);
    }
    RowWriter::Output output()
    {
        return [this](std::string_view lines) {
            written += lines;
            return --linesWanted > 0;
        };
    }

    TestServices services;
    TemporaryDirectory directory;
    ExportRequest request{directory.path() + "/drive.dlf", std::nullopt, 2s, {}};
    std::string written;
    int linesWanted = 1'000'000;
    std::vector<double> progress;
    std::vector<std::string> remarks;
};

TEST_F(RecordingExportTest, ALogGivesALineForEachPeriodThatHasItems)
{
    write(LogBuilder()
              .measurement(kLogStart, 100)
              .measurement(kLogStart + kLogSecond, 101)
              .measurement(kLogStart + 2 * kLogSecond, 102)
              .measurement(kLogStart + 2 * kLogSecond + 3 * kLogStep, 103)
              .measurement(kLogStart + 9 * kLogSecond, 104)
              .bytes);
    request.paths = {kChannel};
    EXPECT_EQ(runCsv(), "");
    EXPECT_EQ(written, "time,/Serving Cell Measurements/E-ARFCN\n"
                       "2017-07-11T04:34:09.000Z,101\n"
                       "2017-07-11T04:34:10.003Z,103\n"
                       "2017-07-11T04:34:17.000Z,104\n");
}

TEST_F(RecordingExportTest, ThePeriodCanBeChosen)
{
    write(LogBuilder()
              .measurement(kLogStart, 100)
              .measurement(kLogStart + kLogSecond, 101)
              .measurement(kLogStart + 2 * kLogSecond, 102)
              .bytes);
    request.paths = {kChannel};
    request.period = 10s;
    EXPECT_EQ(runCsv(), "");
    EXPECT_THAT(written, HasSubstr("N\n2017-07-11T04:34:10.000Z,102\n"));
    request.period = 1s;
    EXPECT_EQ(runCsv(), "");
    EXPECT_EQ(std::count(written.begin(), written.end(), '\n'), 4);
}

TEST_F(RecordingExportTest, WithoutPathsEveryRowIsInEachLine)
{
    write(LogBuilder().measurement(kLogStart, 100).servingCell(kLogStart, 9).bytes);
    EXPECT_EQ(runJson(), "");
    EXPECT_THAT(written,
                StartsWith("{\"time\":\"2017-07-11T04:34:08.000Z\",\"/Serving Cell Info/"));
    EXPECT_THAT(written, AllOf(HasSubstr("\"/Serving Cell Info/Cell Identity\":\"9\""),
                               HasSubstr("\"/Serving Cell Measurements/E-ARFCN\":\"100\"")));
}

TEST_F(RecordingExportTest, UnitsAndPatternsOfAWholeDrive)
{
    request.file = testDataPath("lte-drive.dlf");
    request.paths = {"/Serving Cell Measurements/Measured RSRP",
                     "/Neighbor Cells List/*/Physical Cell ID"};
    EXPECT_EQ(runCsv(), "");
    EXPECT_THAT(written, StartsWith("time,/Serving Cell Measurements/Measured RSRP [dBm],"
                                    "/Neighbor Cells List/0/Physical Cell ID,"
                                    "/Neighbor Cells List/1/Physical Cell ID"));
    EXPECT_THAT(remarks, IsEmpty());
}

TEST_F(RecordingExportTest, ADamagedDriveSaysHowManyBytesCouldNotBePlaced)
{
    request.file = testDataPath("lte-drive-damaged.dlf");
    request.paths = {kChannel};
    EXPECT_EQ(runCsv(), "");
    EXPECT_THAT(remarks, ElementsAre(HasSubstr("198 bytes could not be placed")));
}

TEST_F(RecordingExportTest, TheTechnologyIsFoundOrAsAsked)
{
    request.file = testDataPath("utran-walk.dlf");
    EXPECT_EQ(runJson(), "");
    EXPECT_THAT(written, HasSubstr("\"/RRC Info/State\":"));
    request.technology = kTSLogChannelTechnology_Varnel_LTE;
    EXPECT_EQ(runJson(), "");
    EXPECT_THAT(written, ::testing::Not(HasSubstr("\"/RRC Info/State\":")));
}

TEST_F(RecordingExportTest, FilesThatAreNoRecordingAreRefused)
{
    EXPECT_THAT(runJson(), AllOf(HasSubstr("drive.dlf"), HasSubstr("No such file")));
    write(Bytes(1000, 'x'));
    EXPECT_THAT(runJson(), HasSubstr("--technology"));
    write(Bytes());
    EXPECT_THAT(runJson(), HasSubstr("drive.dlf"));
    EXPECT_EQ(written, "");
}

TEST_F(RecordingExportTest, PathsThatDoNotOccurAreTold)
{
    write(LogBuilder().measurement(kLogStart, 100).bytes);
    request.paths = {"/Nowhere", kChannel, "/Nor/*/here"};
    EXPECT_EQ(runCsv(), "");
    EXPECT_THAT(written, StartsWith("time,/Nowhere,/Serving Cell Measurements/E-ARFCN\n2017"));
    EXPECT_THAT(remarks, ElementsAre(HasSubstr("has the path \"/Nowhere\""),
                                     HasSubstr("has the path \"/Nor/*/here\"")));
}

TEST_F(RecordingExportTest, WhereNoneOfThePathsOccursItFails)
{
    write(LogBuilder().measurement(kLogStart, 100).bytes);
    request.paths = {"/Nowhere", "/Nor/*/here"};
    EXPECT_THAT(runCsv(), AllOf(HasSubstr("/Nowhere"), HasSubstr("--list")));
    EXPECT_EQ(written, "");
}

TEST_F(RecordingExportTest, ARecordingWithoutAnyRowSaysWhatItWasReadAs)
{
    request.file = testDataPath("cdma-evening.dlf");
    request.technology = kTSLogChannelTechnology_Varnel_LTE;
    EXPECT_EQ(runCsv(), "");
    EXPECT_THAT(remarks, ElementsAre(HasSubstr(
                             "cdma-evening.dlf: no row occurs in it as a log of \"lte\"")));
}

TEST_F(RecordingExportTest, LookingForTheTechnologyTellsItsProgress)
{
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 5000; ++i)
        builder.measurement(kLogStart + i * kLogStep, 1);
    write(builder.bytes);
    EXPECT_EQ(runJson(), "");
    ASSERT_GT(progress.size(), 2U);
    EXPECT_GT(progress[0], 0);
    EXPECT_GT(progress[1], progress[0]);
    EXPECT_LT(progress[1], 0.05);
}

TEST_F(RecordingExportTest, AnImpossibleTimeIsToldAndLeavesThePeriodsAsTheyAre)
{
    const Bytes drive = recordedFile("lte-drive.dlf");
    request.file = testDataPath("lte-drive.dlf");
    runJson();
    const auto lines = std::count(written.begin(), written.end(), '\n');
    request.file = directory.path() + "/wild.dlf";
    for (const int wild : {1, 5, 100}) {
        DlfReader reader(drive);
        std::optional<DlfItem> item;
        for (int timed = 0; timed < wild;)
            if (item = reader.next(); item->timestamp != 0)
                ++timed;
        Bytes changed = drive;
        changed[item->position + 10] = 0;
        changed[item->position + 11] = 0x7F;
        write(changed);
        EXPECT_EQ(runJson(), "");
        EXPECT_LE(std::abs(std::count(written.begin(), written.end(), '\n') - lines), 1) << wild;
        EXPECT_THAT(remarks, ElementsAre(HasSubstr("wild.dlf: 1 item with an impossible time")));
    }
}

TEST_F(RecordingExportTest, StopsOnceNobodyReads)
{
    request.file = testDataPath("lte-drive.dlf");
    linesWanted = 3;
    EXPECT_EQ(runJson(), "");
    EXPECT_EQ(std::count(written.begin(), written.end(), '\n'), 3);
    EXPECT_LT(progress.size(), 20U) << "the rest is not read";
}

TEST_F(RecordingExportTest, AMissingTemplateIsAFailureAndGivesNoLines)
{
    DirectoryResources none(directory.path());
    Services::current().setResources(&none);
    request.file = testDataPath("lte-drive.dlf");
    EXPECT_EQ(runJson(),
              "the display template of \"lte\" is missing or damaged: install orvane again");
    EXPECT_EQ(written, "");
    EXPECT_EQ(runCsv(),
              "the display template of \"lte\" is missing or damaged: install orvane again");
    EXPECT_EQ(written, "");
}

TEST_F(RecordingExportTest, TellsItsProgress)
{
    request.file = testDataPath("lte-drive.dlf");
    EXPECT_EQ(runCsv(), "");
    ASSERT_GT(progress.size(), 10U);
    EXPECT_TRUE(std::is_sorted(progress.begin(), progress.end()));
    EXPECT_LT(progress.front(), 0.1);
    EXPECT_EQ(progress.back(), 1.0);
}

TEST_F(RecordingExportTest, ASnapshotGivesALineForEachEntryThatShowsSomething)
{
    const PropertyValue first = PropertyValue::dictionaryOf({
        {"Cell", "1"}
    });
    const PropertyValue second = PropertyValue::dictionaryOf({
        {"Cell", "2"}
    });
    const PropertyValue third = PropertyValue::dictionaryOf({
        {"Cell", "3"}
    });
    const PropertyValue log = PropertyValue::data(LogBuilder().measurement(kLogStart, 9).bytes);
    const auto snapshot = writeXmlPropertyList(PropertyValue::dictionaryOf({
        {"Timestamp",   "2026-11-21 10:00:09 +0000"},
        {"Description", "at the mill"              },
        {"Data",        PropertyValue::arrayOf({
                     PropertyValue::dictionaryOf(
                         {{"Display", first}, {"Date", "2026-11-21 10:00:05 +0000"}}),
                     PropertyValue::dictionaryOf(
                         {{"Display", second}, {"Date", "2026-11-21 10:00:07 +0000"}}),
                     PropertyValue::dictionaryOf({{"Display", third}, {"Date", "yesterday"}}),
                     PropertyValue::dictionaryOf({{"Description", "DLF"}, {"DLF", log}}),
                 })                }
    }));
    ASSERT_TRUE(snapshot);
    write(Bytes(snapshot->begin(), snapshot->end()));
    EXPECT_EQ(runJson(), "");
    EXPECT_EQ(written, "{\"time\":\"2026-11-21T10:00:05.000Z\",\"/Cell\":\"1\"}\n"
                       "{\"time\":\"2026-11-21T10:00:07.000Z\",\"/Cell\":\"2\"}\n"
                       "{\"/Cell\":\"3\"}\n");
}

// The lines without the last `count` of them.
std::string_view without(std::string_view lines, int count)
{
    for (; count > 0 && !lines.empty(); --count) {
        lines.remove_suffix(1);
        lines = lines.substr(0, lines.rfind('\n') + 1);
    }
    return lines;
}

TEST_F(RecordingExportTest, EveryTruncationOfALogGivesTheLinesThatItHolds)
{
    const Bytes drive = recordedFile("lte-drive.dlf");
    const Bytes start(drive.begin(), drive.begin() + 600);
    request.technology = kTSLogChannelTechnology_Varnel_LTE;
    request.period = 1ms;
    write(start);
    EXPECT_EQ(runJson(), "");
    const std::string whole = written;
    std::ptrdiff_t most = 0;
    for (std::size_t length = 0; length < start.size(); ++length) {
        write(Bytes(start.begin(), start.begin() + static_cast<std::ptrdiff_t>(length)));
        EXPECT_EQ(runJson(), "");
        // The last period may lack items, and the rest of an item that was cut off may look like a
        // shorter item.
        EXPECT_TRUE(whole.starts_with(without(written, 2))) << length;
        most = std::max(most, std::count(written.begin(), written.end(), '\n'));
    }
    EXPECT_GT(most, 3);
}

} // namespace
} // namespace orvane
