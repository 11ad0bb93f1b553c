#include "recordings/SeekableLog.h"

#include "platform/base/TelephonyConstants.h"

#include "dlf/FileWindow.h"
#include "recordings/support/LiveView.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <random>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::HasSubstr;
using testing::IsEmpty;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

class SeekableLogTest : public ::testing::Test
{
protected:
    SeekableLogTest() { services.useShippedResources(); }

    static void readAll(SeekableLog& log)
    {
        while (log.readSlice()) {
        }
    }
    static std::string channel(const SeekableLog& log)
    {
        return log.display()["Serving Cell Measurements"]["E-ARFCN"].description();
    }
    static std::string cell(const SeekableLog& log)
    {
        return log.display()["Serving Cell Info"]["Cell Identity"].description();
    }

    static std::shared_ptr<ByteSource> longLog()
    {
        LogBuilder builder;
        for (std::uint16_t i = 0; i < 5000; ++i)
            builder.measurement(kLogStart + i * kLogSecond, i);
        return builder.source();
    }

    TestServices services;
};

// Forwards, backwards and to and fro: a jump shows what playing to that time shows.
TEST_F(SeekableLogTest, EveryMoveIsExact)
{
    for (const RecordedDrive& drive : kDrives) {
        const LiveView& live = liveViewOf(drive);
        SeekableLog log(recordedLog(drive.file), drive.file, drive.technology);
        readAll(log);
        ASSERT_EQ(log.duration(), live.duration());
        EXPECT_EQ(log.position(), log.duration());
        EXPECT_EQ(log.display().description(), live.moments.back().display);

        std::vector<LogTime> times;
        for (LogTime time = 0ns; time < live.duration() + 2s; time += 2s)
            times.push_back(time);
        std::vector<LogTime> all = times;
        all.insert(all.end(), times.rbegin(), times.rend());
        std::mt19937_64 random(1);
        std::uniform_int_distribution<LogTime::rep> anywhere(0, live.duration().count());
        for (int i = 0; i < 100; ++i)
            all.emplace_back(anywhere(random));
        // Just before, at and just after items.
        for (std::size_t i = 0; i < live.moments.size(); i += 97)
            for (const LogTime offset : {LogTime(-1), LogTime(0), LogTime(1)})
                all.push_back(live.moments[i].time + offset);
        for (const LogTime time : all) {
            log.moveTo(time);
            ASSERT_EQ(log.position(), std::clamp(time, LogTime(0), live.duration()));
            ASSERT_EQ(log.display().description(), live.at(time))
                << drive.file << " at " << time.count();
        }
    }
}

TEST_F(SeekableLogTest, TheStartShowsTheFirstMomentAndTheEndTheLast)
{
    SeekableLog log(LogBuilder()
                        .measurement(0, 1)
                        .measurement(kLogStart, 2)
                        .measurement(kLogStart, 3)
                        .measurement(kLogStart + kLogStep, 4)
                        .measurement(kLogStart + kLogSecond, 5)
                        .measurement(kLogStart + kLogSecond, 6)
                        .source(),
                    "a.dlf", kLte);
    readAll(log);
    log.moveTo(0s);
    EXPECT_EQ(channel(log), "3");
    log.moveTo(1250us);
    EXPECT_EQ(channel(log), "3");
    log.moveTo(1251us);
    EXPECT_EQ(channel(log), "4");
    log.moveTo(1s - 1ns);
    EXPECT_EQ(channel(log), "4");
    log.moveTo(1s);
    EXPECT_EQ(channel(log), "6");
    log.moveTo(-5s);
    EXPECT_EQ(log.position(), 0s);
    EXPECT_EQ(channel(log), "3");
    log.moveTo(100h);
    EXPECT_EQ(log.position(), 1s);
}

TEST_F(SeekableLogTest, ALogOfOneMomentIsAlwaysWhole)
{
    SeekableLog log(LogBuilder().measurement(0, 1).measurement(0, 2).source(), "a.dlf", kLte);
    readAll(log);
    EXPECT_EQ(log.duration(), 0s);
    log.moveTo(0s);
    EXPECT_EQ(channel(log), "2");
}

