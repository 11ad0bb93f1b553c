#include "screens/window/PaneDeck.h"

#include "screens/window/WindowTest.h"

#include <QAnimationDriver>
#include <QApplication>
#include <QPointer>
#include <QStyle>

#include <chrono>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

// Animations that only a test advances.
class SteppedAnimations final : public QAnimationDriver
{
public:
    SteppedAnimations() { install(); }
    ~SteppedAnimations() override { uninstall(); }

    void step(std::chrono::milliseconds time)
    {
        _elapsed += time;
        advanceAnimation();
    }
    [[nodiscard]] qint64 elapsed() const override { return _elapsed.count(); }

protected:
    // Qt counts the time from the start of the first of overlapping animations.
    void start() override
    {
        _elapsed = {};
        QAnimationDriver::start();
    }

private:
    std::chrono::milliseconds _elapsed{0};
};

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
    // Advances to the end of the slide.
    void endSlide()
    {
        for (int i = 0; i < 100 && deck().isSliding(); ++i)
            animations.step(16ms);
        turnEvents();
        EXPECT_FALSE(deck().isSliding());
    }

    SteppedAnimations animations;
};

TEST_F(PaneDeckTest, PushedPaneSlidesInFromTheRight)
{
    PaneWidget* const before = deck().top();
    clickRow(0);
    ASSERT_TRUE(deck().isSliding());
    const int start = topPane().x();
    animations.step(50ms);
    EXPECT_LT(topPane().x(), start);
    EXPECT_GT(topPane().x(), 0);
    EXPECT_TRUE(before->isVisible());
    endSlide();
    EXPECT_EQ(topPane().x(), 0);
    EXPECT_FALSE(before->isVisible());
}

TEST_F(PaneDeckTest, PoppedPaneSlidesAwayAndIsGone)
{
    clickRow(0);
    endSlide();
    const QPointer<PaneWidget> leaving = deck().top();
    frame().goBack();
    turnEvents();
    ASSERT_TRUE(deck().isSliding());
    EXPECT_TRUE(leaving->isVisible());
    endSlide();
    EXPECT_TRUE(leaving.isNull());
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
    endSlide();
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
