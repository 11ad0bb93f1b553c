#include "recordings/LogSurvey.h"

#include "platform/base/TelephonyConstants.h"

#include "dlf/VersionReport.h"
#include "recordings/support/LogFiles.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

#include <random>

namespace orvane
{
namespace
{

using testing::HasSubstr;

Bytes versionReport()
{
    Bytes report(kDlfVersionReportBytes);
    EXPECT_TRUE(writeVersionReport(report));
    return report;
}

class LogSurveyTest : public ::testing::Test
{
protected:
    LogSurveyTest() { services.useShippedResources(); }

    static LogSurvey read(std::shared_ptr<ByteSource> log)
    {
        LogSurvey survey(std::move(log));
        while (survey.takeSlice()) {
        }
        return survey;
    }

    TestServices services;
};

TEST_F(LogSurveyTest, EveryRecordingTellsItsTechnology)
{
    for (const RecordedDrive& drive : kDrives)
        EXPECT_EQ(read(recordedLog(drive.file)).technology(), drive.technology) << drive.file;
}

TEST_F(LogSurveyTest, ALogIsReadInSlices)
{
    LogSurvey survey(recordedLog("umts-city.dlf"));
    EXPECT_EQ(survey.progress(), 0);
    int slices = 0;
    double progress = 0;
    while (survey.takeSlice()) {
        EXPECT_GT(survey.progress(), progress);
        progress = survey.progress();
        ++slices;
    }
    EXPECT_EQ(survey.progress(), 1);
    EXPECT_GE(slices, 2);
    EXPECT_FALSE(survey.takeSlice());
}

TEST_F(LogSurveyTest, FilesOfForeignBytesAreNoLogs)
{
    // By chance some of these bytes look like an item of LTE.
    LogBuilder builder;
    builder.foreign(50);
    builder.bytes.insert(builder.bytes.end(), 5000, 0x20);
    builder.servingCell(kLogStart, 1);
    builder.servingCell(kLogStart, 1);
    const LogSurvey survey = read(builder.source());
    EXPECT_FALSE(survey.technology());
    EXPECT_EQ(survey.complaint("x.jpg"),
              "\"x.jpg\" is neither a diagnostic log (.dlf) nor a snapshot (.orvane): name another "
              "file or, for a badly damaged log, its technology with --technology, one of lte, "
              "umts, utran, cdma, cellmonitor");
    EXPECT_FALSE(read(sourceOf({})).technology());
}

// Nearly all of it can be read as items: any two bytes are a possible length.
TEST_F(LogSurveyTest, RandomBytesAreNoLogs)
{
    std::mt19937 random(1);
    for (const std::size_t size : {100U, 1000U, 10'000U, 300'000U}) {
        Bytes bytes(size);
        for (std::uint8_t& byte : bytes)
            byte = static_cast<std::uint8_t>(random());
        const LogSurvey survey = read(sourceOf(bytes));
        EXPECT_FALSE(survey.technology()) << size;
        EXPECT_THAT(survey.complaint("x"), HasSubstr("is neither a diagnostic log")) << size;
    }
}

TEST_F(LogSurveyTest, TextsAndProgramsAreNoLogs)
{
    std::string text;
    for (int line = 0; line < 5000; ++line)
        text += "Line " + std::to_string(line) + " of a text that is no log at all.\n";
    const LogSurvey survey = read(sourceOf(Bytes(text.begin(), text.end())));
    EXPECT_FALSE(survey.technology());
    EXPECT_THAT(survey.complaint("x.txt"), HasSubstr("is neither a diagnostic log"));

    // Not this program: what it holds depends on the compiler and the linker.
    for (const char* const path : {"/bin/sh", "/bin/bash", "/bin/tar", "/bin/grep"}) {
        Bytes start = readFile(path).value_or(Bytes());
        ASSERT_GT(start.size(), 100'000U) << path;
        start.resize(std::min<std::size_t>(start.size(), 500'000));
        const LogSurvey program = read(sourceOf(start));
        EXPECT_FALSE(program.technology()) << path;
        EXPECT_THAT(program.complaint("x"), HasSubstr("is neither a diagnostic log")) << path;
    }

    // Like a program's tables: addresses and small numbers.
    Bytes table;
    for (std::uint64_t row = 0; row < 30'000; ++row)
        for (const std::uint64_t number : {0x401000 + row * 24, row % 97})
            for (int shift = 0; shift < 64; shift += 8)
                table.push_back(static_cast<std::uint8_t>(number >> shift));
    const LogSurvey numbers = read(sourceOf(table));
    EXPECT_FALSE(numbers.technology());
    EXPECT_THAT(numbers.complaint("x"), HasSubstr("is neither a diagnostic log"));
}

TEST_F(LogSurveyTest, ALogMayHaveNoTimestampsAndSomeThatAreWild)
{
    LogBuilder untimed;
    for (int i = 0; i < 5; ++i)
        untimed.servingCell(0, 1);
    EXPECT_TRUE(read(untimed.source()).technology());

    LogBuilder wild;
    for (std::uint64_t i = 0; i < 10; ++i)
        wild.servingCell(i % 4 == 0 ? std::uint64_t{0x7FFF} << 48 : kLogStart + i * kLogSecond, 1);
    EXPECT_TRUE(read(wild.source()).technology());

    EXPECT_TRUE(read(LogBuilder().servingCell(kLogStart, 1).source()).technology());
}

TEST_F(LogSurveyTest, ALogOfNothingButItsReportIsEmpty)
{
    const LogSurvey survey = read(sourceOf(versionReport()));
    EXPECT_FALSE(survey.technology());
    EXPECT_EQ(survey.complaint("a.dlf"), "\"a.dlf\": the log is empty, nothing follows its version "
                                         "report: name another file");
}

TEST_F(LogSurveyTest, ADamagedLogThatBeginsWithAReportIsALog)
{
    LogBuilder builder;
    builder.bytes = versionReport();
    builder.servingCell(kLogStart, 1);
    builder.servingCell(kLogStart, 1);
    builder.servingCell(kLogStart, 1);
    builder.bytes.insert(builder.bytes.end(), 5000, 0x20);
    EXPECT_EQ(read(builder.source()).technology(), kTSLogChannelTechnology_Varnel_LTE);
}

TEST_F(LogSurveyTest, ALogOfUnknownCodesAsksForItsTechnology)
{
    LogBuilder builder;
    builder.bytes = versionReport();
    builder.item(0x1234, kLogStart, Bytes(10, 1));
    const LogSurvey survey = read(builder.source());
    EXPECT_FALSE(survey.technology());
    EXPECT_THAT(survey.complaint("a.dlf"), HasSubstr("name it with --technology"));
}

TEST_F(LogSurveyTest, TheFirstPlacesOfForeignBytesAreNamed)
{
    LogBuilder builder;
    for (int i = 0; i < 5; ++i) {
        for (int k = 0; k < 3; ++k)
            builder.measurement(kLogStart + static_cast<std::uint64_t>(i) * kLogSecond, 1);
        builder.foreign(10);
    }
    builder.measurement(kLogStart + 9 * kLogSecond, 1);
    DlfReader reader(builder.source());
    const std::uint64_t size = builder.bytes.size();
    EXPECT_EQ(remarkOn(reader, 0, size), "");
    while (reader.next()) {
    }
    EXPECT_EQ(remarkOn(reader, 0, size),
              "430 bytes could not be placed: 86 at byte 152, 86 at byte 390, 86 at byte 628 and "
              "at 2 more places");
    EXPECT_THAT(remarkOn(reader, 1, size), testing::EndsWith("; 1 item with an impossible time"));
    EXPECT_THAT(remarkOn(reader, 2, size), testing::EndsWith("; 2 items with impossible times"));
    EXPECT_THAT(remarkOn(reader, 0, size + 7),
                testing::EndsWith("; 7 bytes could not be read: the file ends at byte " +
                                  std::to_string(size)));
}

} // namespace
} // namespace orvane
