#include "recordings/RefreshPeriods.h"

#include "platform/base/TelephonyConstants.h"

#include "recordings/support/LiveView.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::Pair;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

class RefreshPeriodsTest : public ::testing::Test
{
protected:
    RefreshPeriodsTest() { services.useShippedResources(); }

    // Time and channel of each period.
    static std::vector<std::pair<LogTime, std::string>>
    channels(const std::shared_ptr<ByteSource>& log, LogTime period)
    {
        std::vector<std::pair<LogTime, std::string>> found;
        RefreshPeriods periods(log, kLte, period);
        for (auto reached = periods.takeSlice(); reached != RefreshPeriods::Reached::End;
             reached = periods.takeSlice())
            if (reached == RefreshPeriods::Reached::Period)
                found.emplace_back(periods.time(),
                                   periods.decoder()
                                       .display()["Serving Cell Measurements"]["E-ARFCN"]
                                       .description());
        EXPECT_EQ(periods.takeSlice(), RefreshPeriods::Reached::End);
        return found;
    }

    TestServices services;
};

TEST_F(RefreshPeriodsTest, EachPeriodShowsWhatALiveViewWouldShowAtItsEnd)
{
    for (const RecordedDrive& drive : kDrives) {
        const LiveView& live = liveViewOf(drive);
        for (const LogTime period : {LogTime(2s), LogTime(300ms), LogTime(1h)}) {
            const auto expected = live.periods(period);
            RefreshPeriods periods(recordedLog(drive.file), drive.technology, period);
            std::size_t count = 0;
            for (auto reached = periods.takeSlice(); reached != RefreshPeriods::Reached::End;
                 reached = periods.takeSlice()) {
                if (reached != RefreshPeriods::Reached::Period)
                    continue;
                ASSERT_LT(count, expected.size());
                ASSERT_EQ(periods.time(), expected[count].time);
                ASSERT_EQ(periods.decoder().display().description(), expected[count].display);
                ++count;
            }
            EXPECT_EQ(count, expected.size()) << drive.file;
        }
    }
}

TEST_F(RefreshPeriodsTest, PeriodsBeginAtTheFirstItemAndEmptyOnesGiveNothing)
{
    const auto log = LogBuilder()
                         .measurement(kLogStart + kLogSecond, 1)
                         .measurement(kLogStart + 3 * kLogSecond - kLogStep, 2)
                         .measurement(kLogStart + 3 * kLogSecond, 3) // exactly one period later
                         .measurement(kLogStart + 103 * kLogSecond, 4)
                         .source();
    EXPECT_THAT(channels(log, 2s),
                ElementsAre(Pair(1998750us, "2"), Pair(2s, "3"), Pair(102s, "4")));
}

TEST_F(RefreshPeriodsTest, AnEarlierItemBelongsToThePeriodThatIsOpen)
{
    const auto log = LogBuilder()
                         .measurement(kLogStart, 1)
                         .measurement(kLogStart + 5 * kLogSecond, 2)
                         .measurement(kLogStart + kLogSecond, 3)
                         .measurement(0, 4)
                         .source();
    EXPECT_THAT(channels(log, 2s), ElementsAre(Pair(0s, "1"), Pair(5s, "4")));
}

TEST_F(RefreshPeriodsTest, ALogWithoutTimestampsIsOnePeriod)
{
    const auto log = LogBuilder().measurement(0, 1).measurement(0, 2).source();
    EXPECT_THAT(channels(log, 2s), ElementsAre(Pair(0s, "2")));
}

TEST_F(RefreshPeriodsTest, ALogWithoutItemsHasNoPeriods)
{
    EXPECT_TRUE(channels(sourceOf({}), 2s).empty());
    EXPECT_TRUE(channels(sourceOf(Bytes(1'500'000, 0)), 2s).empty());
}

TEST_F(RefreshPeriodsTest, SlicesAreShortHoweverLongAPeriodIs)
{
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 5000; ++i)
        builder.item(0x1234, kLogStart + i * kLogStep, Bytes(20, 1));
    RefreshPeriods periods(builder.source(), kLte, 1h);
    int slices = 0;
    while (periods.takeSlice() == RefreshPeriods::Reached::Nothing)
        ++slices;
    EXPECT_EQ(slices, 5);
}

TEST_F(RefreshPeriodsTest, EveryTruncationShowsAllThatCanBePlaced)
{
    LogBuilder builder;
    for (std::uint8_t i = 0; i < 6; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    for (std::size_t length = 0; length <= builder.bytes.size(); ++length) {
        const Bytes cut(builder.bytes.begin(),
                        builder.bytes.begin() + static_cast<std::ptrdiff_t>(length));
        const auto found = channels(sourceOf(cut), 1s);
        const std::size_t whole = length / 76;
        const bool isCut = length % 76 != 0;
        // The bytes before an item that was cut off look like an item themselves.
        ASSERT_EQ(found.size(), isCut && whole > 0 ? whole - 1 : whole) << length;
        for (std::size_t i = 0; i < found.size(); ++i)
            ASSERT_EQ(found[i].second, std::to_string(i));
    }
}

} // namespace
} // namespace orvane
