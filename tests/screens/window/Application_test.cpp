#include "LogGenerator/support/PacketBuilder.h"
#include "screens/window/BusyIndicator.h"
#include "screens/window/EmptyView.h"
#include "screens/window/FlatButton.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/TextLine.h"
#include "screens/window/TitleBar.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowedApplication.h"

#include <QLineEdit>
#include <QTest>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

class ApplicationTest : public WindowedApplication
{
protected:
    void refreshWithServingCell()
    {
        ASSERT_TRUE(server.sendLogMessage(PacketBuilder(0xB0C2, 38).put16(14, 9).bytes()));
        turn(2s);
    }
    [[nodiscard]] QString status() const
    {
        return dynamic_cast<TextLine&>(*frame().toolbar().itemWidget(1)).text();
    }
    [[nodiscard]] bool isBusy() const
    {
        return dynamic_cast<BusyIndicator&>(*frame().toolbar().itemWidget(0)).isTurning();
    }
};

TEST_F(ApplicationTest, FromTheFirstConnectionToAValue)
{
    app.applicationDidFinishLaunching();
    turnEvents();
    EXPECT_EQ(status(), "Connecting...");
    EXPECT_TRUE(isBusy());
    EXPECT_TRUE(frame().deck().top()->emptyView().isVisible());
    queue.runPending();
    refreshWithServingCell();
    EXPECT_EQ(status(), "Updated 2026-11-21 at 10:00:00");
    EXPECT_FALSE(isBusy());
    EXPECT_FALSE(frame().deck().top()->emptyView().isVisible());
    openRow("Serving Cell Info");
    EXPECT_EQ(frame().titleBar().title(), "Serving Cell Info");
    const std::size_t identity = rowOf("Physical Cell ID");
    ASSERT_TRUE(table().rowWidget(identity));
    EXPECT_EQ(status(), "Updated 2026-11-21 at 10:00:00");
}

TEST_F(ApplicationTest, KilledServerAndItsReturnShowInStatusAndBusyIndicator)
{
    launch();
    refreshWithServingCell();
    ASSERT_FALSE(isBusy());
    server.die();
    turn(6s);
    EXPECT_EQ(status(), "Connecting...");
    EXPECT_TRUE(isBusy());
    EXPECT_GT(table().rowCount(), 0U) << "rows stay as they were";
    ASSERT_TRUE(server.restart());
    turn(6s);
    refreshWithServingCell();
    EXPECT_EQ(status(), "Updated 2026-11-21 at 10:00:00");
    EXPECT_FALSE(isBusy());
}

TEST_F(ApplicationTest, SavesAFileWhileRefreshesGoOn)
{
    launch();
    refreshWithServingCell();
    QTest::mouseClick(frame().toolbar().itemWidget(3), Qt::LeftButton);
    turnEvents();
    ASSERT_TRUE(frame().sheet().isVisible());
    auto* field = frame().findChild<QLineEdit*>("saveDescription");
    QTest::keyClicks(field, "on the ");
    refreshWithServingCell();
    QTest::keyClicks(field, "bridge");
    EXPECT_EQ(field->text(), "on the bridge");
    QTest::mouseClick(frame().findChild<QAbstractButton*>("saveButton"), Qt::LeftButton);
    turn(0s);
    EXPECT_FALSE(frame().sheet().isVisible());
    const std::string path =
        files.located(std::string(kLogFolder) + "/OrvaneSnapshot-1795255200.orvane");
    const auto content = readFile(path);
    ASSERT_TRUE(content);
    const std::string text(content->begin(), content->end());
    EXPECT_NE(text.find("<string>on the bridge</string>"), std::string::npos);
}

TEST_F(ApplicationTest, ProgramsEndTakesTheWindowOffTheScreen)
{
    launch();
    EXPECT_TRUE(frame().isVisible());
    app.applicationWillTerminate();
    turnEvents();
    EXPECT_FALSE(frame().isVisible());
}

} // namespace

} // namespace orvane
