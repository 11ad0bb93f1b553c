#include "app/OrvaneApp.h"

#include "LogGenerator/support/PacketBuilder.h"
#include "doubles/FakePreferencesStore.h"
#include "doubles/FakeScreen.h"
#include "doubles/LoopbackTransport.h"
#include "doubles/ScriptedTelephonyServer.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "support/Recording.h"
#include "support/SaveScreen.h"
#include "support/TemporaryDirectory.h"
#include "ui/OrvaneCell.h"
#include "ui/PaneStack.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class OrvaneAppTest : public ::testing::Test
{
protected:
    OrvaneAppTest()
    {
        services.useShippedResources();
        screen.setInterface("OrvaneSaveViewController", [] { return makeSaveScreen(); });
    }

    void launch()
    {
        app.applicationDidFinishLaunching();
        queue.runPending();
    }
    void sendServingCell()
    {
        ASSERT_TRUE(server.sendLogMessage(PacketBuilder(0xB0C2, 38).put16(14, 9).bytes()));
    }
    void makeMarker()
    {
        std::filesystem::create_directories(
            root.path() + "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle");
    }
    void makeLogFolder()
    {
        std::filesystem::create_directories(root.path() + "/var/mobile/Library/Logs/DiagDrop");
    }
    void refresh()
    {
        sendServingCell();
        queue.advance(2s);
    }
    [[nodiscard]] std::vector<std::string> paths() const
    {
        std::vector<std::string> all;
        for (const auto& controller : screen.navigation()->viewControllers())
            all.push_back(dynamic_cast<OrvanePaneController&>(*controller).path());
        return all;
    }
    [[nodiscard]] OrvanePaneController& top() const { return *topPane(*screen.navigation()); }
    [[nodiscard]] std::string shownStatus() const
    {
        return top().statusText() + (top().isBusy() ? " busy" : "");
    }
    // Pushes a pane for the path, whether or not the tree has it.
    void push(const std::string& path)
    {
        screen.navigation()->pushViewController(
            std::make_shared<OrvanePaneController>(nullptr, path, app), true);
    }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    FakePreferencesStore preferences;
    FakeScreen screen;
    OrvaneApp app{
        {queue, ports, client, 2s, [] { return std::optional<std::string>("UUID"); }},
        files,
        preferences
    };
};

} // namespace

TEST_F(OrvaneAppTest, StartsAsConnectingAndTheFirstAttemptComesAfterTheLaunch)
{
    app.applicationDidFinishLaunching();
    EXPECT_EQ(shownStatus(), "Connecting... busy");
    EXPECT_THAT(server.requestedPorts(), IsEmpty());
    queue.runPending();
    EXPECT_EQ(shownStatus(), "Connecting...");
}

TEST_F(OrvaneAppTest, AReloadShowsWhenItWasInLocalTime)
{
    launch();
    services.clock.zone.secondsFromGmt = 3600;
    refresh();
    EXPECT_EQ(shownStatus(), "Updated 2026-11-21 at 11:00:00");
}

TEST_F(OrvaneAppTest, ALostAndRegainedConnectionShowsAtOnce)
{
    launch();
    refresh();
    server.die();
    queue.advance(2s);
    EXPECT_EQ(shownStatus(), "Connecting... busy");
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    EXPECT_EQ(shownStatus(), "Updated 2026-11-21 at 10:00:00");
}

TEST_F(OrvaneAppTest, TheRootPaneFillsTheWindow)
{
    launch();
    EXPECT_EQ(screen.keyWindow()->frame(), screen.bounds());
    EXPECT_THAT(paths(), ElementsAre("/"));
    EXPECT_EQ(screen.title(), "Orvane");
}

TEST_F(OrvaneAppTest, EveryPaneOfTheStackIsReloadedAndTheTopOneShowsTheTime)
{
    launch();
    refresh();
    screen.pressRow(0);
    EXPECT_THAT(paths(), ElementsAre("/", "/Serving Cell Info"));
    services.clock.now += 4;
    ASSERT_TRUE(server.sendLogMessage(PacketBuilder(0xB0C2, 38).put16(14, 77).bytes()));
    queue.advance(2s);
    EXPECT_EQ(top().statusText(), "Updated 2026-11-21 at 10:00:04");
    const auto cell = std::dynamic_pointer_cast<OrvaneCell>(screen.row(0));
    EXPECT_EQ(cell->key()->text() + " " + cell->value()->text(), "Physical Cell ID 77");
}

