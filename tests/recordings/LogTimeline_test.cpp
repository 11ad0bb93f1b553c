#include "recordings/LogTimeline.h"

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
using testing::IsEmpty;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

class LogTimelineTest : public ::testing::Test
{
protected:
    LogTimelineTest() { services.useShippedResources(); }

    static void readAll(LogTimeline& timeline)
    {
        while (timeline.readSlice()) {
        }
    }
    static std::string channel(const LogTimeline& timeline)
    {
        return timeline.display()["Serving Cell Measurements"]["E-ARFCN"].description();
    }
    static std::string cell(const LogTimeline& timeline)
    {
        return timeline.display()["Serving Cell Info"]["Cell Identity"].description();
    }

    TestServices services;
};

// Forwards, backwards and to and fro: a jump shows what playing to that time shows.
TEST_F(LogTimelineTest, EveryMoveIsExact)
{
    for (const RecordedDrive& drive : kDrives) {
        const LiveView& live = liveViewOf(drive);
        LogTimeline timeline(recordedLog(drive.file), drive.technology);
        readAll(timeline);
        ASSERT_EQ(timeline.duration(), live.duration());
        EXPECT_EQ(timeline.position(), timeline.duration());
        EXPECT_EQ(timeline.display().description(), live.moments.back().display);

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
            timeline.moveTo(time);
            ASSERT_EQ(timeline.position(), std::clamp(time, LogTime(0), live.duration()));
            ASSERT_EQ(timeline.display().description(), live.at(time))
                << drive.file << " at " << time.count();
        }
    }
}

TEST_F(LogTimelineTest, TheStartShowsTheFirstMomentAndTheEndTheLast)
{
    LogTimeline timeline(LogBuilder()
                             .measurement(0, 1)
                             .measurement(kLogStart, 2)
                             .measurement(kLogStart, 3)
                             .measurement(kLogStart + kLogStep, 4)
                             .measurement(kLogStart + kLogSecond, 5)
                             .measurement(kLogStart + kLogSecond, 6)
                             .source(),
                         kLte);
    readAll(timeline);
    timeline.moveTo(0s);
    EXPECT_EQ(channel(timeline), "3");
    timeline.moveTo(1250us);
    EXPECT_EQ(channel(timeline), "3");
    timeline.moveTo(1251us);
    EXPECT_EQ(channel(timeline), "4");
    timeline.moveTo(1s - 1ns);
    EXPECT_EQ(channel(timeline), "4");
    timeline.moveTo(1s);
    EXPECT_EQ(channel(timeline), "6");
    timeline.moveTo(-5s);
    EXPECT_EQ(timeline.position(), 0s);
    EXPECT_EQ(channel(timeline), "3");
    timeline.moveTo(100h);
    EXPECT_EQ(timeline.position(), 1s);
}

TEST_F(LogTimelineTest, ALogOfOneMomentIsAlwaysWhole)
{
    LogTimeline timeline(LogBuilder().measurement(0, 1).measurement(0, 2).source(), kLte);
    readAll(timeline);
    EXPECT_EQ(timeline.duration(), 0s);
    timeline.moveTo(0s);
    EXPECT_EQ(channel(timeline), "2");
}

TEST_F(LogTimelineTest, ALogWithoutItemsShowsNothing)
{
    LogTimeline timeline(sourceOf({}), kLte);
    EXPECT_FALSE(timeline.isRead());
    readAll(timeline);
    EXPECT_TRUE(timeline.isRead());
    timeline.moveTo(1s);
    timeline.moveToNextServingCell();
    EXPECT_FALSE(timeline.display());
    EXPECT_EQ(timeline.duration(), 0s);
}

TEST_F(LogTimelineTest, EachServingCellIsReachedInTurn)
{
    LogTimeline timeline(recordedLog("lte-drive.dlf"), kLte);
    readAll(timeline);
    const LiveView live(recordedFile("lte-drive.dlf"), kLte);
    timeline.moveTo(0s);
    std::string last = cell(timeline);
    timeline.moveToNextServingCell();
    int cells = 0;
    while (timeline.position() < timeline.duration()) {
        ++cells;
        EXPECT_NE(cell(timeline), last);
        last = cell(timeline);
        EXPECT_EQ(timeline.display().description(), live.at(timeline.position()));
        const LogTime reached = timeline.position();
        timeline.moveTo(reached - 1250us);
        EXPECT_NE(cell(timeline), last) << "not the moment of the change";
        timeline.moveTo(reached);
        timeline.moveToNextServingCell();
    }
    EXPECT_EQ(cells, 23);
    EXPECT_EQ(cell(timeline), last);
}

