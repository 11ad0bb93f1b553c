#include "recordings/LogDecoder.h"

#include "platform/base/TelephonyConstants.h"

#include "recordings/support/LiveView.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

#include <set>
#include <stdexcept>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

class LogDecoderTest : public ::testing::Test
{
protected:
    LogDecoderTest() { services.useShippedResources(); }

    static void takeAll(LogDecoder& play)
    {
        while (!play.isAtEnd()) {
            play.lookAhead();
            play.takeNext();
        }
    }

    TestServices services;
};

TEST_F(LogDecoderTest, EveryItemShowsWhatALiveViewWouldShow)
{
    for (const RecordedDrive& drive : kDrives) {
        const LiveView& live = liveViewOf(drive);
        LogDecoder play(recordedLog(drive.file), drive.technology);
        play.lookAhead();
        for (const LiveView::Moment& moment : live.moments) {
            ASSERT_TRUE(play.hasNext());
            ASSERT_EQ(play.nextTime(), moment.time);
            play.takeNext();
            ASSERT_EQ(play.time(), moment.time);
            ASSERT_EQ(play.display().description(), moment.display) << drive.file;
        }
        EXPECT_TRUE(play.isAtEnd());
        EXPECT_EQ(play.itemsTaken(), live.moments.size());
    }
}

TEST_F(LogDecoderTest, TimeCountsFromTheFirstItemAndNeverGoesBack)
{
    const auto log = LogBuilder()
                         .measurement(0, 1) // no timestamp
                         .measurement(kLogStart, 2)
                         .measurement(kLogStart + 3 * kLogSecond, 3)
                         .measurement(kLogStart + kLogSecond, 4)
                         .measurement(0, 5)
                         .measurement(kLogStart - 9 * kLogSecond, 6)
                         .measurement(kLogStart + 4 * kLogSecond, 7)
                         .source();
    LogDecoder play(log, kLte);
    std::vector<LogTime> times;
    play.lookAhead();
    while (play.hasNext()) {
        play.takeNext();
        times.push_back(play.time());
    }
    EXPECT_THAT(times, ElementsAre(0s, 0s, 3s, 3s, 3s, 3s, 4s));
    EXPECT_EQ(play.clock().isoText(play.time()), "2017-07-11T04:34:12.000Z");
}

// The times of all readings of a display, each once.
std::set<std::int64_t> readingTimes(const PropertyValue& display)
{
    std::set<std::int64_t> times;
    if (const Reading* reading = display.asReading())
        times.insert(reading->time);
    if (const PropertyDictionary* rows = display.asDictionary())
        for (const auto& [key, row] : *rows)
            times.merge(readingTimes(row));
    if (const PropertyArray* elements = display.asArray())
        for (const PropertyValue& element : *elements)
            times.merge(readingTimes(element));
    return times;
}

TEST_F(LogDecoderTest, ReadingsCarryTheTimeOfTheLastItemThatHadOne)
{
    constexpr std::int64_t kStart = 1499747648000; // 2017-07-11 04:34:08
    LogDecoder play(LogBuilder()
                        .measurement(0, 1)
                        .measurement(kLogStart, 2)
                        .measurement(0, 3)
                        .measurement(kLogStart + 3 * kLogSecond, 4)
                        .source(),
                    kLte);
    std::vector<std::set<std::int64_t>> times;
    play.lookAhead();
    while (play.hasNext()) {
        play.takeNext();
        times.push_back(readingTimes(play.display()));
    }
    using Times = std::set<std::int64_t>;
    EXPECT_THAT(times, ElementsAre(Times{kNoReadingTime}, Times{kStart}, Times{kStart},
                                   Times{kStart + 3000}));
}

TEST_F(LogDecoderTest, AnItemOfAnImpossibleTimeHasThatOfTheOneBefore)
{
    constexpr std::uint64_t kWild = std::uint64_t{0x7FFF} << 48;
    LogDecoder play(LogBuilder()
                        .measurement(kWild, 1)
                        .measurement(kLogStart, 2)
                        .measurement(kLogStart + kLogSecond, 3)
                        .measurement(kWild, 4)
                        .measurement(kWild + kLogSecond, 5)
                        .measurement(kLogStart + 2 * kLogSecond, 6)
                        .measurement(kLogStart + 3 * kLogSecond, 7)
                        .measurement(kWild, 8)
                        .source(),
                    kLte);
    std::vector<LogTime> times;
    play.lookAhead();
    while (play.hasNext()) {
        play.takeNext();
        times.push_back(play.time());
    }
    EXPECT_THAT(times, ElementsAre(0s, 0s, 1s, 1s, 1s, 2s, 3s, 3s));
    EXPECT_EQ(play.impossibleTimes(), 4U);
    EXPECT_EQ(play.clock().isoText(0s), "2017-07-11T04:34:08.000Z");
}

