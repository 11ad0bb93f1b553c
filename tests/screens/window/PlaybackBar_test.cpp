#include "screens/window/PlaybackBar.h"

#include "doubles/FakePlayback.h"

#include "screens/window/FlatButton.h"
#include "screens/window/TextLine.h"
#include "screens/window/WindowTest.h"
#include "screens/window/WrappedText.h"

#include <gmock/gmock.h>

#include <QLineEdit>
#include <QProgressBar>
#include <QSlider>
#include <QTest>
#include <QTextDocument>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class PlaybackBarTest : public WindowTest
{
protected:
    PlaybackBarTest()
    {
        show(rootNode({valueNode("Technology", "LTE")}));
        screen.setPlayback(&playback);
        turnEvents();
    }
    ~PlaybackBarTest() override { screen.setPlayback(nullptr); }

    [[nodiscard]] PlaybackBar& bar() const { return frame().playbackBar(); }
    void change()
    {
        screen.setNeedsUpdate();
        turnEvents();
    }
    void press(const QString& name)
    {
        for (auto* button : bar().findChildren<QAbstractButton*>())
            if (button->accessibleName() == name && button->isVisible())
                return QTest::mouseClick(button, Qt::LeftButton);
        ADD_FAILURE() << "there is no button " << name.toStdString();
    }
    void typeTime(const QString& text)
    {
        bar().timeField().setFocus();
        QTest::keyClicks(&bar().timeField(), text);
        QTest::keyClick(&bar().timeField(), Qt::Key_Return);
        turnEvents();
    }

    FakePlayback playback;
};

TEST_F(PlaybackBarTest, IsThereForARecordingAlone)
{
    EXPECT_TRUE(bar().isVisible());
    screen.setPlayback(nullptr);
    turnEvents();
    EXPECT_FALSE(bar().isVisible());
}

TEST_F(PlaybackBarTest, ShowsPositionTimeAndSpeed)
{
    playback.at = 25;
    playback.rate = 20;
    change();
    EXPECT_EQ(bar().slider().value(), bar().slider().maximum() / 4);
    EXPECT_EQ(bar().timeField().text(), "2026-11-21 10:00:25 UTC");
    EXPECT_EQ(bar().speed().text(), QString("20\u00D7"));
}

TEST_F(PlaybackBarTest, EachButtonDoesWhatItSays)
{
    for (const char* name : {"Step back", "Play", "Step", "Slower", "Faster",
                             "To the next serving cell", "To the end"})
        press(name);
    EXPECT_THAT(playback.calls, ElementsAre("stepBack", "play", "step", "slower", "faster",
                                            "jumpToNextServingCell", "jumpToEnd"));
}

TEST_F(PlaybackBarTest, PlayButtonPausesWhilePlaying)
{
    playback.plays = true;
    change();
    EXPECT_EQ(bar().playButton().sign(), Sign::Pause);
    press("Pause");
    EXPECT_THAT(playback.calls, ElementsAre("pause"));
}

TEST_F(PlaybackBarTest, SliderJumps)
{
    bar().slider().setValue(bar().slider().maximum() / 2);
    EXPECT_THAT(playback.calls, ElementsAre("jumpTo 50"));
}

TEST_F(PlaybackBarTest, PlayingMovesTheSliderWithoutAJump)
{
    playback.at = 60;
    change();
    EXPECT_THAT(playback.calls, IsEmpty());
}

TEST_F(PlaybackBarTest, SliderUnderTheFingerIsNotMoved)
{
    bar().slider().setSliderDown(true);
    playback.at = 60;
    change();
    EXPECT_EQ(bar().slider().value(), 0);
    bar().slider().setSliderDown(false);
    change();
    EXPECT_EQ(bar().slider().value(), bar().slider().maximum() * 6 / 10);
}

TEST_F(PlaybackBarTest, TypedTimeIsJumpedTo)
{
    typeTime("10:00:30");
    EXPECT_THAT(playback.calls, ElementsAre("jumpToText 10:00:30"));
    EXPECT_EQ(bar().timeField().text(), "2026-11-21 10:00:00 UTC") << "the recording's again";
}

