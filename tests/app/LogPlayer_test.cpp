#include "app/LogPlayer.h"

#include "platform/base/TelephonyConstants.h"

#include "doubles/ManualMainQueue.h"
#include "recordings/support/LiveView.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::HasSubstr;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;

// A log with a measurement every second, whose channel is the second, for ten minutes.
std::shared_ptr<ByteSource> everySecond(std::uint16_t seconds = 600)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i <= seconds; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    return builder.source();
}

class LogPlayerTest : public ::testing::Test
{
protected:
    LogPlayerTest() { services.useShippedResources(); }

    void open(std::shared_ptr<ByteSource> log, RecordingSettings settings = {"a.dlf", {}})
    {
        player = std::make_unique<LogPlayer>(
            queue, [this] { return queue.now(); }, std::move(log), std::move(settings),
            [this] { ++changes; });
    }
    void openAndRead(std::shared_ptr<ByteSource> log)
    {
        open(std::move(log));
        queue.runPending();
        ASSERT_TRUE(player->isReady()) << player->failure().value_or("");
    }
    [[nodiscard]] std::string channel() const
    {
        const NodePointer node = player->nodeAtPath("/Serving Cell Measurements/E-ARFCN");
        return node && node->value() ? *node->value() : "";
    }

    TestServices services;
    ManualMainQueue queue;
    std::unique_ptr<LogPlayer> player;
    int changes = 0;
};

TEST_F(LogPlayerTest, ALogIsReadInTurnsOfTheQueueAndThenShowsItsFirstPeriod)
{
    open(recordedLog("lte-drive.dlf"));
    EXPECT_EQ(changes, 0);
    EXPECT_FALSE(player->isReady());
    EXPECT_LT(player->progress(), 1);
    EXPECT_EQ(player->topLevelNodes(), nullptr);
    EXPECT_EQ(player->positionText(), "");
    queue.runPending();
    EXPECT_TRUE(player->isReady());
    EXPECT_EQ(player->progress(), 1);
    EXPECT_GT(changes, 2);
    EXPECT_FALSE(player->isPlaying());
    EXPECT_EQ(player->position(), 2);
    EXPECT_NEAR(player->duration(), 300, 1);
    const LiveView live(recordedFile("lte-drive.dlf"), kLte);
    ASSERT_TRUE(player->nodeAtPath("/Serving Cell Info/Cell Identity"));
    EXPECT_EQ(player->nodeAtPath("/Nothing"), nullptr);
    EXPECT_THAT(live.at(2s),
                HasSubstr("Cell Identity = " +
                          *player->nodeAtPath("/Serving Cell Info/Cell Identity")->value()));
}