TEST_F(LogDecoderTest, NothingIsShownBeforeTheFirstItem)
{
    LogDecoder play(LogBuilder().measurement(kLogStart, 1).source(), kLte);
    EXPECT_FALSE(play.display());
    EXPECT_FALSE(play.hasNext());
    EXPECT_FALSE(play.isAtEnd());
    play.takeNext(); // no item was found yet
    EXPECT_EQ(play.itemsTaken(), 0U);
    takeAll(play);
    EXPECT_TRUE(play.display());
}

TEST_F(LogDecoderTest, ALogWithoutItemsIsAtItsEnd)
{
    LogDecoder play(sourceOf({}), kLte);
    EXPECT_TRUE(play.isAtEnd());
    LogDecoder foreign(sourceOf(Bytes(100, 0xED)), kLte);
    takeAll(foreign);
    EXPECT_EQ(foreign.itemsTaken(), 0U);
    EXPECT_EQ(foreign.reader().unplacedBytes(), 100U);
}

TEST_F(LogDecoderTest, AMessageThatMakesADecoderThrowCostsThatMessageOnly)
{
    LogBuilder builder;
    builder.measurement(kLogStart, 1);
    builder.bytes.push_back(0xFF);                      // made by the server:
    builder.item(1, kLogStart + kLogStep, Bytes(5, 1)); // not a cell array
    builder.measurement(kLogStart + 2 * kLogStep, 2);
    builder.bytes.push_back(0xFF);
    builder.item(2, kLogStart + 3 * kLogStep, Bytes(5, 1)); // not a list of data connections
    builder.measurement(kLogStart + 4 * kLogStep, 3);
    LogDecoder play(builder.source(), kTSLogChannelTechnology_IFX);
    play.setTellsErrors(true);
    services.log.lines.clear();
    takeAll(play); // every item is a message that this generator cannot read
    EXPECT_EQ(play.itemsTaken(), 5U);
    EXPECT_EQ(services.log.errors().size(), 5U);
    EXPECT_THAT(services.log.errors().front(), testing::StartsWith("Dropping a message of 77 "));
}

TEST_F(LogDecoderTest, OnlyErrorsAboutMessagesAreToldAndOnlyWhereTheyShall)
{
    services.log.lines.clear();
    {
        LogDecoder play(recordedLog("lte-drive.dlf"), kLte);
        takeAll(play);
    }
    EXPECT_THAT(services.log.lines, IsEmpty());
    LogDecoder play(recordedLog("lte-drive.dlf"), kLte);
    play.setTellsErrors(true);
    takeAll(play);
    EXPECT_EQ(services.log.errors().size(), 24U);
    EXPECT_EQ(services.log.lines.size(), 24U);
    EXPECT_THAT(services.console.lines, IsEmpty());
}

TEST_F(LogDecoderTest, ServingCellChangesAreCounted)
{
    LogDecoder play(recordedLog("lte-drive.dlf"), kLte);
    takeAll(play);
    EXPECT_EQ(play.servingCellChanges(), 24U); // the first one and 23 more
}

TEST_F(LogDecoderTest, ServingCellsOfOneMomentCountAsTheLastOfThem)
{
    LogDecoder play(LogBuilder()
                        .servingCell(kLogStart, 1)
                        .servingCell(kLogStart + kLogSecond, 2)
                        .servingCell(kLogStart + kLogSecond, 1)
                        .servingCell(kLogStart + 2 * kLogSecond, 3)
                        .source(),
                    kLte);
    takeAll(play);
    EXPECT_EQ(play.servingCellChanges(), 2U);
}

TEST_F(LogDecoderTest, ARestoredPlayGoesOnFromAnyItemAsBefore)
{
    for (const RecordedDrive& drive : kDrives) {
        const LiveView& live = liveViewOf(drive);
        const auto log = recordedLog(drive.file);
        LogDecoder play(log, drive.technology);
        LogDecoder other(log, drive.technology);
        play.lookAhead();
        for (std::size_t i = 0; i < live.moments.size(); i += 5 + i % 3) {
            while (play.itemsTaken() < i)
                play.takeNext();
            const LogDecoder::Checkpoint checkpoint = play.checkpoint();
            EXPECT_GT(checkpoint.bytes(), sizeof checkpoint);
            other.restore(checkpoint);
            ASSERT_EQ(other.itemsTaken(), i);
            other.takeNext();
            ASSERT_EQ(other.time(), live.moments[i].time);
            ASSERT_EQ(other.display().description(), live.moments[i].display);
        }
        takeAll(play);
        takeAll(other);
        EXPECT_EQ(other.itemsTaken(), live.moments.size());
        EXPECT_EQ(other.servingCellChanges(), play.servingCellChanges());
        EXPECT_EQ(other.reader().unplacedBytes(), play.reader().unplacedBytes());
    }
}

TEST_F(LogDecoderTest, AnUnknownTechnologyIsRefused)
{
    EXPECT_THROW(LogDecoder(sourceOf({}), "lte"), std::invalid_argument);
}

} // namespace
} // namespace orvane
