// docs/window.md says what the window does.

#include "doubles/FakePlayback.h"
#include "platform/services/FileSystem.h"
#include "screens/window/FlatButton.h"
#include "screens/window/PlaybackBar.h"
#include "screens/window/WindowTest.h"
#include "support/Paths.h"

#include <gmock/gmock.h>

#include <QHelpEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QScrollBar>
#include <QShortcut>
#include <QSlider>
#include <QTest>
#include <QToolTip>
#include <QWheelEvent>

#include <map>
#include <set>

namespace orvane
{

namespace
{

using ::testing::UnorderedElementsAreArray;

// The first cells of the table below a heading of the page.
QStringList firstCells(const QString& heading)
{
    const auto page = readFile(shippedResourcesPath() + "/../docs/window.md");
    EXPECT_TRUE(page);
    QStringList cells;
    bool isBelow = false;
    const QByteArray bytes(reinterpret_cast<const char*>(page->data()),
                           static_cast<qsizetype>(page->size()));
    for (const QString& line : QString::fromUtf8(bytes).split('\n')) {
        if (line.startsWith("## "))
            isBelow = line == "## " + heading;
        if (isBelow && line.startsWith("| "))
            cells += line.split('|').at(1).trimmed();
    }
    EXPECT_GT(cells.size(), 2) << heading.toStdString();
    return cells.mid(2); // without the table's head
}

// The same, each part between commas alone.
std::set<std::string> firstWords(const QString& heading)
{
    std::set<std::string> words;
    for (const QString& cell : firstCells(heading))
        for (const QString& word : cell.split(", "))
            words.insert(word.toStdString());
    return words;
}

const std::map<int, std::string> kNamesOfKeys = {
    {Qt::Key_Up,       "Up"       },
    {Qt::Key_Down,     "Down"     },
    {Qt::Key_PageUp,   "Page Up"  },
    {Qt::Key_PageDown, "Page Down"},
    {Qt::Key_Home,     "Home"     },
    {Qt::Key_End,      "End"      },
    {Qt::Key_Left,     "Left"     },
    {Qt::Key_Right,    "Right"    },
    {Qt::Key_Return,   "Enter"    },
    {Qt::Key_Enter,    "Enter"    },
    {Qt::Key_Space,    "Space"    },
    {Qt::Key_Select,   "Select"   },
    {Qt::Key_Escape,   "Escape"   },
    {Qt::Key_Back,     "Back"     },
    {Qt::Key_Tab,      "Tab"      },
    {Qt::Key_Backtab,  "Shift-Tab"}
};

std::string nameOf(int key)
{
    const auto found = kNamesOfKeys.find(key);
    return found == kNamesOfKeys.end() ? QKeySequence(key).toString().toStdString() : found->second;
}

std::vector<int> keysOfAKeyboard()
{
    std::vector<int> keys;
    for (int key = Qt::Key_Space; key <= Qt::Key_AsciiTilde; ++key)
        keys.push_back(key);
    for (int key = Qt::Key_Escape; key <= Qt::Key_PageDown; ++key)
        keys.push_back(key);
    for (int key = Qt::Key_F1; key <= Qt::Key_F12; ++key)
        keys.push_back(key);
    keys.push_back(Qt::Key_Select);
    return keys;
}

class WindowPageTest : public WindowTest
{
protected:
    WindowPageTest()
    {
        std::vector<NodePointer> rows{groupNode("Group", {}),
                                      valueNode("Long", std::string(100, '7')),
                                      groupNode(std::string(100, 'n'), {})};
        for (int i = 0; i < 50; ++i)
            rows.push_back(valueNode("Row " + std::to_string(i), "1"));
        groups = rootNode({groupNode("Top", std::move(rows))});
        show(groups);
        clickRow(0);
    }