TEST_F(LogPlayerTest, ProgressGoesOnWhileALongLogIsRead)
{
    LogBuilder builder;
    for (std::uint64_t i = 0; i < 20'000; ++i)
        builder.servingCell(kLogStart + i * kLogStep, 1);
    open(builder.source());
    std::vector<double> progress;
    ManualMainQueue other(queue);
    // Between the slices others have their turn.
    std::function<void()> look = [&] {
        progress.push_back(player->progress());
        if (!player->isReady())
            other.async(look);
    };
    other.async(look);
    queue.runPending();
    EXPECT_GT(progress.size(), 30U);
    EXPECT_TRUE(std::is_sorted(progress.begin(), progress.end()));
    EXPECT_EQ(progress.back(), 1);
}

TEST_F(LogPlayerTest, PlayingGoesOnByRefreshPeriods)
{
    openAndRead(everySecond());
    EXPECT_EQ(channel(), "1"); // of seconds 0 and 1
    player->play();
    EXPECT_TRUE(player->isPlaying());
    queue.advance(1999ms);
    EXPECT_EQ(channel(), "1");
    queue.advance(1ms);
    EXPECT_EQ(player->position(), 4);
    EXPECT_EQ(channel(), "3");
    EXPECT_EQ(player->positionText(), "2017-07-11 04:34:12 UTC");
    queue.advance(20s);
    EXPECT_EQ(player->position(), 24);
    EXPECT_EQ(channel(), "23");
}

TEST_F(LogPlayerTest, PausingStopsItWhereItIs)
{
    openAndRead(everySecond());
    player->play();
    queue.advance(6s);
    changes = 0;
    player->pause();
    EXPECT_EQ(changes, 1);
    EXPECT_FALSE(player->isPlaying());
    queue.advance(60s);
    EXPECT_EQ(player->position(), 8);
    player->play();
    queue.advance(2s);
    EXPECT_EQ(player->position(), 10);
}

TEST_F(LogPlayerTest, SpeedsAreFromOneToAThousand)
{
    openAndRead(everySecond());
    std::vector<double> speeds = {player->speed()};
    for (int i = 0; i < 12; ++i) {
        player->faster();
        speeds.push_back(player->speed());
    }
    EXPECT_EQ(speeds,
              (std::vector<double>{1, 2, 5, 10, 20, 50, 100, 200, 500, 1000, 1000, 1000, 1000}));
    for (int i = 0; i < 12; ++i)
        player->slower();
    EXPECT_EQ(player->speed(), 1);
}

TEST_F(LogPlayerTest, FasterPlayingShowsTheSamePeriods)
{
    openAndRead(everySecond());
    player->play();
    player->faster();
    player->faster(); // 5
    queue.advance(10s);
    EXPECT_EQ(player->position(), 52);
    EXPECT_EQ(channel(), "51");
    while (player->speed() < 1000)
        player->faster();
    queue.advance(200ms);
    EXPECT_NEAR(player->position(), 252, 2);
    EXPECT_EQ(channel(), std::to_string(static_cast<int>(player->position()) - 1));
}

TEST_F(LogPlayerTest, PlayingEndsAtTheEndAndThenStartsOver)
{
    openAndRead(everySecond(7));
    player->play();
    queue.advance(60s);
    EXPECT_FALSE(player->isPlaying());
    EXPECT_EQ(player->position(), 7);
    EXPECT_EQ(channel(), "7");
    player->play();
    EXPECT_EQ(player->position(), 0);
    EXPECT_EQ(channel(), "0");
    queue.advance(2s);
    EXPECT_EQ(channel(), "1");
}

TEST_F(LogPlayerTest, StepsAreOneRefreshPeriodAndPause)
{
    openAndRead(everySecond());
    player->play();
    player->step();
    EXPECT_FALSE(player->isPlaying());
    EXPECT_EQ(player->position(), 4);
    player->step();
    EXPECT_EQ(channel(), "5");
    player->stepBack();
    EXPECT_EQ(player->position(), 4);
    EXPECT_EQ(channel(), "3");
    player->stepBack();
    player->stepBack();
    player->stepBack();
    EXPECT_EQ(player->position(), 0);
    player->jumpToEnd();
    player->step();
    EXPECT_EQ(player->position(), 600);
}

TEST_F(LogPlayerTest, JumpsGoAnywhere)
{
    openAndRead(everySecond());
    player->jumpTo(100.5);
    EXPECT_EQ(player->position(), 100.5);
    EXPECT_EQ(channel(), "100");
    player->jumpTo(-3);
    EXPECT_EQ(player->position(), 0);
    for (const double far : {1e300, std::numeric_limits<double>::infinity()}) {
        player->jumpTo(far);
        EXPECT_EQ(player->position(), 600);
    }
    player->jumpTo(std::numeric_limits<double>::quiet_NaN());
    EXPECT_EQ(player->position(), 0);
    EXPECT_TRUE(player->jumpToText("04:35:08"));
    EXPECT_EQ(player->position(), 60);
    EXPECT_TRUE(player->jumpToText("+90"));
    EXPECT_EQ(player->position(), 90);
    changes = 0;
    EXPECT_FALSE(player->jumpToText("tomorrow"));
    EXPECT_EQ(player->position(), 90);
    EXPECT_EQ(changes, 0);
}

TEST_F(LogPlayerTest, JumpsDoNotStopIt)
{
    openAndRead(everySecond());
    player->play();
    player->jumpTo(300);
    EXPECT_TRUE(player->isPlaying());
    queue.advance(2s);
    EXPECT_EQ(player->position(), 302);
}

TEST_F(LogPlayerTest, TheNextServingCellIsFound)
{
    openAndRead(LogBuilder()
                    .servingCell(kLogStart, 1)
                    .servingCell(kLogStart + 10 * kLogSecond, 1)
                    .servingCell(kLogStart + 20 * kLogSecond, 2)
                    .servingCell(kLogStart + 30 * kLogSecond, 2)
                    .source());
    const auto cell = [this] {
        return *player->nodeAtPath("/Serving Cell Info/Cell Identity")->value();
    };
    EXPECT_EQ(cell(), "1");
    player->jumpToNextServingCell();
    EXPECT_EQ(cell(), "2");
    EXPECT_NEAR(player->position(), 20, 0.002);
    player->jumpToNextServingCell();
    EXPECT_EQ(player->position(), 30);
}

TEST_F(LogPlayerTest, EveryChangeIsTold)
{
    openAndRead(everySecond());
    const auto told = [this](const auto& action) {
        changes = 0;
        action();
        return changes > 0;
    };
    EXPECT_TRUE(told([this] { player->play(); }));
    EXPECT_TRUE(told([this] { queue.advance(2s); }));
    EXPECT_TRUE(told([this] { player->faster(); }));
    EXPECT_TRUE(told([this] { player->slower(); }));
    EXPECT_TRUE(told([this] { player->step(); }));
    EXPECT_TRUE(told([this] { player->stepBack(); }));
    EXPECT_TRUE(told([this] { player->jumpTo(50); }));
    EXPECT_TRUE(told([this] { player->jumpToEnd(); }));
    EXPECT_TRUE(told([this] { player->jumpToText("+1"); }));
    EXPECT_TRUE(told([this] { player->jumpToNextServingCell(); }));
}

TEST_F(LogPlayerTest, ReadingCanBeStopped)
{
    open(everySecond(), {"a.dlf", kLte});
    player->stopReading();
    EXPECT_TRUE(player->isReady());
    EXPECT_EQ(player->duration(), 0);
    queue.runPending();

    LogBuilder builder;
    for (std::uint16_t i = 0; i < 3000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    open(builder.source(), {"a.dlf", kLte});
    ManualMainQueue other(queue);
    other.async([this] { player->stopReading(); });
    queue.runPending();
    EXPECT_EQ(player->progress(), 1);
    EXPECT_EQ(player->duration(), 999);
    EXPECT_EQ(channel(), "1");
}

TEST_F(LogPlayerTest, ReadingCanBeStoppedWhileTheTechnologyIsSought)
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i < 3000; ++i)
        builder.measurement(kLogStart + i * kLogSecond, i);
    open(builder.source());
    ManualMainQueue other(queue);
    other.async([this] { player->stopReading(); });
    queue.runPending();
    EXPECT_TRUE(player->isReady());
    EXPECT_EQ(player->progress(), 1);
    EXPECT_EQ(player->duration(), 999);
}

