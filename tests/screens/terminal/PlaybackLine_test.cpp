#include "doubles/FakePlayback.h"

#include "screens/terminal/TerminalScreenTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;

using Kind = Key::Kind;

class PlaybackLineTest : public TerminalScreenTest
{
protected:
    PlaybackLineTest()
    {
        playback.length = 3600;
        playback.at = 900;
        playback.rate = 10;
        screen->setPlayback(&playback);
        refresh(numberedRows(3));
    }
    ~PlaybackLineTest() override { screen->setPlayback(nullptr); }

    FakePlayback playback;
};

} // namespace

TEST_F(PlaybackLineTest, StateSpeedPositionAndTimeAreShown)
{
    EXPECT_THAT(device.text(21), StartsWith(" ‖ paused 10x  ━"));
    EXPECT_THAT(device.text(21), EndsWith("─  15:00 / 1:00:00  2026-11-21 10:15:00 UTC"));
    playback.plays = true;
    screen->setNeedsUpdate();
    queue.runPending();
    EXPECT_THAT(device.text(21), StartsWith(" ▶ playing 10x"));
}

TEST_F(PlaybackLineTest, OnANarrowTerminalTheTimeStays)
{
    resize(10, 40);
    EXPECT_EQ(device.text(7), " ‖ paused 10x   2026-11-21 10:15:00 UTC");
}

TEST_F(PlaybackLineTest, TheKeysDriveIt)
{
    type(" .,+=-0Gn");
    playback.plays = true;
    type(" ");
    EXPECT_THAT(playback.calls,
                ElementsAre("play", "step", "stepBack", "faster", "faster", "slower", "jumpTo 0",
                            "jumpToEnd", "jumpToNextServingCell", "pause"));
}

TEST_F(PlaybackLineTest, ATimeIsTypedAndJumpedTo)
{
    playback.takesText = false;
    type("g10:0q");
    EXPECT_THAT(device.text(23), StartsWith(" Go to time: 10:0q"));
    press(Kind::Enter);
    EXPECT_THAT(device.text(23), HasSubstr("not a time"));
    for (int i = 0; i < 5; ++i)
        press(Kind::Backspace);
    playback.takesText = true;
    type("+90");
    press(Kind::Enter);
    EXPECT_THAT(playback.calls, ElementsAre("jumpToText 10:0q", "jumpToText +90"));
    EXPECT_THAT(device.text(23), HasSubstr("q quit"));
    type("g");
    press(Kind::Escape);
    EXPECT_THAT(device.text(23), HasSubstr("q quit"));
}

TEST_F(PlaybackLineTest, AClickOnTheBarJumps)
{
    const std::string line = device.text(21);
    const int start = columnsOf(line.substr(0, line.find("━")));
    click(21, start);
    EXPECT_THAT(playback.calls, ElementsAre("jumpTo 0"));
}

TEST_F(PlaybackLineTest, WhileTheFileIsReadItsProgressAndHowToStopAreShown)
{
    playback.read = 0.42;
    screen->setNeedsUpdate();
    queue.runPending();
    EXPECT_THAT(device.text(21), StartsWith(" Reading the file  ━"));
    EXPECT_THAT(device.text(21), EndsWith(" 42 %"));
    EXPECT_THAT(device.text(23), HasSubstr("x stop reading"));
    type(" x");
    EXPECT_THAT(playback.calls, ElementsAre("stopReading")) << "it cannot be played yet";
}

TEST_F(PlaybackLineTest, NoServerIsWaitedFor)
{
    refresh({});
    root->setStatus("", true);
    queue.runPending();
    EXPECT_GE(device.lineOf("No data yet"), 0);
    playback.read = 0.5;
    screen->setNeedsUpdate();
    queue.runPending();
    EXPECT_LT(device.lineOf("Reading the file"), 20);
    EXPECT_EQ(device.lineOf("Waiting"), -1);
}

TEST_F(PlaybackLineTest, TheRemarkHasALineOfItsOwn)
{
    playback.note = "198 bytes could not be placed";
    screen->setNeedsUpdate();
    queue.runPending();
    EXPECT_EQ(device.text(21), " 198 bytes could not be placed");
    EXPECT_THAT(device.text(20), StartsWith(" ‖ paused"));
}

TEST_F(PlaybackLineTest, TheListOfKeysHasItsKeys)
{
    type("?");
    EXPECT_GE(device.lineOf("play, pause"), 0);
    EXPECT_EQ(device.lineOf("stop reading"), -1) << "it has been read";
    press(Key::Kind::Escape);
    playback.read = 0.5;
    screen->setNeedsUpdate();
    queue.runPending();
    type("?");
    EXPECT_GE(device.lineOf("stop reading the file"), 0);
    EXPECT_EQ(device.lineOf("play, pause"), -1) << "it cannot be played yet";
}

} // namespace orvane