TEST_F(SeekableLogTest, ALogWithoutItemsShowsNothing)
{
    SeekableLog log(sourceOf({}), "a.dlf", kLte);
    EXPECT_FALSE(log.isRead());
    readAll(log);
    EXPECT_TRUE(log.isRead());
    log.moveTo(1s);
    log.moveToNextServingCell();
    EXPECT_FALSE(log.display());
    EXPECT_EQ(log.duration(), 0s);
}

TEST_F(SeekableLogTest, EachServingCellIsReachedInTurn)
{
    SeekableLog log(recordedLog("lte-drive.dlf"), "a.dlf", kLte);
    readAll(log);
    const LiveView live(recordedFile("lte-drive.dlf"), kLte);
    log.moveTo(0s);
    std::string last = cell(log);
    log.moveToNextServingCell();
    int cells = 0;
    while (log.position() < log.duration()) {
        ++cells;
        EXPECT_NE(cell(log), last);
        last = cell(log);
        EXPECT_EQ(log.display().description(), live.at(log.position()));
        const LogTime reached = log.position();
        log.moveTo(reached - 1250us);
        EXPECT_NE(cell(log), last) << "not the moment of the change";
        log.moveTo(reached);
        log.moveToNextServingCell();
    }
    EXPECT_EQ(cells, 23);
    EXPECT_EQ(cell(log), last);
}

TEST_F(SeekableLogTest, AServingCellOneStepBeforeTheEndIsTheEnd)
{
    SeekableLog log(LogBuilder()
                        .servingCell(kLogStart, 1)
                        .servingCell(kLogStart + kLogSecond, 2)
                        .measurement(kLogStart + kLogSecond + kLogStep, 7)
                        .source(),
                    "a.dlf", kLte);
    readAll(log);
    log.moveTo(0s);
    log.moveToNextServingCell();
    EXPECT_EQ(log.position(), log.duration());
    EXPECT_EQ(channel(log), "7");
}

TEST_F(SeekableLogTest, MovesAreExactAroundImpossibleTimes)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i < 2000; ++i)
        builder.measurement(i % 100 == 7 ? std::uint64_t{0x7FFF} << 48 : kLogStart + i * kLogSecond,
                            i);
    SeekableLog log(builder.source(), "a.dlf", kLte);
    readAll(log);
    EXPECT_EQ(log.duration(), 1999s);
    EXPECT_EQ(log.remark(), "20 items with impossible times");
    for (const int i : {1999, 1106, 7, 1207, 6, 507, 1999, 1, 900}) {
        log.moveTo(std::chrono::seconds(i) + 1ns);
        // The item of an impossible time belongs to the one before.
        const bool isFollowedByOne = i % 100 == 6;
        EXPECT_EQ(channel(log), std::to_string(isFollowedByOne ? i + 1 : i)) << i;
    }
}

TEST_F(SeekableLogTest, WithoutAnotherServingCellTheNextOneIsTheEnd)
{
    SeekableLog log(LogBuilder()
                        .servingCell(kLogStart, 1)
                        .servingCell(kLogStart + kLogSecond, 1)
                        .measurement(kLogStart + 5 * kLogSecond, 7)
                        .source(),
                    "a.dlf", kLte);
    readAll(log);
    log.moveTo(0s);
    log.moveToNextServingCell();
    EXPECT_EQ(log.position(), 5s);
    EXPECT_EQ(channel(log), "7");
}

TEST_F(SeekableLogTest, WhatWasReadWhenReadingStopsIsTheLog)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i < 3000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    SeekableLog log(builder.source(), "a.dlf", kLte);
    EXPECT_EQ(log.progress(), 0);
    EXPECT_TRUE(log.readSlice());
    EXPECT_NEAR(log.progress(), 1.0 / 3, 0.01);
    log.stopReading();
    EXPECT_EQ(log.progress(), 1);
    EXPECT_FALSE(log.readSlice());
    EXPECT_EQ(log.duration(), 999s);
    log.moveTo(500s + 1ns);
    EXPECT_EQ(channel(log), "500");
    log.moveTo(99999s);
    EXPECT_EQ(channel(log), "999");
}

