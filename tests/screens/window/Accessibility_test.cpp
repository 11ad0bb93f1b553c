#include "doubles/FakePlayback.h"
#include "screens/toolkit/AlertView.h"
#include "screens/window/FlatButton.h"
#include "screens/window/PlaybackBar.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/TitleBar.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowTest.h"

#include <QAccessible>
#include <QLineEdit>
#include <QSlider>
#include <QTest>

#include <set>

namespace orvane
{

namespace
{

class AccessibilityTest : public WindowTest
{
protected:
    AccessibilityTest()
    {
        show(rootNode({groupNode("Group", {valueNode("Key", "Value")}), valueNode("A", "1")}));
        setStatus("Updated now", false);
    }
    ~AccessibilityTest() override { screen.setPlayback(nullptr); }

    void play()
    {
        playback.note = "198 bytes could not be placed";
        screen.setPlayback(&playback);
        turnEvents();
    }

    // Every element that can be seen has a role, and a name unless it only holds others.
    void expectNamesAndRoles() const
    {
        expectNamesAndRoles(QAccessible::queryAccessibleInterface(&frame()), "window");
    }
    // Presses Tab until the keyboard is where it was, and returns where it went.
    std::set<QWidget*> stopsOfTab() const
    {
        std::set<QWidget*> stops;
        for (int i = 0; i < 100 && frame().focusWidget(); ++i) {
            if (!stops.insert(frame().focusWidget()).second)
                return stops;
            QTest::keyClick(frame().focusWidget(), Qt::Key_Tab);
        }
        ADD_FAILURE() << "Tab does not come back";
        return stops;
    }

    FakePlayback playback;

private:
    void expectNamesAndRoles(QAccessibleInterface* element, const std::string& path) const
    {
        ASSERT_TRUE(element) << path;
        const QString name = element->text(QAccessible::Name);
        const std::string here = path + " > " + std::to_string(element->role()) + " \"" +
                                 name.toStdString() + "\" " +
                                 element->object()->metaObject()->className();
        EXPECT_NE(element->role(), QAccessible::NoRole) << here;
        EXPECT_NE(element->role(), QAccessible::Client) << here;
        // A grouping only holds others. A field's own value is its text.
        if (element->role() != QAccessible::Grouping) {
            EXPECT_FALSE(name.isEmpty()) << here;
        }
        for (int i = 0; i < element->childCount(); ++i) {
            QAccessibleInterface* child = element->child(i);
            if (child && !child->state().invisible)
                expectNamesAndRoles(child, here);
        }
    }
};

TEST_F(AccessibilityTest, EveryElementOfAPaneHasANameAndARole)
{
    expectNamesAndRoles();
    clickRow(0);
    expectNamesAndRoles();
}

TEST_F(AccessibilityTest, EveryElementOfAnEmptyPaneHasANameAndARole)
{
    refresh(nullptr);
    setStatus("Connecting", true);
    expectNamesAndRoles();
    QAccessibleInterface* empty = QAccessible::queryAccessibleInterface(
        topPane().findChild<QWidget*>({}, Qt::FindDirectChildrenOnly));
    ASSERT_TRUE(empty);
}

TEST_F(AccessibilityTest, EveryElementOfTheControlsHasANameAndARole)
{
    play();
    expectNamesAndRoles();
    playback.takesText = false;
    frame().playbackBar().timeField().setFocus();
    QTest::keyClicks(&frame().playbackBar().timeField(), "noon\r");
    turnEvents();
    expectNamesAndRoles();
    playback.read = 0.5;
    screen.setNeedsUpdate();
    turnEvents();
    expectNamesAndRoles();
}

TEST_F(AccessibilityTest, EveryElementOfTheSaveScreenAndOfAnAlertHasANameAndARole)
{
    showSaveView();
    turnEvents();
    ASSERT_TRUE(frame().sheet().isVisible());
    expectNamesAndRoles();
    screen.showAlert(std::make_unique<AlertView>("File Error", "It is full", "Close"));
    turnEvents();
    expectNamesAndRoles();
    screen.dismissAlert();
    closeSaveView();
    turnEvents();
}

TEST_F(AccessibilityTest, TabReachesEverythingThatCanBePressedOrTypedInto)
{
    clickRow(0);
    play();
    table().setFocus();
    const std::set<QWidget*> stops = stopsOfTab();
    EXPECT_TRUE(stops.contains(&table()));
    EXPECT_TRUE(stops.contains(&frame().titleBar().backButton()));
    EXPECT_TRUE(stops.contains(&frame().playbackBar().slider()));
    EXPECT_TRUE(stops.contains(&frame().playbackBar().timeField()));
    for (QAbstractButton* button : frame().findChildren<QAbstractButton*>())
        if (button->isVisible() && button->isEnabled()) {
            EXPECT_TRUE(stops.contains(button)) << button->accessibleName().toStdString();
        }
}

TEST_F(AccessibilityTest, TabReachesTheSaveScreensPartsAndNothingBehindIt)
{
    showSaveView();
    turnEvents();
    const std::set<QWidget*> stops = stopsOfTab();
    for (QAbstractButton* button : frame().sheet().findChildren<QAbstractButton*>())
        EXPECT_TRUE(stops.contains(button)) << button->accessibleName().toStdString();
    for (QWidget* stop : stops)
        EXPECT_TRUE(frame().sheet().isAncestorOf(stop));
    closeSaveView();
    turnEvents();
}

} // namespace

} // namespace orvane