TEST_F(OrvaneAppTest, PanesWhosePathIsGoneArePoppedWithThoseAboveThem)
{
    launch();
    push("/Serving Cell Info");
    push("/Serving Cell Info/gone");
    push("/Serving Cell Info/gone/deeper");
    refresh();
    EXPECT_THAT(paths(), ElementsAre("/", "/Serving Cell Info"));
    EXPECT_TRUE(screen.navigation()->isLastChangeAnimated());
    EXPECT_EQ(screen.title(), "Serving Cell Info");
    EXPECT_EQ(top().statusText(), "Updated 2026-11-21 at 10:00:00");
}

TEST_F(OrvaneAppTest, APaneThatIsShownAgainShowsTheStatusOfNow)
{
    launch();
    refresh();
    screen.pressRow(0);
    services.clock.now += 60;
    refresh();
    screen.pressBack();
    EXPECT_EQ(shownStatus(), "Updated 2026-11-21 at 10:01:00");
    server.die();
    queue.advance(2s);
    screen.pressRow(0);
    EXPECT_EQ(top().statusText(), "Connecting...");
    EXPECT_TRUE(top().isBusy());
}

TEST_F(OrvaneAppTest, SaveOpensTheSaveScreenOnceWithWhatThereIsNow)
{
    makeMarker();
    makeLogFolder();
    launch();
    refresh();
    screen.pressToolbar(BarButtonItem::Kind::Save);
    OrvaneSaveViewController* const first = app.saveView();
    ASSERT_NE(first, nullptr);
    app.showSaveView();
    EXPECT_EQ(app.saveView(), first);
    EXPECT_EQ(screen.navigation()->modalViewController().get(), first);
    EXPECT_EQ(first->saveContentTable()->numberOfRows(), 2U);
    first->saveDescription()->setText("here");
    first->savePressed();
    queue.runPending();
    EXPECT_EQ(app.saveView(), nullptr);
    EXPECT_EQ(screen.navigation()->modalViewController(), nullptr);
    EXPECT_FALSE(std::filesystem::is_empty(root.path() + kLogFolder));
    app.closeSaveView();
}

TEST_F(OrvaneAppTest, AFailedSaveClosesTheScreenAndLeavesTheAlert)
{
    makeMarker();
    ASSERT_TRUE(writeFile(root.path() + "/var", {})); // so that the log folder cannot be made
    launch();
    app.showSaveView();
    app.saveView()->savePressed();
    queue.runPending();
    EXPECT_EQ(app.saveView(), nullptr);
    ASSERT_NE(screen.alert(), nullptr);
    EXPECT_EQ(screen.alert()->title(), "File Error");
}

TEST_F(OrvaneAppTest, WithoutTheInterfaceFileNothingIsInTheWay)
{
    screen.setInterface("OrvaneSaveViewController", [] { return nullptr; });
    launch();
    app.showSaveView();
    EXPECT_EQ(app.saveView(), nullptr);
    EXPECT_EQ(screen.navigation()->modalViewController(), nullptr);
}

TEST_F(OrvaneAppTest, BeforeTheLaunchThereIsNothingToUpdate)
{
    app.updateViewControllerFromModel();
    app.monitorStartEnded();
    app.showSaveView();
    app.closeSaveView();
    EXPECT_EQ(screen.keyWindow(), nullptr);
}

TEST_F(OrvaneAppTest, WhileNotConnectedAReloadLeavesTheTimeOfTheLastUpdate)
{
    launch();
    refresh();
    services.clock.now += 60;
    sendServingCell();
    server.die();
    queue.advance(2s);
    EXPECT_EQ(shownStatus(), "Connecting... busy");
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    EXPECT_EQ(top().statusText(), "Updated 2026-11-21 at 10:00:00");
}

TEST_F(OrvaneAppTest, AModemThatIsMissingIsTheStatusUntilItIsBack)
{
    launch();
    refresh();
    server.notify("ModemMissing");
    queue.advance(10ms);
    EXPECT_EQ(top().statusText(), "No modem");
    EXPECT_FALSE(top().isBusy());
    server.notify("ModemPresent");
    queue.advance(10ms);
    EXPECT_EQ(top().statusText(), "Updated 2026-11-21 at 10:00:00");
}