TEST_F(SeekableLogTest, WhatIsWrongWithALogIsToldOnce)
{
    SeekableLog log(recordedLog("lte-drive.dlf"), "a.dlf", kLte);
    readAll(log);
    EXPECT_EQ(services.log.errors().size(), 24U);
    log.moveTo(0s);
    log.moveTo(200s);
    log.moveToNextServingCell();
    EXPECT_EQ(services.log.lines.size(), 24U);
}

TEST_F(SeekableLogTest, BytesWithoutAPlaceAreTold)
{
    SeekableLog whole(recordedLog("lte-drive.dlf"), "a.dlf", kLte);
    readAll(whole);
    EXPECT_THAT(whole.remark(), IsEmpty());
    SeekableLog damaged(recordedLog("lte-drive-damaged.dlf"), "a.dlf", kLte);
    EXPECT_THAT(damaged.remark(), IsEmpty());
    readAll(damaged);
    EXPECT_EQ(damaged.remark(),
              "198 bytes could not be placed: 67 at byte 35165, 131 at byte 70228");
    damaged.moveTo(0s);
    EXPECT_THAT(damaged.remark(), testing::StartsWith("198 bytes"));
}

TEST_F(SeekableLogTest, AFileThatIsCutOffMeanwhileShowsWhatIsLeft)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/a.dlf";
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 30'000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, static_cast<std::uint16_t>(i % 1000));
    ASSERT_TRUE(writeFile(path, builder.bytes));
    std::string error;
    SeekableLog log(FileWindow::open(path, error), "a.dlf", kLte);
    readAll(log);
    EXPECT_EQ(log.duration(), 29'999s);
    std::filesystem::resize_file(path, 76 * 100);
    log.moveTo(50s + 1ns);
    EXPECT_EQ(channel(log), "50");
    for (LogTime time = 0s; time < log.duration(); time += 111s)
        log.moveTo(time); // to where there is nothing any more
    log.moveToNextServingCell();
    EXPECT_THAT(log.remark(), testing::HasSubstr("bytes could not be read: the file ends at"));
}

TEST_F(SeekableLogTest, TheTechnologyIsSoughtAndThenTheLogRead)
{
    SeekableLog log(longLog(), "a.dlf", {});
    double progress = 0;
    while (log.readSlice()) {
        EXPECT_GE(log.progress(), progress);
        progress = log.progress();
    }
    EXPECT_GT(progress, 0.5);
    EXPECT_EQ(log.progress(), 1);
    ASSERT_TRUE(log.isRead());
    EXPECT_EQ(log.duration(), 4999s);
}

TEST_F(SeekableLogTest, AGivenTechnologyIsNotSought)
{
    SeekableLog log(longLog(), "a.dlf", kLte);
    EXPECT_TRUE(log.readSlice());
    EXPECT_EQ(channel(log), "999"); // the first slice is decoded
}

TEST_F(SeekableLogTest, IfTheSearchIsStoppedTheLogEndsThere)
{
    SeekableLog log(longLog(), "a.dlf", {});
    EXPECT_TRUE(log.readSlice());
    EXPECT_TRUE(log.readSlice());
    log.stopReading();
    EXPECT_FALSE(log.isRead());
    double progress = 0;
    while (log.readSlice())
        progress = log.progress();
    ASSERT_TRUE(log.isRead());
    EXPECT_GT(log.duration(), 1900s);
    EXPECT_LT(log.duration(), 2100s);
    EXPECT_GT(progress, 0.4) << "of the part that is read";
}

TEST_F(SeekableLogTest, ForeignBytesFail)
{
    SeekableLog log(sourceOf(Bytes(5000, 0xED)), "x.jpg", {});
    readAll(log);
    EXPECT_FALSE(log.isRead());
    EXPECT_THAT(log.failure().value_or(""), HasSubstr("\"x.jpg\" is neither"));
}

TEST_F(SeekableLogTest, BeforeItIsReadNothingIsShownAndNothingMoves)
{
    SeekableLog log(longLog(), "a.dlf", {});
    log.moveTo(5s);
    log.moveToNextServingCell();
    EXPECT_EQ(log.position(), 0s);
    EXPECT_EQ(log.duration(), 0s);
    EXPECT_FALSE(log.display());
    EXPECT_EQ(log.remark(), "");
}

} // namespace
} // namespace orvane