TEST_F(PlaybackBarTest, UnusableTimeStaysAndIsToldInWordsUntilAnotherIsTyped)
{
    EXPECT_FALSE(bar().refusal().isVisible());
    playback.takesText = false;
    typeTime("noon");
    EXPECT_EQ(bar().timeField().text(), "noon");
    EXPECT_TRUE(bar().timeField().property("isWrong").toBool());
    EXPECT_TRUE(bar().refusal().isVisible());
    EXPECT_TRUE(bar().refusal().text().startsWith("Not a time. Type 10:04:30"));
    EXPECT_GE(bar().refusal().height(), bar().refusal().heightForWidth(bar().refusal().width()))
        << "nothing of it is cut";
    QTest::keyClick(&bar().timeField(), Qt::Key_Backspace);
    turnEvents();
    EXPECT_FALSE(bar().refusal().isVisible());
    EXPECT_FALSE(bar().timeField().property("isWrong").toBool());
}

TEST_F(PlaybackBarTest, LeavingTheFieldEndsTheRefusal)
{
    playback.takesText = false;
    typeTime("noon");
    table().setFocus();
    turnEvents();
    EXPECT_FALSE(bar().refusal().isVisible());
    EXPECT_EQ(bar().timeField().text(), "2026-11-21 10:00:00 UTC");
}

TEST_F(PlaybackBarTest, RemarkOfAFileIsPlainText)
{
    playback.note = "<img src='/dev/zero'>\x1b[2J";
    change();
    EXPECT_EQ(bar().remark().text(), QString("<img src='/dev/zero'>\uFFFD[2J"));
    QTextDocument shown;
    shown.setHtml(bar().remark().toolTip());
    EXPECT_EQ(shown.toPlainText(), bar().remark().text());
    EXPECT_EQ(bar().remark().accessibleDescription(), bar().remark().text());
}

TEST_F(PlaybackBarTest, PlayingDisturbsNoTyping)
{
    bar().timeField().setFocus();
    EXPECT_EQ(bar().timeField().text(), "");
    QTest::keyClicks(&bar().timeField(), "10:0");
    playback.at = 60;
    change();
    EXPECT_EQ(bar().timeField().text(), "10:0");
}

TEST_F(PlaybackBarTest, WhileItIsReadThereIsOnlyHowFarAndAButtonThatStops)
{
    playback.read = 0.4;
    change();
    EXPECT_TRUE(bar().progress().isVisible());
    EXPECT_FALSE(bar().slider().isVisible());
    EXPECT_EQ(bar().progress().value(), bar().progress().maximum() * 4 / 10);
    press("Stop reading");
    EXPECT_THAT(playback.calls, ElementsAre("stopReading"));
    playback.read = 1;
    change();
    EXPECT_FALSE(bar().progress().isVisible());
    EXPECT_TRUE(bar().slider().isVisible());
}

TEST_F(PlaybackBarTest, RemarkIsShownWhereThereIsOne)
{
    EXPECT_FALSE(bar().remark().isVisible());
    playback.note = "198 bytes at 0x1F40 could not be placed";
    change();
    EXPECT_TRUE(bar().remark().isVisible());
    EXPECT_EQ(bar().remark().text(), "198 bytes at 0x1F40 could not be placed");
}

TEST_F(PlaybackBarTest, FitsANarrowPhoneWithLargeButtons)
{
    frame().resize(360, 640);
    turnEvents();
    EXPECT_EQ(frame().width(), 360);
    for (const auto* button : bar().findChildren<QAbstractButton*>()) {
        if (!button->isVisible())
            continue;
        EXPECT_GE(button->width(), 44);
        EXPECT_GE(button->height(), 44);
        const QPoint corner = button->mapTo(&frame(), QPoint(button->width(), 0));
        EXPECT_LE(corner.x(), 360);
    }
}

} // namespace

} // namespace orvane
