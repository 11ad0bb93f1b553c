#include "screens/window/FlatButton.h"
#include "screens/window/TitleBar.h"
#include "screens/window/WindowTest.h"

#include <QScrollBar>
#include <QTest>
#include <QWindow>

namespace orvane
{

namespace
{

class BrowsingTest : public WindowTest
{
protected:
    BrowsingTest() { show(tree()); }

    static NodePointer tree()
    {
        return rootNode(
            {valueNode("Technology", "LTE"),
             groupNode("Serving Cell Info", {valueNode("Cell Identity", "1234"),
                                             groupNode("PLMN", {valueNode("MCC", "262")})})});
    }
    [[nodiscard]] FlatButton& back() const { return frame().titleBar().backButton(); }
    void open() { clickRow(1); }
    // Leaves the finger down. In the window's coordinates, which do not move with a pane.
    void swipe(int from, int to)
    {
        QTest::touchEvent(&table(), touchScreen()).press(0, {from, kSwipeY}, &frame());
        for (int x = from + 10; x <= to; x += 10)
            QTest::touchEvent(&table(), touchScreen()).move(0, {x, kSwipeY}, &frame());
    }

    static constexpr int kSwipeY = 250;
};

TEST_F(BrowsingTest, FromTheRootToAValueAndBack)
{
    EXPECT_EQ(title(), "Orvane");
    EXPECT_TRUE(back().isHidden());
    clickRow(1);
    EXPECT_EQ(title(), "Serving Cell Info");
    EXPECT_EQ(back().text(), "Orvane");
    EXPECT_EQ(back().accessibleName(), "Back to Orvane");
    clickRow(1);
    EXPECT_EQ(title(), "PLMN");
    EXPECT_EQ(row(0)->accessibleName(), "MCC, 262");
    EXPECT_EQ(back().text(), "Serving Cell Info");
    QTest::mouseClick(&back(), Qt::LeftButton);
    turnEvents();
    EXPECT_EQ(title(), "Serving Cell Info");
    QTest::mouseClick(&back(), Qt::LeftButton);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    EXPECT_TRUE(back().isHidden());
}

TEST_F(BrowsingTest, PressOnAValueOpensNothing)
{
    clickRow(0);
    EXPECT_EQ(title(), "Orvane");
    EXPECT_FALSE(row(0)->isPressed());
}

TEST_F(BrowsingTest, WholeRowIsThere)
{
    QTest::mouseClick(&table(), Qt::LeftButton, {}, QPoint(358, 44 + 42));
    turnEvents();
    EXPECT_EQ(title(), "Serving Cell Info");
}

TEST_F(BrowsingTest, PressBelowTheLastRowDoesNothing)
{
    QTest::mouseClick(&table(), Qt::LeftButton, {}, QPoint(100, 300));
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, EnterOpensTheKeyboardsRow)
{
    QTest::keyClick(&table(), Qt::Key_Down);
    QTest::keyClick(&table(), Qt::Key_Down);
    QTest::keyClick(&table(), Qt::Key_Return);
    turnEvents();
    EXPECT_EQ(title(), "Serving Cell Info");
    EXPECT_TRUE(frame().focusWidget() == &table()) << "the keyboard goes with it";
}

TEST_F(BrowsingTest, ReturnPressesTheWayBack)
{
    open();
    QTest::keyClick(&back(), Qt::Key_Return);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, EscapeGoesBack)
{
    open();
    QTest::keyClick(&table(), Qt::Key_Escape);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    QTest::keyClick(&table(), Qt::Key_Escape);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, AltLeftGoesBack)
{
    open();
    QTest::keyClick(&table(), Qt::Key_Left, Qt::AltModifier);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, MousesBackButtonGoesBack)
{
    open();
    QTest::mouseClick(&table(), Qt::BackButton, {}, middleOf(0));
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, SwipeFromTheLeftEdgeGoesBack)
{
    open();
    swipe(5, 165);
    EXPECT_EQ(topPane().x(), 160) << "it follows the finger";
    QTest::touchEvent(&table(), touchScreen()).release(0, {165, kSwipeY}, &frame());
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    EXPECT_EQ(topPane().x(), 0);
}

TEST_F(BrowsingTest, DragWithTheMouseFromTheLeftEdgeGoesBack)
{
    open();
    constexpr int kTo = 5 + 360 * 54 / 100;
    QTest::mousePress(frame().windowHandle(), Qt::LeftButton, {}, {5, kSwipeY});
    for (int x = 10; x <= kTo; x += 5)
        QTest::mouseMove(frame().windowHandle(), {x, kSwipeY});
    QTest::mouseMove(frame().windowHandle(), {kTo, kSwipeY});
    EXPECT_EQ(topPane().x(), kTo - 5) << "it follows the mouse";
    QTest::mouseRelease(frame().windowHandle(), Qt::LeftButton, {}, {kTo, kSwipeY});
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(BrowsingTest, SwipeThatIsTooShortStays)
{
    open();
    swipe(5, 75);
    EXPECT_EQ(topPane().x(), 70);
    QTest::touchEvent(&table(), touchScreen()).release(0, {75, kSwipeY}, &frame());
    turnEvents();
    EXPECT_EQ(title(), "Serving Cell Info");
    EXPECT_EQ(topPane().x(), 0);
}

TEST_F(BrowsingTest, SwipeDuringWhichAnAlertCameGoesBackAllTheSame)
{
    open();
    swipe(5, 165);
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    QTest::touchEvent(&table(), touchScreen()).release(0, {165, kSwipeY}, &frame());
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    EXPECT_TRUE(screen.alert());
}

TEST_F(BrowsingTest, SwipeAtTheRootDoesNothing)
{
    QTest::touchEvent(&table(), touchScreen()).press(0, {5, 200});
    QTest::touchEvent(&table(), touchScreen()).move(0, {100, 200});
    QTest::touchEvent(&table(), touchScreen()).release(0, {200, 200});
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    EXPECT_EQ(topPane().x(), 0);
}

TEST_F(BrowsingTest, ClosingTheWindowAndControlQAskTheProgramToEnd)
{
    frame().close();
    EXPECT_EQ(closeCount, 1);
    EXPECT_TRUE(frame().isVisible()) << "the program takes it off the screen in its own order";
    QTest::keyClick(&frame(), Qt::Key_Q, Qt::ControlModifier);
    EXPECT_EQ(closeCount, 2);
}

TEST_F(BrowsingTest, WindowIsThereAsLongAsThereIsAKeyWindow)
{
    EXPECT_TRUE(frame().isVisible());
    screen.setKeyWindow(nullptr);
    turnEvents();
    EXPECT_FALSE(frame().isVisible());
}

} // namespace

} // namespace orvane