TEST_F(LogPlayerTest, NothingPlaysBeforeTheLogHasBeenRead)
{
    open(everySecond());
    player->play();
    player->step();
    player->stepBack();
    player->jumpTo(10);
    player->jumpToEnd();
    player->jumpToNextServingCell();
    EXPECT_FALSE(player->jumpToText("+10"));
    EXPECT_FALSE(player->isPlaying());
    EXPECT_EQ(player->position(), 0);
}

TEST_F(LogPlayerTest, ALogThatFitsNoTechnologySaysWhatToDo)
{
    open(LogBuilder().item(0x1234, kLogStart, {}).item(0x1235, kLogStart, {}).source());
    queue.runPending();
    ASSERT_TRUE(player->failure());
    EXPECT_EQ(*player->failure(), "\"a.dlf\" holds no log codes that tell its technology: name it "
                                  "with --technology, one of lte, umts, utran, cdma, cellmonitor");
    EXPECT_FALSE(player->isReady());
    EXPECT_EQ(player->progress(), 1);
    player->play();
    player->stopReading();
    EXPECT_EQ(player->topLevelNodes(), nullptr);

    open(LogBuilder().item(0x1234, kLogStart, {}).item(0x1235, kLogStart, {}).source(),
         {"a.dlf", kLte});
    queue.runPending();
    EXPECT_TRUE(player->isReady());
}

TEST_F(LogPlayerTest, AFileThatIsNoLogSaysSo)
{
    open(sourceOf(Bytes(5000, 0)));
    queue.runPending();
    EXPECT_THAT(player->failure().value_or(""),
                HasSubstr("is neither a diagnostic log (.dlf) nor a snapshot (.orvane)"));
}

TEST_F(LogPlayerTest, APlayerThatGoesLeavesNothingBehindInTheQueue)
{
    open(everySecond());
    player.reset();
    queue.runPending();
    openAndRead(everySecond());
    player->play();
    player.reset();
    changes = 0;
    queue.advance(60s);
    EXPECT_EQ(changes, 0);
}

} // namespace
} // namespace orvane
