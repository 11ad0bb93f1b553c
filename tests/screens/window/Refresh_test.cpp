#include "screens/window/BusyIndicator.h"
#include "screens/window/TextLine.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowTest.h"

#include <QScrollBar>
#include <QTest>

namespace orvane
{

namespace
{

// Counts the paint events of a widget and of its children.
class PaintCounter final : public QObject
{
public:
    explicit PaintCounter(QWidget& widget)
    {
        widget.installEventFilter(this);
        for (QWidget* child : widget.findChildren<QWidget*>())
            child->installEventFilter(this);
    }
    int count = 0;

protected:
    bool eventFilter(QObject*, QEvent* event) override
    {
        count += event->type() == QEvent::Paint;
        return false;
    }
};

class RefreshTest : public WindowTest
{
protected:
    static std::vector<NodePointer> rows(int count, const std::string& value)
    {
        std::vector<NodePointer> all;
        for (int i = 0; i < count; ++i)
            all.push_back(valueNode("Row " + std::to_string(i), value));
        return all;
    }
    static NodePointer tree(int count, const std::string& value)
    {
        return rootNode(rows(count, value));
    }
};

TEST_F(RefreshTest, ChangedValueIsShown)
{
    show(tree(3, "1"));
    refresh(tree(3, "2"));
    EXPECT_EQ(row(1)->accessibleName(), "Row 1, 2");
}

TEST_F(RefreshTest, UnchangedPaneIsNotDrawnAgain)
{
    show(tree(8, "1"));
    setStatus("Updated", false);
    PaintCounter paints(frame());
    refresh(tree(8, "1"));
    EXPECT_EQ(paints.count, 0);
}

TEST_F(RefreshTest, OnlyTheRowThatChangedIsDrawnAgain)
{
    show(tree(8, "1"));
    auto changed = rows(8, "1");
    changed[3] = valueNode("Row 3", "2");
    PaintCounter others(*row(2));
    PaintCounter changing(*row(3));
    refresh(rootNode(changed));
    EXPECT_EQ(others.count, 0);
    EXPECT_EQ(changing.count, 1);
}

TEST_F(RefreshTest, ScrollPositionStays)
{
    show(tree(100, "1"));
    table().scrollBar().setValue(1234);
    refresh(tree(101, "2"));
    EXPECT_EQ(table().scrollBar().value(), 1234);
    refresh(tree(20, "2"));
    EXPECT_EQ(table().scrollBar().value(), table().scrollBar().maximum());
}

TEST_F(RefreshTest, ScrollPositionStaysWhileAnotherPaneIsOnTop)
{
    auto children = rows(100, "1");
    children[50] = groupNode("Group", rows(60, "1"));
    const auto root = rootNode(children);
    show(root);
    table().scrollBar().setValue(44 * 45);
    turnEvents();
    clickRow(50);
    ASSERT_EQ(title(), "Group");
    EXPECT_EQ(table().scrollBar().value(), 0);
    refresh(root);
    frame().goBack();
    turnEvents();
    EXPECT_EQ(table().scrollBar().value(), 44 * 45);
    EXPECT_EQ(row(45)->y(), 0);
}

TEST_F(RefreshTest, SidewaysPositionOfALongValueStays)
{
    show(rootNode({valueNode("Long", std::string(90, '1')), valueNode("Other", "1")}));
    QTest::keyClick(&table(), Qt::Key_Right);
    ASSERT_EQ(row(0)->sideways(), 80);
    refresh(rootNode({valueNode("Long", std::string(90, '2')), valueNode("Other", "1")}));
    EXPECT_EQ(row(0)->sideways(), 80);
}

TEST_F(RefreshTest, AnotherRowInItsPlaceStartsAtTheLeft)
{
    show(rootNode({valueNode("Long", std::string(90, '1'))}));
    QTest::keyClick(&table(), Qt::Key_Right);
    refresh(rootNode({valueNode("Another", std::string(90, '1'))}));
    EXPECT_EQ(row(0)->sideways(), 0);
}

TEST_F(RefreshTest, KeyboardsRowStays)
{
    show(tree(10, "1"));
    for (int i = 0; i < 5; ++i)
        QTest::keyClick(&table(), Qt::Key_Down);
    refresh(tree(10, "2"));
    EXPECT_EQ(table().currentRow(), 4U);
    EXPECT_TRUE(row(4)->hasRing());
    refresh(tree(3, "2"));
    EXPECT_EQ(table().currentRow(), 2U) << "the last one, where it is gone";
}

TEST_F(RefreshTest, PressUnderWayStays)
{
    const auto root = rootNode({groupNode("First", {}), groupNode("Second", {})});
    show(root);
    QTest::mousePress(&table(), Qt::LeftButton, {}, middleOf(1));
    ASSERT_TRUE(turnEventsUntil([&] { return row(1)->isPressed(); }));
    refresh(root);
    EXPECT_TRUE(row(1)->isPressed());
    QTest::mouseRelease(&table(), Qt::LeftButton, {}, middleOf(1));
    turnEvents();
    EXPECT_EQ(title(), "Second");
}

TEST_F(RefreshTest, PressOfARowThatIsAnotherOneNowOpensNothing)
{
    show(rootNode({groupNode("First", {}), groupNode("Second", {})}));
    QTest::mousePress(&table(), Qt::LeftButton, {}, middleOf(1));
    refresh(rootNode({groupNode("First", {}), groupNode("Third", {})}));
    QTest::mouseRelease(&table(), Qt::LeftButton, {}, middleOf(1));
    turnEvents();
    EXPECT_EQ(title(), "Orvane");
}

TEST_F(RefreshTest, StatusAndBusyIndicatorChangeInTheirPlaces)
{
    show(tree(1, "1"));
    auto* busy = dynamic_cast<BusyIndicator*>(frame().toolbar().itemWidget(0));
    auto* status = dynamic_cast<TextLine*>(frame().toolbar().itemWidget(1));
    ASSERT_TRUE(busy && status);
    EXPECT_EQ(status->text(), "Connecting");
    EXPECT_TRUE(busy->isVisible());
    EXPECT_TRUE(busy->isTurning());
    setStatus("Updated 2026-11-21 at 10:00:00", false);
    EXPECT_EQ(status->text(), "Updated 2026-11-21 at 10:00:00");
    EXPECT_FALSE(busy->isVisible());
    EXPECT_FALSE(busy->isTurning());
    setStatus("Connecting...", true);
    EXPECT_TRUE(busy->isVisible());
    EXPECT_EQ(frame().toolbar().itemWidget(0), busy);
    EXPECT_EQ(frame().toolbar().itemWidget(1), status);
}

TEST_F(RefreshTest, BusyIndicatorTurns)
{
    show(tree(1, "1"));
    PaintCounter paints(*frame().toolbar().itemWidget(0));
    EXPECT_TRUE(turnEventsUntil([&] { return paints.count > 3; }));
}

TEST_F(RefreshTest, SaveButtonIsThereWhereSavingIsOffered)
{
    isSavingOffered = false;
    show(tree(1, "1"));
    EXPECT_FALSE(frame().toolbar().itemWidget(3));
    isSavingOffered = true;
    setStatus("Updated", false);
    EXPECT_TRUE(frame().toolbar().itemWidget(3));
}

} // namespace

} // namespace orvane