TEST_F(LogTimelineTest, AServingCellOneStepBeforeTheEndIsTheEnd)
{
    LogTimeline timeline(LogBuilder()
                             .servingCell(kLogStart, 1)
                             .servingCell(kLogStart + kLogSecond, 2)
                             .measurement(kLogStart + kLogSecond + kLogStep, 7)
                             .source(),
                         kLte);
    readAll(timeline);
    timeline.moveTo(0s);
    timeline.moveToNextServingCell();
    EXPECT_EQ(timeline.position(), timeline.duration());
    EXPECT_EQ(channel(timeline), "7");
}

TEST_F(LogTimelineTest, MovesAreExactAroundImpossibleTimes)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i < 2000; ++i)
        builder.measurement(i % 100 == 7 ? std::uint64_t{0x7FFF} << 48 : kLogStart + i * kLogSecond,
                            i);
    LogTimeline timeline(builder.source(), kLte);
    readAll(timeline);
    EXPECT_EQ(timeline.duration(), 1999s);
    EXPECT_EQ(timeline.remark(), "20 items with impossible times");
    for (const int i : {1999, 1106, 7, 1207, 6, 507, 1999, 1, 900}) {
        timeline.moveTo(std::chrono::seconds(i) + 1ns);
        // The item of an impossible time belongs to the one before.
        const bool isFollowedByOne = i % 100 == 6;
        EXPECT_EQ(channel(timeline), std::to_string(isFollowedByOne ? i + 1 : i)) << i;
    }
}

TEST_F(LogTimelineTest, WithoutAnotherServingCellTheNextOneIsTheEnd)
{
    LogTimeline timeline(LogBuilder()
                             .servingCell(kLogStart, 1)
                             .servingCell(kLogStart + kLogSecond, 1)
                             .measurement(kLogStart + 5 * kLogSecond, 7)
                             .source(),
                         kLte);
    readAll(timeline);
    timeline.moveTo(0s);
    timeline.moveToNextServingCell();
    EXPECT_EQ(timeline.position(), 5s);
    EXPECT_EQ(channel(timeline), "7");
}

TEST_F(LogTimelineTest, WhatWasReadWhenReadingStopsIsTheLog)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i < 3000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    LogTimeline timeline(builder.source(), kLte);
    EXPECT_EQ(timeline.progress(), 0);
    EXPECT_TRUE(timeline.readSlice());
    EXPECT_NEAR(timeline.progress(), 1.0 / 3, 0.01);
    timeline.stopReading();
    EXPECT_EQ(timeline.progress(), 1);
    EXPECT_FALSE(timeline.readSlice());
    EXPECT_EQ(timeline.duration(), 999s);
    timeline.moveTo(500s + 1ns);
    EXPECT_EQ(channel(timeline), "500");
    timeline.moveTo(99999s);
    EXPECT_EQ(channel(timeline), "999");
}

TEST_F(LogTimelineTest, WhatIsWrongWithALogIsToldOnce)
{
    LogTimeline timeline(recordedLog("lte-drive.dlf"), kLte);
    readAll(timeline);
    EXPECT_EQ(services.log.errors().size(), 24U);
    timeline.moveTo(0s);
    timeline.moveTo(200s);
    timeline.moveToNextServingCell();
    EXPECT_EQ(services.log.lines.size(), 24U);
}

TEST_F(LogTimelineTest, BytesWithoutAPlaceAreTold)
{
    LogTimeline whole(recordedLog("lte-drive.dlf"), kLte);
    readAll(whole);
    EXPECT_THAT(whole.remark(), IsEmpty());
    LogTimeline damaged(recordedLog("lte-drive-damaged.dlf"), kLte);
    EXPECT_THAT(damaged.remark(), IsEmpty());
    readAll(damaged);
    EXPECT_EQ(damaged.remark(),
              "198 bytes could not be placed: 67 at byte 35165, 131 at byte 70228");
    damaged.moveTo(0s);
    EXPECT_THAT(damaged.remark(), testing::StartsWith("198 bytes"));
}

TEST_F(LogTimelineTest, AFileThatIsCutOffMeanwhileShowsWhatIsLeft)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/a.dlf";
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 30'000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, static_cast<std::uint16_t>(i % 1000));
    ASSERT_TRUE(writeFile(path, builder.bytes));
    std::string error;
    LogTimeline timeline(FileWindow::open(path, error), kLte);
    readAll(timeline);
    EXPECT_EQ(timeline.duration(), 29'999s);
    std::filesystem::resize_file(path, 76 * 100);
    timeline.moveTo(50s + 1ns);
    EXPECT_EQ(channel(timeline), "50");
    for (LogTime time = 0s; time < timeline.duration(); time += 111s)
        timeline.moveTo(time); // to where there is nothing any more
    timeline.moveToNextServingCell();
    EXPECT_THAT(timeline.remark(), testing::HasSubstr("bytes could not be read: the file ends at"));
}

} // namespace
} // namespace orvane
