#include "recordings/Checkpoints.h"

#include "platform/base/TelephonyConstants.h"

#include "recordings/support/LogFiles.h"
#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

class CheckpointsTest : public ::testing::Test
{
protected:
    CheckpointsTest() { services.useShippedResources(); }

    // Plays all items and offers each of them for a checkpoint.
    void pass(const std::shared_ptr<ByteSource>& log)
    {
        LogDecoder play(log, kLte);
        play.lookAhead();
        checkpoints.pass(play);
        while (play.hasNext()) {
            play.takeNext();
            checkpoints.pass(play);
            items = play.itemsTaken();
        }
    }

    TestServices services;
    Checkpoints checkpoints;
    std::uint64_t items = 0;
};

TEST_F(CheckpointsTest, TheirNumberIsBoundedHoweverLongTheLogIs)
{
    LogBuilder builder;
    builder.servingCell(kLogStart, 1);
    for (std::uint64_t i = 0; i < 300'000; ++i)
        builder.item(0x1234, kLogStart + i * kLogStep, {});
    pass(builder.source());
    EXPECT_LE(checkpoints.size(), Checkpoints::kMost);
    EXPECT_GT(checkpoints.size(), Checkpoints::kMost / 2 - 1);
    EXPECT_EQ(checkpoints.spacing(), 2048U);
    // No gap between two of them is wider than the spacing.
    for (LogTime time = 0ns; time < 300s; time += 1s) {
        const auto* before = checkpoints.before(time);
        ASSERT_TRUE(before);
        EXPECT_TRUE(before->place.itemsTaken == 0 || before->place.time < time);
        const auto behind = static_cast<std::uint64_t>(time / 1250us) - before->place.itemsTaken;
        EXPECT_LE(behind, checkpoints.spacing());
    }
}

TEST_F(CheckpointsTest, TheirMemoryIsBoundedHoweverMuchIsShown)
{
    // The longest list of data connections that an item holds: some 300 kB when it is shown.
    std::string list = "<plist version=\"1.0\"><array>";
    while (list.size() < 65'000)
        list += "<string/>";
    list += "</array></plist>";
    LogBuilder builder;
    builder.measurement(kLogStart, 1);
    builder.bytes.push_back(0xFF);
    builder.item(2, kLogStart + kLogStep, Bytes(list.begin(), list.end()));
    for (std::uint64_t i = 2; i < 70'002; ++i)
        builder.item(0x1234, kLogStart + i * kLogStep, {});
    pass(builder.source());
    ASSERT_EQ(items, 70'002U);
    EXPECT_LT(checkpoints.size(), Checkpoints::kMost / 2);
    EXPECT_GT(checkpoints.size(), Checkpoints::kMost / 8);
}

TEST_F(CheckpointsTest, PlacesInTheMiddleOfAMomentCountForWhatComesAfterItOnly)
{
    LogBuilder builder;
    builder.measurement(kLogStart, 1);
    for (int i = 0; i < 2000; ++i)
        builder.measurement(kLogStart + kLogSecond, 2);
    builder.measurement(kLogStart + 2 * kLogSecond, 3);
    pass(builder.source());
    EXPECT_EQ(checkpoints.before(1s)->place.itemsTaken, 0U);
    EXPECT_EQ(checkpoints.before(1s + 1ns)->place.itemsTaken, 1792U);
}

TEST_F(CheckpointsTest, ThoseOfAServingCellAreFound)
{
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 2000; ++i)
        builder.servingCell(kLogStart + i * kLogStep, static_cast<std::uint8_t>(i / 500));
    pass(builder.source());
    EXPECT_EQ(checkpoints.withCellChanges(0)->place.itemsTaken, 0U);
    EXPECT_EQ(checkpoints.withCellChanges(1)->place.itemsTaken, 256U);
    EXPECT_EQ(checkpoints.withCellChanges(2)->place.itemsTaken, 768U);
    EXPECT_EQ(checkpoints.withCellChanges(99)->place.itemsTaken, 1792U);
}

TEST_F(CheckpointsTest, ThereAreNoneBeforeTheFirstCall)
{
    EXPECT_EQ(checkpoints.before(1s), nullptr);
    EXPECT_EQ(checkpoints.withCellChanges(1), nullptr);
}

} // namespace
} // namespace orvane
