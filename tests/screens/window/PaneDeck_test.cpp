#include "screens/window/PaneDeck.h"

#include "screens/window/WindowTest.h"

#include <QApplication>
#include <QPointer>
#include <QStyle>

namespace orvane
{

namespace
{

class PaneDeckTest : public WindowTest
{
protected:
    PaneDeckTest()
        : WindowTest([] {
              auto settings = stillSettings();
              settings.isAnimated = true;
              return settings;
          }())
    {
        show(rootNode({groupNode("Group", {valueNode("Key", "1")})}));
    }
    [[nodiscard]] PaneDeck& deck() const { return frame().deck(); }
};

TEST_F(PaneDeckTest, PushedPaneSlidesInFromTheRight)
{
    PaneWidget* const before = deck().top();
    clickRow(0);
    ASSERT_TRUE(deck().isSliding());
    EXPECT_GT(topPane().x(), 0);
    EXPECT_TRUE(before->isVisible());
    EXPECT_TRUE(turnEventsUntil([&] { return !deck().isSliding(); }));
    EXPECT_EQ(topPane().x(), 0);
    EXPECT_FALSE(before->isVisible());
}

TEST_F(PaneDeckTest, PoppedPaneSlidesAwayAndIsGone)
{
    clickRow(0);
    ASSERT_TRUE(turnEventsUntil([&] { return !deck().isSliding(); }));
    const QPointer<PaneWidget> leaving = deck().top();
    frame().goBack();
    turnEvents();
    ASSERT_TRUE(deck().isSliding());
    EXPECT_TRUE(leaving->isVisible());
    EXPECT_TRUE(turnEventsUntil([&] { return leaving.isNull(); }));
    EXPECT_EQ(topPane().x(), 0);
    EXPECT_TRUE(topPane().isVisible());
}

TEST_F(PaneDeckTest, RefreshWhileSlidingIsShown)
{
    clickRow(0);
    ASSERT_TRUE(deck().isSliding());
    refresh(rootNode({groupNode("Group", {valueNode("Key", "2")})}));
    EXPECT_EQ(row(0)->accessibleName(), "Key, 2");
}

TEST_F(PaneDeckTest, GoingBackWhileSlidingEndsAtTheRoot)
{
    clickRow(0);
    ASSERT_TRUE(deck().isSliding());
    frame().goBack();
    turnEvents();
    EXPECT_TRUE(turnEventsUntil([&] { return !deck().isSliding(); }));
    EXPECT_EQ(title(), "Orvane");
    EXPECT_EQ(topPane().x(), 0);
}

TEST_F(PaneDeckTest, ResizeWhileSlidingEndsTheSlide)
{
    clickRow(0);
    ASSERT_TRUE(deck().isSliding());
    frame().resize(640, 360);
    turnEvents();
    EXPECT_FALSE(deck().isSliding());
    EXPECT_EQ(topPane().geometry(), deck().rect());
}

} // namespace

} // namespace orvane
