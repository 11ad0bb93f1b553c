#include "screens/window/TableWidget.h"

#include "screens/window/WindowTest.h"

#include <QAccessible>
#include <QHelpEvent>
#include <QScrollBar>
#include <QTest>
#include <QTextDocument>
#include <QToolTip>

namespace orvane
{

namespace
{

class TableWidgetTest : public WindowTest
{
protected:
    void hoverOver(std::size_t index)
    {
        QHelpEvent event(QEvent::ToolTip, middleOf(index), table().mapToGlobal(middleOf(index)));
        QCoreApplication::sendEvent(&table(), &event);
    }
};

NodePointer manyRows(int count)
{
    std::vector<NodePointer> rows;
    for (int i = 0; i < count; ++i)
        rows.push_back(valueNode("Row " + std::to_string(i), std::to_string(i)));
    return rootNode(std::move(rows));
}

// The frame of the label with that text, in the row's coordinates.
QRectF frameOf(const RowWidget& row, const QString& text)
{
    for (const DrawnLabel& label : row.content().labels)
        if (label.text == text)
            return label.frame;
    for (const DrawnStrip& strip : row.content().strips)
        for (const DrawnLabel& label : strip.labels)
            if (label.text == text)
                return label.frame.translated(strip.frame.topLeft());
    return {};
}

TEST_F(TableWidgetTest, RowHasItsKeyAtTheLeftAndItsValueFlushRight)
{
    show(rootNode({valueNode("Cell Identity", "1234")}));
    ASSERT_TRUE(row(0));
    EXPECT_EQ(row(0)->geometry(), QRect(0, 0, 360, 44));
    const QRectF key = frameOf(*row(0), "Cell Identity");
    EXPECT_EQ(key.left(), 10);
    EXPECT_NEAR(key.center().y(), 22, 0.01);
    EXPECT_NEAR(frameOf(*row(0), "1234").right(), 350, 0.01);
    EXPECT_EQ(row(0)->content().strips.front().labels.back().alignment,
              Qt::AlignRight | Qt::AlignVCenter);
}

TEST_F(TableWidgetTest, GroupLeadsOnAndAValueDoesNot)
{
    show(rootNode({groupNode("Group", {}), valueNode("Value", "1")}));
    EXPECT_EQ(row(0)->content().accessory, CellAccessory::DisclosureIndicator);
    EXPECT_EQ(row(1)->content().accessory, CellAccessory::None);
}

TEST_F(TableWidgetTest, LongNameOfAGroupEndsBeforeTheDisclosureMark)
{
    show(rootNode({groupNode(std::string(100, 'x'), {})}));
    const DrawnLabel& key = row(0)->content().labels.front();
    EXPECT_EQ(key.text.size(), 100);
    EXPECT_EQ(key.frame.left(), 10);
    EXPECT_EQ(key.frame.right(), 360 - TableViewCell::kAccessoryWidth);
}

TEST_F(TableWidgetTest, NameOfAGroupThatIsALittleTooLongIsWrittenSmaller)
{
    const std::string name(34, 'n');
    show(rootNode({groupNode("Short", {}), groupNode(name, {})}));
    const DrawnLabel& key = row(1)->content().labels.front();
    const int size = key.font.pixelSize();
    EXPECT_EQ(row(0)->content().labels.front().font.pixelSize(), 15);
    EXPECT_LT(size, 15);
    EXPECT_GE(size, 12);
    EXPECT_FALSE(key.isCut());
}

TEST_F(TableWidgetTest, NameOfAGroupThatIsLongerStillTakesTwoLines)
{
    show(rootNode({groupNode("Connected mode LTE Intra-frequency Measurement Configuration", {})}));
    const DrawnLabel& key = row(0)->content().labels.front();
    EXPECT_TRUE(key.isWrapped);
    EXPECT_FALSE(key.isCut());
    EXPECT_NEAR(key.frame.center().y(), 22, 0.01);
    EXPECT_TRUE(QRectF(row(0)->rect()).contains(key.frame));
    EXPECT_EQ(row(0)->accessibleName(),
              "Connected mode LTE Intra-frequency Measurement Configuration");
}

TEST_F(TableWidgetTest, NameThatIsCutIsTheRowsToolTip)
{
    const QString name(100, 'x');
    show(rootNode({groupNode("Short", {}), groupNode(name.toStdString(), {})}));
    EXPECT_EQ(row(1)->content().labels.front().font.pixelSize(), 12);
    hoverOver(0);
    EXPECT_FALSE(QToolTip::isVisible());
    hoverOver(1);
    EXPECT_EQ(QToolTip::text(), name);
    hoverOver(0);
    EXPECT_TRUE(turnEventsUntil([] { return !QToolTip::isVisible(); }));
}

TEST_F(TableWidgetTest, NameThatLooksLikeHtmlIsATextInTheToolTip)
{
    const std::string name = "<img src='/dev/zero'><b>" + std::string(100, 'x') + "</b>&amp;";
    show(rootNode({groupNode(name, {})}));
    hoverOver(0);
    ASSERT_TRUE(QToolTip::isVisible());
    QTextDocument shown;
    shown.setHtml(QToolTip::text());
    EXPECT_EQ(shown.toPlainText().toStdString(), name);
}

TEST_F(TableWidgetTest, RowsUnderOneAnotherTouch)
{
    show(manyRows(3));
    EXPECT_EQ(row(1)->geometry(), QRect(0, 44, 360, 44));
    EXPECT_EQ(row(2)->geometry(), QRect(0, 88, 360, 44));
}

TEST_F(TableWidgetTest, OnlyVisibleRowsHaveWidgets)
{
    show(manyRows(1000));
    EXPECT_EQ(table().rowCount(), 1000U);
    EXPECT_TRUE(row(0));
    EXPECT_FALSE(row(50));
    EXPECT_LT(table().findChildren<QWidget*>().size(), 30);
    table().scrollBar().setValue(44 * 500);
    turnEvents();
    EXPECT_FALSE(row(0));
    ASSERT_TRUE(row(500));
    EXPECT_EQ(row(500)->accessibleName(), "Row 500, 500");
    EXPECT_LT(table().findChildren<QWidget*>().size(), 30);
}

TEST_F(TableWidgetTest, GroupsCellReusedForAValueShowsNoValue)
{
    // One identifier for both kinds of row: the sharing is the panes' own, and shows.
    show(rootNode({groupNode("Row", {})}));
    refresh(rootNode({valueNode("Row", "1234")}));
    EXPECT_EQ(row(0)->content().spokenText(), "Row");
    EXPECT_EQ(row(0)->content().accessory, CellAccessory::None);
}

TEST_F(TableWidgetTest, LineEndsInATextAreDrawnAsSpaces)
{
    show(rootNode({valueNode("Key", "one\ntwo\tthree")}));
    EXPECT_EQ(row(0)->accessibleName(), "Key, one two three");
}

TEST_F(TableWidgetTest, VeryLongTextsAndBrokenOnesAreShownAsFarAsAScreenCan)
{
    show(rootNode({valueNode("Long", std::string(1'000'000, 'x')), valueNode("Broken", "a\xFF")}));
    const DrawnStrip& strip = row(0)->content().strips.front();
    EXPECT_LT(strip.labels.back().text.size(), 5000);
    EXPECT_TRUE(row(1)->accessibleName().startsWith("Broken, a"));
    EXPECT_FALSE(pictureOf(frame()).isNull());
}

TEST_F(TableWidgetTest, ArrowsPagesAndEndsMoveTheKeyboardsRow)
{
    show(manyRows(100));
    EXPECT_FALSE(row(0)->hasRing());
    // The first key shows where the keyboard is.
    QTest::keyClick(&table(), Qt::Key_Down);
    EXPECT_EQ(table().currentRow(), 0U);
    EXPECT_TRUE(row(0)->hasRing());
    QTest::keyClick(&table(), Qt::Key_Down);
    EXPECT_EQ(table().currentRow(), 1U);
    QTest::keyClick(&table(), Qt::Key_PageDown);
    EXPECT_GT(table().currentRow(), 8U);
    QTest::keyClick(&table(), Qt::Key_End);
    EXPECT_EQ(table().currentRow(), 99U);
    ASSERT_TRUE(row(99));
    EXPECT_TRUE(table().rect().contains(row(99)->geometry()));
    EXPECT_TRUE(row(99)->hasRing());
    QTest::keyClick(&table(), Qt::Key_Up);
    EXPECT_EQ(table().currentRow(), 98U);
    QTest::keyClick(&table(), Qt::Key_Home);
    EXPECT_EQ(table().currentRow(), 0U);
    EXPECT_EQ(table().scrollBar().value(), 0);
    QTest::keyClick(&table(), Qt::Key_Up);
    EXPECT_EQ(table().currentRow(), 0U);
}

TEST_F(TableWidgetTest, LeftAndRightScrollALongValue)
{
    show(rootNode({valueNode("Key", std::string(100, '7')), valueNode("Short", "1")}));
    const double range = row(0)->content().sidewaysRange();
    EXPECT_GT(range, 300);
    QTest::keyClick(&table(), Qt::Key_Right);
    EXPECT_EQ(row(0)->sideways(), 80);
    QTest::keyClick(&table(), Qt::Key_Left);
    EXPECT_EQ(row(0)->sideways(), 0);
    QTest::keyClick(&table(), Qt::Key_Left);
    EXPECT_EQ(row(0)->sideways(), 0);
    for (int i = 0; i < 100; ++i)
        QTest::keyClick(&table(), Qt::Key_Right);
    EXPECT_EQ(row(0)->sideways(), range);
    EXPECT_EQ(row(1)->sideways(), 0);
}

TEST_F(TableWidgetTest, ScreenReadersHearWhatRowsAreAndCanPressThem)
{
    show(rootNode({groupNode("Group", {}), valueNode("Key", "1 dBm")}));
    QAccessibleInterface* group = QAccessible::queryAccessibleInterface(row(0));
    QAccessibleInterface* value = QAccessible::queryAccessibleInterface(row(1));
    ASSERT_TRUE(group && value);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(&table())->role(), QAccessible::List);
    EXPECT_EQ(group->role(), QAccessible::Button);
    EXPECT_EQ(value->role(), QAccessible::ListItem);
    EXPECT_EQ(value->text(QAccessible::Name), "Key, 1 dBm");
    EXPECT_FALSE(value->actionInterface()->actionNames().contains(
        QAccessibleActionInterface::pressAction()));
    group->actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    turnEvents();
    EXPECT_EQ(title(), "Group");
}

TEST_F(TableWidgetTest, ScreenReadersFollowTheKeyboard)
{
    show(manyRows(5));
    frame().activateWindow();
    table().setFocus();
    QTest::keyClick(&table(), Qt::Key_Down);
    QTest::keyClick(&table(), Qt::Key_Down);
    ASSERT_TRUE(table().hasFocus());
    QAccessibleInterface* list = QAccessible::queryAccessibleInterface(&table());
    ASSERT_TRUE(list->focusChild());
    EXPECT_EQ(list->focusChild()->text(QAccessible::Name), "Row 1, 1");
    EXPECT_TRUE(list->focusChild()->state().focused);
}

} // namespace

} // namespace orvane