TEST_F(OrvaneAppTest, WhatTheSaveScreenSavesIsOfTheTimeWhenItOpened)
{
    makeMarker();
    makeLogFolder();
    launch();
    refresh();
    app.showSaveView();
    ASSERT_TRUE(server.sendLogMessage(PacketBuilder(0xB0C2, 38).put16(14, 77).bytes()));
    queue.advance(2s);
    app.saveView()->savePressed();
    const PropertyValue snapshot =
        readPropertyList(*readFile(root.path() + kLogFolder + "/OrvaneSnapshot-1795255200.orvane"))
            .value;
    ASSERT_EQ(snapshot["Data"].asArray()->size(), 2U);
    EXPECT_EQ((*snapshot["Data"].asArray())[0]["Display"]["Serving Cell Info"]["Physical Cell ID"],
              PropertyValue("9"));
}

TEST_F(OrvaneAppTest, ItsEndStopsTheNumericSignalStrengthAndLeavesTheScreen)
{
    launch();
    EXPECT_THAT(preferences.notes, IsEmpty());
    app.showSaveView();
    // The preference comes first: everything else is still there.
    preferences.onSet = [this] {
        EXPECT_NE(app.saveView(), nullptr);
        EXPECT_NE(screen.keyWindow(), nullptr);
        EXPECT_NE(transport.openConnections(kTelephonyServerPort), 0U);
    };
    // Then the window goes, and only then the model with its connection.
    std::size_t connectionsWithoutWindow = 0;
    screen.onUpdate = [&] {
        if (!screen.keyWindow())
            connectionsWithoutWindow = transport.openConnections(kTelephonyServerPort);
    };
    app.applicationWillTerminate();
    EXPECT_NE(connectionsWithoutWindow, 0U);
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);
    screen.onUpdate = nullptr;
    EXPECT_THAT(preferences.notes,
                ElementsAre("set home-screen HSShowGSMRSSI false", "synchronize home-screen",
                            "notice home-screen HSShowGSMRSSI"));
    EXPECT_EQ(app.saveView(), nullptr);
    EXPECT_EQ(screen.keyWindow(), nullptr);
}

TEST_F(OrvaneAppTest, WithoutTheMarkerSavingIsNotOffered)
{
    makeLogFolder();
    launch();
    EXPECT_FALSE(app.allowSaveButton());
    EXPECT_EQ(app.saveSnapshot("x"), std::nullopt);
}

TEST_F(OrvaneAppTest, TheMarkerIsLookedForOnceAtTheStart)
{
    launch();
    makeMarker();
    EXPECT_FALSE(app.allowSaveButton());
}

TEST_F(OrvaneAppTest, SavesTheHistoryAndItsLog)
{
    makeMarker();
    makeLogFolder();
    launch();
    sendServingCell();
    queue.advance(2s);
    const auto result = app.saveSnapshot("by the river");
    ASSERT_TRUE(result && result->isWritten);
    const PropertyValue snapshot = readPropertyList(*readFile(result->path)).value;
    EXPECT_EQ(snapshot["Description"], PropertyValue("by the river"));
    const PropertyArray& data = *snapshot["Data"].asArray();
    ASSERT_EQ(data.size(), 2U);
    EXPECT_EQ(data[0]["Description"], PropertyValue("Snapshot (2026-11-21 10:00:00 +0000)"));
    EXPECT_EQ(data[0]["Display"]["Serving Cell Info"]["Physical Cell ID"], PropertyValue("9"));
    EXPECT_EQ(data[1]["Description"], PropertyValue("DLF binary (198 bytes)"));
    EXPECT_EQ(data[1]["DLF"].asData()->size(), 161U + 37U);
}

TEST_F(OrvaneAppTest, SavingBeforeAnyGeneratorSavesAnEmptyArray)
{
    server.die();
    makeMarker();
    makeLogFolder();
    launch();
    const auto result = app.saveSnapshot("");
    ASSERT_TRUE(result && result->isWritten);
    EXPECT_EQ(readPropertyList(*readFile(result->path)).value["Data"], PropertyValue::newArray());
}

TEST_F(OrvaneAppTest, AfterItsEndNothingComesAnyMore)
{
    launch();
    sendServingCell();
    app.applicationWillTerminate();
    queue.advance(60s);
    EXPECT_EQ(screen.keyWindow(), nullptr);
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);
}

} // namespace orvane
