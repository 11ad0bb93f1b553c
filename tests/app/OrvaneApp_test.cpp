#include "app/OrvaneApp.h"

#include "LogGenerator/support/PacketBuilder.h"
#include "platform/FramePorts.h"
#include "platform/FrameTelephonyServer.h"
#include "platform/PropertyList.h"
#include "platform/fake/LoopbackTransport.h"
#include "platform/fake/ScriptedTelephonyServer.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

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

// A pane that notes what it is told.
class NotingPane final : public Pane
{
public:
    NotingPane(std::string path, std::vector<std::string>& notes)
        : _path(std::move(path)), _notes(notes)
    {
    }
    [[nodiscard]] std::string path() const override { return _path; }
    void reloadWithNode(NodePointer node) override
    {
        _notes.push_back(_path + " reload " + (node ? node->displayName() : "nothing"));
    }
    void setStatus(std::optional<std::string> status, bool isLoading) override
    {
        _isLoading = isLoading;
        _notes.push_back(_path + " " + status.value_or("(none)") + (isLoading ? " busy" : ""));
    }
    [[nodiscard]] bool isLoading() const override { return _isLoading; }

private:
    std::string _path;
    std::vector<std::string>& _notes;
    bool _isLoading = true;
};

class NotingStack final : public PaneStack
{
public:
    void push(const std::string& path)
    {
        _panes.push_back(std::make_unique<NotingPane>(path, notes));
    }
    [[nodiscard]] std::vector<Pane*> panes() const override
    {
        std::vector<Pane*> all;
        for (const auto& pane : _panes)
            all.push_back(pane.get());
        return all;
    }
    void popToPane(const Pane& pane) override
    {
        notes.push_back("pop to " + pane.path());
        while (_panes.back().get() != &pane)
            _panes.pop_back();
    }

    std::vector<std::string> notes;

private:
    std::vector<std::unique_ptr<NotingPane>> _panes;
};

class OrvaneAppTest : public ::testing::Test
{
protected:
    OrvaneAppTest()
    {
        services.useShippedResources();
        panes.push("/");
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
    std::vector<std::string> takeNotes() { return std::exchange(panes.notes, {}); }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    FramePorts ports{transport, queue};
    FrameTelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    NotingStack panes;
    OrvaneApp app{
        {queue, ports, client, 2s, [] { return std::optional<std::string>("UUID"); }},
        files,
        panes
    };
};

} // namespace

TEST_F(OrvaneAppTest, StartsAsConnectingAndTheFirstAttemptComesAfterTheLaunch)
{
    app.applicationDidFinishLaunching();
    EXPECT_THAT(takeNotes(), ElementsAre("/ Connecting busy", "/ Connecting... busy"));
    EXPECT_THAT(server.requestedPorts(), IsEmpty());
    queue.runPending();
    EXPECT_THAT(takeNotes(), ElementsAre("/ Connecting..."));
}

TEST_F(OrvaneAppTest, AReloadShowsWhenItWasInLocalTime)
{
    launch();
    services.clock.zone.secondsFromGmt = 3600;
    sendServingCell();
    takeNotes();
    queue.advance(2s);
    EXPECT_THAT(takeNotes(), ElementsAre("/ reload Orvane", "/ Updated 2026-11-21 at 11:00:00"));
}

TEST_F(OrvaneAppTest, FailedAttemptsDoNotFlicker)
{
    server.die();
    launch();
    queue.advance(30s);
    EXPECT_THAT(takeNotes(), ElementsAre("/ Connecting busy", "/ Connecting... busy"));
}

TEST_F(OrvaneAppTest, ALostAndRegainedConnectionShowsAtOnce)
{
    launch();
    sendServingCell();
    queue.advance(2s);
    takeNotes();
    server.die();
    queue.advance(2s);
    EXPECT_THAT(takeNotes(), ElementsAre("/ Connecting... busy"));
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    EXPECT_THAT(takeNotes(), ElementsAre("/ Updated 2026-11-21 at 10:00:00"));
}

TEST_F(OrvaneAppTest, PanesWhosePathIsGoneArePoppedWithThoseAboveThem)
{
    launch();
    panes.push("/Serving Cell Info");
    panes.push("/Serving Cell Info/gone");
    panes.push("/Serving Cell Info/gone/deeper");
    sendServingCell();
    takeNotes();
    queue.advance(2s);
    EXPECT_THAT(takeNotes(),
                ElementsAre("/ reload Orvane", "/Serving Cell Info reload Serving Cell Info",
                            "pop to /Serving Cell Info",
                            "/Serving Cell Info Updated 2026-11-21 at 10:00:00"));
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
    takeNotes();
    queue.advance(60s);
    EXPECT_THAT(takeNotes(), IsEmpty());
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);
}

} // namespace orvane
