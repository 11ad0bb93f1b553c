#include "screens/window/TableTouch.h"

#include "screens/window/WindowTest.h"

#include <QElapsedTimer>
#include <QScrollBar>
#include <QScroller>
#include <QTest>
#include <QWheelEvent>

namespace orvane
{

namespace
{

class TableTouchTest : public WindowTest
{
protected:
    TableTouchTest() { show(rows(100)); }

    static NodePointer rows(int count)
    {
        std::vector<NodePointer> children;
        for (int i = 0; i < count; ++i)
            children.push_back(groupNode("Group " + std::to_string(i), {}));
        children[2] = valueNode("Long", std::string(100, '7'));
        return rootNode(std::move(children));
    }

    void touch(QPoint position) { QTest::touchEvent(&table(), touchScreen()).press(0, position); }
    void moveTo(QPoint position)
    {
        QTest::qWait(10); // a finger has a speed
        QTest::touchEvent(&table(), touchScreen()).move(0, position);
    }
    void release(QPoint position)
    {
        QTest::touchEvent(&table(), touchScreen()).release(0, position);
    }
    void drag(QPoint from, QPoint to)
    {
        constexpr int kSteps = 8;
        touch(from);
        for (int i = 1; i <= kSteps; ++i)
            moveTo(from + (to - from) * i / kSteps);
    }
    void mouse(QEvent::Type type, QPointF position)
    {
        constexpr quint64 kFrameMs = 16;
        const auto button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, position, table().mapToGlobal(position), button, Qt::LeftButton,
                          Qt::NoModifier);
        event.setTimestamp(time += kFrameMs);
        QCoreApplication::sendEvent(&table(), &event);
    }
    [[nodiscard]] int scrolled() const { return table().scrollBar().value(); }
    void wheel(QPoint angle, Qt::KeyboardModifiers modifiers = {})
    {
        const QPointF position = middleOf(2);
        QWheelEvent event(position, table().mapToGlobal(position), {}, angle, Qt::NoButton,
                          modifiers, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(&table(), &event);
    }

    quint64 time = 0; // of the mouse's last event, in milliseconds
};

TEST_F(TableTouchTest, TapOpensTheRow)
{
    touch(middleOf(4));
    release(middleOf(4));
    turnEvents();
    EXPECT_EQ(title(), "Group 4");
}

TEST_F(TableTouchTest, RowIsDrawnPressedWhileItIs)
{
    const RowWidget* pressed = row(4);
    const QPoint place = middleOf(4);
    QElapsedTimer sinceTouch;
    sinceTouch.start();
    touch(place);
    EXPECT_TRUE(!pressed->isPressed() || sinceTouch.elapsed() >= 70) << "before it could be a pan";
    EXPECT_TRUE(turnEventsUntil([&] { return pressed->isPressed(); }));
    release(place);
    EXPECT_TRUE(pressed->isPressed()) << "the selected row";
}

TEST_F(TableTouchTest, PanScrollsAndPressesNothing)
{
    const QPoint place = middleOf(8);
    drag(place, place - QPoint(0, 120));
    EXPECT_NEAR(scrolled(), 120, 20);
    EXPECT_FALSE(row(8)->isPressed());
    release(place - QPoint(0, 120));
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(TableTouchTest, PanGoesOnWithMomentumAndATouchStopsIt)
{
    const QPoint place = middleOf(9);
    const QScroller& scroller = *QScroller::scroller(&table());
    // On a busy machine the finger may be too slow for momentum, or the momentum end too soon.
    constexpr int kAttempts = 50;
    bool isInMotion = false;
    for (int attempt = 0; attempt < kAttempts && !isInMotion; ++attempt) {
        table().scrollBar().setValue(0);
        drag(place, place - QPoint(0, 240));
        release(place - QPoint(0, 240));
        const int atRelease = scrolled();
        turnEventsUntil(
            [&] { return scrolled() > atRelease || scroller.state() != QScroller::Scrolling; });
        isInMotion = scrolled() > atRelease && scroller.state() == QScroller::Scrolling;
    }
    ASSERT_TRUE(isInMotion);
    touch(QPoint(100, 100));
    EXPECT_NE(scroller.state(), QScroller::Scrolling);
    release(QPoint(100, 100));
    turnEvents();
    EXPECT_EQ(title(), "Orvane") << "the touch that stops it presses nothing";
}

TEST_F(TableTouchTest, PanSidewaysScrollsTheValueBeneathAlone)
{
    const QPoint place = middleOf(2) + QPoint(100, 0);
    drag(place, place - QPoint(150, 6));
    EXPECT_NEAR(row(2)->sideways(), 150, 25);
    EXPECT_EQ(scrolled(), 0);
    release(place - QPoint(150, 6));
}

TEST_F(TableTouchTest, PanUpwardsOnALongValueLeavesItWhereItIs)
{
    const QPoint place = middleOf(2) + QPoint(100, 0);
    drag(place, place - QPoint(5, 80));
    EXPECT_EQ(scrolled() > 50, true);
    EXPECT_EQ(row(2)->sideways(), 0);
    release(place - QPoint(5, 80));
}

TEST_F(TableTouchTest, CancelledTouchPressesNothing)
{
    touch(middleOf(4));
    QTouchEvent cancel(QEvent::TouchCancel, touchScreen());
    QCoreApplication::sendEvent(&table(), &cancel);
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
    EXPECT_FALSE(row(4)->isPressed());
}

TEST_F(TableTouchTest, MouseDragScrollsToo)
{
    const QPoint place = middleOf(8);
    mouse(QEvent::MouseButtonPress, place);
    for (int i = 1; i <= 8; ++i)
        mouse(QEvent::MouseMove, place - QPoint(0, 15 * i));
    EXPECT_TRUE(turnEventsUntil([&] { return scrolled() > 100; }));
    mouse(QEvent::MouseButtonRelease, place - QPoint(0, 120));
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(TableTouchTest, WheelScrolls)
{
    wheel({0, -120});
    EXPECT_EQ(scrolled(), 88);
    wheel({0, 240});
    EXPECT_EQ(scrolled(), 0);
}

TEST_F(TableTouchTest, SidewaysWheelAndWheelWithShiftScrollALongValue)
{
    wheel({-120, 0});
    EXPECT_EQ(row(2)->sideways(), 88);
    wheel({0, -120}, Qt::ShiftModifier);
    EXPECT_EQ(row(2)->sideways(), 176);
    EXPECT_EQ(scrolled(), 0);
}

} // namespace

} // namespace orvane
