#include "screens/window/PlainText.h"

#include "screens/toolkit/AlertView.h"
#include "screens/window/AlertWidget.h"
#include "screens/window/FlatButton.h"
#include "screens/window/TitleBar.h"
#include "screens/window/WindowTest.h"

#include <QAccessible>
#include <QKeyEvent>
#include <QLabel>
#include <QTest>
#include <QTextDocument>

namespace orvane
{

namespace
{

using PlainTextTest = WindowTest;

const char* const kTexts[] = {
    "plain",
    "a < b & c > d",
    "<b>bold</b>",
    "<img src='/dev/zero'>",
    "<html><body>all</body></html>",
    "<!-- x -->&lt;i&gt;",
    "two  blanks <br> and one",
};

// Reads the text as Qt shows it.
QString shownAsToolTip(const QString& toolTip)
{
    if (!Qt::mightBeRichText(toolTip))
        return toolTip;
    QTextDocument document;
    document.setHtml(toolTip);
    return document.toPlainText();
}

TEST_F(PlainTextTest, ToolTipShowsExactlyTheText)
{
    for (const char* text : kTexts)
        EXPECT_EQ(shownAsToolTip(plainToolTip(text)).toStdString(), text);
}

TEST_F(PlainTextTest, ScreenReaderHearsTheTextOfAToolTipWithoutTags)
{
    FlatButton button(nullptr);
    for (const char* text : kTexts) {
        setPlainToolTip(button, text);
        const QString heard =
            QAccessible::queryAccessibleInterface(&button)->text(QAccessible::Description);
        EXPECT_EQ(heard.toStdString(), text);
    }
}

TEST_F(PlainTextTest, TitleOfAPaneIsPlainEverywhere)
{
    for (const char* text : kTexts) {
        show(rootNode({groupNode(text, {groupNode("Inner", {})})}));
        clickRow(0);
        EXPECT_EQ(title().toStdString(), text);
        EXPECT_EQ(frame().windowTitle(), QString::fromUtf8(text) + " \u2014 Orvane");
        clickRow(0);
        EXPECT_EQ(frame().titleBar().backButton().text().toStdString(), text);
        EXPECT_EQ(shownAsToolTip(frame().titleBar().backButton().toolTip()),
                  QStringLiteral("Back to %1").arg(text));
    }
}

TEST_F(PlainTextTest, WindowsTitleKeepsTheMarkOfChangedDocuments)
{
    show(rootNode({groupNode("A [*] B", {})}));
    clickRow(0);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(&frame())->text(QAccessible::Name),
              QString("A [*] B \u2014 Orvane"));
}

TEST_F(PlainTextTest, AmpersandInATitleIsNoShortcut)
{
    show(rootNode({groupNode("R&D", {groupNode("Inner", {})})}));
    clickRow(0);
    clickRow(0);
    EXPECT_TRUE(frame().titleBar().backButton().shortcut().isEmpty());
    EXPECT_EQ(frame().titleBar().backButton().accessibleName(), "Back to R&D");
    QTest::keyClick(&frame(), Qt::Key_D, Qt::AltModifier);
    turnEvents();
    EXPECT_EQ(title(), "Inner");
}

TEST_F(PlainTextTest, AlertShowsTagsAsText)
{
    show(rootNode({}));
    screen.showAlert(std::make_unique<AlertView>("<h1>T</h1>", "<img src='/dev/zero'>", "<b>&Go"));
    turnEvents();
    for (const QLabel* label : frame().alert().findChildren<QLabel*>())
        EXPECT_EQ(label->textFormat(), Qt::PlainText);
    EXPECT_EQ(frame().alert().button().text(), "<b>&Go");
    EXPECT_EQ(frame().alert().accessibleDescription(), "<img src='/dev/zero'>");
    screen.dismissAlert();
    turnEvents();
}

TEST_F(PlainTextTest, LineHasNoControlsAndAnEnd)
{
    EXPECT_EQ(lineOf("a\tb\nc"), "a b c");
    EXPECT_EQ(lineOf("a\x1b\u009b\u202eb"), QString("a\uFFFD\uFFFDb"));
    EXPECT_EQ(lineOf(std::string(5000, 'x')), QString(4096, 'x') + QChar(0x2026));
}

} // namespace

} // namespace orvane
