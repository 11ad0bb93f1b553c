#include "screens/window/DesktopColours.h"
#include "screens/window/EmptyView.h"
#include "screens/window/FlatButton.h"
#include "screens/window/Theme.h"
#include "screens/window/TitleBar.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowTest.h"

#include <QApplication>
#include <QScrollBar>
#include <QTest>

namespace orvane
{

namespace
{

using ChromeTest = WindowTest;

class SimulatedChromeTest : public WindowTest
{
protected:
    SimulatedChromeTest()
        : WindowTest([] {
              auto settings = stillSettings();
              settings.isSimulated = true;
              return settings;
          }())
    {
    }
};

// Sets the desktop's palette during its lifetime.
class DarkDesktop
{
public:
    DarkDesktop()
    {
        QPalette dark;
        dark.setColor(QPalette::Window, QColor(30, 30, 30));
        dark.setColor(QPalette::WindowText, Qt::white);
        QApplication::setPalette(dark);
        turnEvents();
    }
    ~DarkDesktop() { QApplication::setPalette(_earlier); }
    DarkDesktop(const DarkDesktop&) = delete;
    DarkDesktop& operator=(const DarkDesktop&) = delete;

private:
    QPalette _earlier = QApplication::palette();
};

NodePointer manyRows()
{
    std::vector<NodePointer> rows;
    for (int i = 0; i < 100; ++i)
        rows.push_back(valueNode("Row " + std::to_string(i), std::to_string(i)));
    return rootNode(std::move(rows));
}

TEST_F(ChromeTest, BeforeAnyDataThePersonSeesWhatIsWaitedForAndWhatToDo)
{
    show(nullptr);
    EXPECT_TRUE(topPane().emptyView().isVisible());
    EXPECT_EQ(topPane().emptyView().text(),
              "No data yet\nWaiting for the telephony server\n"
              "Start telephonyd, or try the simulated phone: orvane --demo");
    EXPECT_EQ(table().rowCount(), 0U) << "it is no row";
}

TEST_F(ChromeTest, ConnectedPaneWithoutRowsSaysNoDataYetAlone)
{
    show(nullptr);
    setStatus("Updated", false);
    EXPECT_EQ(topPane().emptyView().text(), "No data yet");
    refresh(rootNode({valueNode("Technology", "LTE")}));
    EXPECT_FALSE(topPane().emptyView().isVisible());
}

TEST_F(SimulatedChromeTest, SimulatedPhoneIsMarked)
{
    show(rootNode({valueNode("Technology", "LTE")}));
    EXPECT_EQ(frame().titleBar().accessibleDescription(), "Simulated phone");
    EXPECT_EQ(frame().windowTitle(), "Orvane (simulated phone)");
    EXPECT_EQ(QGuiApplication::applicationDisplayName(), QCoreApplication::applicationName())
        << "or Qt adds it once more";
}

TEST_F(SimulatedChromeTest, WindowsTitleNamesThePaneAndTheProgram)
{
    show(rootNode({groupNode("Group", {})}));
    clickRow(0);
    EXPECT_EQ(frame().windowTitle(), "Group \u2014 Orvane (simulated phone)");
}

TEST_F(ChromeTest, RealPhoneIsNotMarked)
{
    show(rootNode({valueNode("Technology", "LTE")}));
    EXPECT_EQ(frame().titleBar().accessibleDescription(), "");
    EXPECT_EQ(frame().windowTitle(), "Orvane");
}

TEST_F(ChromeTest, LightAndDarkFollowTheDesktop)
{
    show(rootNode({valueNode("Technology", "LTE")}));
    const QPoint emptyPlace(180, 400);
    EXPECT_GT(pictureOf(frame()).pixelColor(emptyPlace).lightness(), 200);
    {
        const DarkDesktop dark;
        EXPECT_LT(pictureOf(frame()).pixelColor(emptyPlace).lightness(), 60);
    }
    turnEvents();
    EXPECT_GT(pictureOf(frame()).pixelColor(emptyPlace).lightness(), 200);
}

TEST_F(ChromeTest, DesktopsWishForDarkAndLightIsFollowed)
{
    show(rootNode({valueNode("Technology", "LTE")}));
    const QPoint emptyPlace(180, 400);
    DesktopColours::apply(DesktopColours::Scheme::Dark);
    turnEvents();
    EXPECT_LT(pictureOf(frame()).pixelColor(emptyPlace).lightness(), 60);
    for (const auto scheme :
         {DesktopColours::Scheme::Light, DesktopColours::Scheme::NoPreference}) {
        DesktopColours::apply(scheme);
        turnEvents();
        EXPECT_GT(pictureOf(frame()).pixelColor(emptyPlace).lightness(), 200);
    }
}

TEST_F(ChromeTest, WishForTheOtherOfLightAndDarkIsFollowedOnEitherDesktop)
{
    using Scheme = DesktopColours::Scheme;
    const QPalette light(Qt::white);
    const QPalette dark(QColor(30, 30, 30));
    const auto lightness = [](Scheme scheme, const QPalette& desktop) {
        return DesktopColours::paletteFor(scheme, desktop).color(QPalette::Window).lightness();
    };
    EXPECT_GT(lightness(Scheme::Light, dark), 200);
    EXPECT_LT(lightness(Scheme::Dark, light), 60);
    const auto isDesktops = [](Scheme scheme, const QPalette& desktop) {
        return DesktopColours::paletteFor(scheme, desktop).resolveMask() == 0;
    };
    EXPECT_TRUE(isDesktops(Scheme::Dark, dark));
    EXPECT_TRUE(isDesktops(Scheme::Light, light));
    EXPECT_TRUE(isDesktops(Scheme::NoPreference, dark));
    EXPECT_FALSE(isDesktops(Scheme::Light, dark));
}

TEST_F(ChromeTest, TextsStandOutInLightAndDark)
{
    show(nullptr);
    const auto contrast = [this] {
        const Theme& theme = Theme::of(frame());
        return std::abs(theme.text.lightness() - theme.background.lightness());
    };
    EXPECT_GT(contrast(), 150);
    const DarkDesktop dark;
    EXPECT_GT(contrast(), 150);
}

TEST_F(ChromeTest, TurnedPhoneLaysOutRowsAnewAndStaysWhereItWas)
{
    show(manyRows());
    table().scrollBar().setValue(880);
    turnEvents();
    frame().resize(640, 360);
    turnEvents();
    EXPECT_EQ(screen.bounds(), (Rect{0, 0, 640, 360}));
    EXPECT_EQ(screen.keyWindow()->frame(), screen.bounds());
    EXPECT_EQ(table().scrollBar().value(), 880);
    ASSERT_TRUE(row(20));
    EXPECT_EQ(row(20)->width(), 640);
    EXPECT_NEAR(row(20)->content().strips.front().labels.back().frame.right(), 630, 0.01);
    frame().resize(360, 640);
    turnEvents();
    EXPECT_EQ(table().scrollBar().value(), 880);
    EXPECT_NEAR(row(20)->content().strips.front().labels.back().frame.right(), 350, 0.01);
}

TEST_F(ChromeTest, PaneBeneathIsLaidOutForTheNewWidthWhenOneGoesBackToIt)
{
    show(rootNode({groupNode("Group", {valueNode("Key", "1")}), valueNode("Key", "2")}));
    clickRow(0);
    frame().resize(640, 360);
    turnEvents();
    frame().goBack();
    turnEvents();
    EXPECT_EQ(row(1)->width(), 640);
    EXPECT_NEAR(row(1)->content().strips.front().labels.back().frame.right(), 630, 0.01);
}

TEST_F(ChromeTest, LongTitleLeavesRoomForTheWayBack)
{
    const std::string name = "A name that is far too long for the title bar of any phone";
    show(rootNode({groupNode(name, {})}));
    clickRow(0);
    const FlatButton& back = frame().titleBar().backButton();
    EXPECT_GE(back.width(), 44);
    EXPECT_GE(back.height(), 44);
}

TEST_F(ChromeTest, TabReachesEverythingThatCanBePressed)
{
    show(rootNode({groupNode("Group", {valueNode("Key", "1")})}));
    clickRow(0);
    table().setFocus();
    std::vector<QWidget*> reached;
    for (int i = 0; i < 3; ++i) {
        QTest::keyClick(frame().focusWidget(), Qt::Key_Tab);
        reached.push_back(frame().focusWidget());
    }
    EXPECT_EQ(std::count(reached.begin(), reached.end(), &frame().titleBar().backButton()), 1);
    EXPECT_EQ(std::count(reached.begin(), reached.end(), frame().toolbar().itemWidget(3)), 1);
    EXPECT_EQ(std::count(reached.begin(), reached.end(), &table()), 1);
}

} // namespace

} // namespace orvane
