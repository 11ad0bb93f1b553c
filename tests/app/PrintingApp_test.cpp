#include "app/PrintingApp.h"

#include "LogGenerator/support/PacketBuilder.h"
#include "doubles/FakePreferencesStore.h"
#include "doubles/LoopbackTransport.h"
#include "doubles/ScriptedTelephonyServer.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

// Prints a line an output: the status, "busy", and the first value of the tree.
class LinePrinter final : public Printer
{
public:
    using Printer::Printer;

private:
    static std::string firstValue(const OrvaneModelNode& node)
    {
        if (node.value())
            return *node.value();
        return node.childNodes()->empty() ? "" : firstValue(*node.childNodes()->front());
    }
    [[nodiscard]] std::string statusOutput(const std::string& status, bool isLoading,
                                           const OrvaneModelNode* tree) const override
    {
        return status + (isLoading ? " busy" : "") + (tree ? ", " + firstValue(*tree) : "");
    }
    [[nodiscard]] std::string savedOutput(const std::string& path) const override { return path; }
    [[nodiscard]] std::string alertOutput(const std::string& title,
                                          const std::string&) const override
    {
        return title;
    }
    [[nodiscard]] std::string errorOutput(const std::string& text) const override { return text; }
};

// There is no screen: nothing of the toolkit is made.
class PrintingAppTest : public ::testing::Test
{
protected:
    PrintingAppTest() { services.useShippedResources(); }

    void launch()
    {
        app.applicationDidFinishLaunching();
        queue.runPending();
    }
    void sendServingCell(std::uint32_t cell)
    {
        ASSERT_TRUE(server.sendLogMessage(PacketBuilder(0xB0C2, 38).put16(14, cell).bytes()));
    }
    std::vector<std::string> takeLines() { return std::exchange(lines, {}); }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    FakePreferencesStore preferences;
    std::vector<std::string> lines;
    LinePrinter printer{[this](std::string_view line) { lines.emplace_back(line); }};
    PrintingApp app{
        {queue, ports, client, 2s, [] { return std::optional<std::string>("UUID"); }},
        files,
        preferences,
        printer
    };
};

} // namespace

TEST_F(PrintingAppTest, StartsAsConnectingAndTheFirstAttemptComesAfterTheLaunch)
{
    app.applicationDidFinishLaunching();
    EXPECT_THAT(takeLines(), ElementsAre("Connecting busy", "Connecting... busy"));
    EXPECT_THAT(server.requestedPorts(), IsEmpty());
    queue.runPending();
    EXPECT_THAT(takeLines(), ElementsAre("Connecting..."));
}

TEST_F(PrintingAppTest, EveryReloadIsOneOutputWithItsTime)
{
    launch();
    takeLines();
    sendServingCell(9);
    queue.advance(2s);
    EXPECT_THAT(takeLines(), ElementsAre("Updated 2026-11-21 at 10:00:00, 9"));
    sendServingCell(10);
    queue.advance(2s);
    EXPECT_THAT(takeLines(), ElementsAre("Updated 2026-11-21 at 10:00:00, 10"))
        << "also in the same second";
    queue.advance(60s);
    EXPECT_THAT(takeLines(), IsEmpty()) << "nothing came";
}

TEST_F(PrintingAppTest, FailedAttemptsDoNotFlicker)
{
    server.die();
    launch();
    queue.advance(30s);
    EXPECT_THAT(takeLines(), ElementsAre("Connecting busy", "Connecting... busy"));
}

TEST_F(PrintingAppTest, ALostAndRegainedConnectionShowsAtOnceWithTheTreeAsItWas)
{
    launch();
    sendServingCell(9);
    queue.advance(2s);
    takeLines();
    server.die();
    queue.advance(2s);
    EXPECT_THAT(takeLines(), ElementsAre("Connecting... busy, 9"));
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    EXPECT_THAT(takeLines(), ElementsAre("Updated 2026-11-21 at 10:00:00, 9"));
}

TEST_F(PrintingAppTest, WhileNotConnectedAReloadLeavesTheTimeOfTheLastUpdate)
{
    launch();
    sendServingCell(9);
    queue.advance(2s);
    services.clock.now += 60;
    sendServingCell(10);
    server.die();
    takeLines();
    queue.advance(2s);
    EXPECT_THAT(takeLines(), ElementsAre("Connecting... busy, 9", "Connecting... busy, 10"));
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    EXPECT_THAT(takeLines(), ElementsAre("Updated 2026-11-21 at 10:00:00, 10"));
}

TEST_F(PrintingAppTest, OncePrintsTheFirstTreeWithRowsAndNothingElse)
{
    int ends = 0;
    const auto name = [] { return std::optional<std::string>("ONCE"); };
    const ModelEnvironment environment{queue, ports, client, 2s, name};
    PrintingApp once(environment, files, preferences, printer, [&ends] { ++ends; });
    once.applicationDidFinishLaunching();
    queue.advance(10s);
    EXPECT_THAT(takeLines(), IsEmpty());
    EXPECT_EQ(ends, 0);
    for (const std::uint32_t cell : {9U, 10U}) {
        sendServingCell(cell);
        queue.advance(2s);
    }
    EXPECT_THAT(takeLines(), ElementsAre("Updated 2026-11-21 at 10:00:00, 9"));
    EXPECT_EQ(ends, 1);
    once.applicationWillTerminate();
}

TEST_F(PrintingAppTest, BeforeTheLaunchAndAfterTheEndNothingIsPrinted)
{
    app.updateViewControllerFromModel();
    app.monitorStartEnded();
    EXPECT_THAT(takeLines(), IsEmpty());
    launch();
    sendServingCell(9);
    takeLines();
    app.applicationWillTerminate();
    queue.advance(60s);
    EXPECT_THAT(takeLines(), IsEmpty());
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);
}

} // namespace orvane