    void drag(QPoint from, QPoint to)
    {
        constexpr int kSteps = 8;
        QTest::touchEvent(&table(), touchScreen()).press(0, from, &frame());
        for (int i = 1; i <= kSteps; ++i) {
            QTest::qWait(10); // a finger has a speed
            QTest::touchEvent(&table(), touchScreen())
                .move(0, from + (to - from) * i / kSteps, &frame());
        }
        QTest::touchEvent(&table(), touchScreen()).release(0, to, &frame());
        turnEvents();
    }
    void wheel(QPoint angle, Qt::KeyboardModifiers modifiers)
    {
        const QPointF position = middleOf(1);
        QWheelEvent event(position, table().mapToGlobal(position), {}, angle, Qt::NoButton,
                          modifiers, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(&table(), &event);
    }
    // Of a row, in the window.
    [[nodiscard]] QPoint placeOf(std::size_t index) const
    {
        return table().mapTo(&frame(), middleOf(index));
    }
    [[nodiscard]] int scrolled() const { return table().scrollBar().value(); }

    NodePointer groups;
};

TEST_F(WindowPageTest, ListsTheKeysThatDoSomethingInAPaneAndNoOthers)
{
    std::set<std::string> working;
    for (const int key : keysOfAKeyboard()) {
        if (title() != "Top") { // the key before has opened another pane
            show(groups);
            clickRow(0);
        }
        QKeyEvent press(QEvent::KeyPress, key, Qt::NoModifier);
        QCoreApplication::sendEvent(&table(), &press);
        turnEvents();
        if (press.isAccepted())
            working.insert(nameOf(key));
    }
    for (const QShortcut* shortcut : frame().findChildren<QShortcut*>()) {
        const QKeyCombination keys = shortcut->key()[0];
        std::string name = nameOf(keys.key());
        if (keys.keyboardModifiers() & Qt::ControlModifier)
            name = "Ctrl-" + name;
        if (keys.keyboardModifiers() & Qt::AltModifier)
            name = "Alt-" + name;
        working.insert(name);
    }
    EXPECT_THAT(firstWords("Keys"), UnorderedElementsAreArray(working));
}

TEST_F(WindowPageTest, EveryGestureDoesSomething)
{
    const std::map<std::string, std::function<void()>> gestures = {
        {"tap or click a row",
         [this] {
             clickRow(0);
             EXPECT_EQ(title(), "Group");
         }                                                       },
        {"drag up or down, flick",
         [this] {
             drag(placeOf(9), placeOf(9) - QPoint(0, 150));
             EXPECT_GT(scrolled(), 50);
         }                                                       },
        {"drag a row sideways",
         [this] {
             drag(placeOf(1), placeOf(1) - QPoint(120, 0));
             EXPECT_GT(row(1)->sideways(), 50);
         }                                                       },
        {"swipe right from the left edge",
         [this] {
             drag({5, placeOf(4).y()}, {200, placeOf(4).y()});
             EXPECT_EQ(title(), "Orvane");
         }                                                       },
        {"turn the wheel",
         [this] {
             wheel({0, -120}, {});
             EXPECT_EQ(scrolled(), 88) << "two rows";
         }                                                       },
        {"turn the wheel with Shift, or sideways",
         [this] {
             wheel({0, -120}, Qt::ShiftModifier);
             const double once = row(1)->sideways();
             EXPECT_GT(once, 0);
             wheel({-120, 0}, {});
             EXPECT_GT(row(1)->sideways(), once);
         }                                                       },
        {"press the mouse's back button",
         [this] {
             QTest::mouseClick(&table(), Qt::BackButton, {}, middleOf(0));
             turnEvents();
             EXPECT_EQ(title(), "Orvane");
         }                                                       },
        {"rest the pointer on a row whose name is cut", [this] {
             QHelpEvent event(QEvent::ToolTip, middleOf(2), table().mapToGlobal(middleOf(2)));
             QCoreApplication::sendEvent(&table(), &event);
             EXPECT_EQ(QToolTip::text(), QString(100, 'n'));
         }}
    };
    std::set<std::string> listed;
    for (const QString& gesture : firstCells("Gestures")) {
        listed.insert(gesture.toStdString());
        const auto found = gestures.find(gesture.toStdString());
        ASSERT_NE(found, gestures.end()) << gesture.toStdString();
        show(groups);
        clickRow(0);
        ASSERT_EQ(title(), "Top");
        SCOPED_TRACE(found->first);
        found->second();
    }
    EXPECT_EQ(listed.size(), gestures.size());
}

TEST_F(WindowPageTest, ListsTheControlsOfARecording)
{
    FakePlayback playback;
    screen.setPlayback(&playback);
    std::set<std::string> controls{"Position", "Time"}; // the slider and the field
    EXPECT_EQ(frame().playbackBar().slider().accessibleName(), "Position");
    EXPECT_TRUE(frame().playbackBar().timeField().accessibleName().startsWith("Time"));
    for (const auto& [read, plays] : {
             std::pair(0.5, false), {1.0, false},
               {1.0, true }
    }) {
        playback.read = read;
        playback.plays = plays;
        screen.setNeedsUpdate();
        turnEvents();
        for (const auto* button : frame().playbackBar().findChildren<QAbstractButton*>())
            if (button->isVisible())
                controls.insert(button->accessibleName().toStdString());
    }
    screen.setPlayback(nullptr);
    EXPECT_THAT(firstWords("A recording"), UnorderedElementsAreArray(controls));
}

} // namespace

} // namespace orvane
