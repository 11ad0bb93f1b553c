#include "processes/support/ChildProcess.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <csignal>
#include <filesystem>
#include <memory>
#include <sys/stat.h>

namespace orvane
{
namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;

// What programs leave behind that are killed.
class LeftoversTest : public ::testing::Test
{
protected:
    LeftoversTest() { std::filesystem::permissions(runtime, std::filesystem::perms::owner_all); }

    std::unique_ptr<ChildProcess> orvane(const std::vector<std::string>& arguments)
    {
        std::vector<std::string> all = {ORVANE_PROGRAM, "--ui", "json", "--log", "none"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return std::make_unique<ChildProcess>(all, environment);
    }
    std::unique_ptr<ChildProcess> servingTelephonyd()
    {
        auto server = std::make_unique<ChildProcess>(
            std::vector<std::string>{TELEPHONYD_PROGRAM, "--demo=lte", "--log", "stderr",
                                     "--log-level", "notice"},
            environment);
        EXPECT_TRUE(server->waitForError("notice: Serving in "));
        return server;
    }
    static void kill(ChildProcess& program)
    {
        program.sendSignal(SIGKILL);
        EXPECT_EQ(program.waitForEnd(), -SIGKILL);
    }
    static std::vector<std::string> namesIn(const std::string& path, const std::string& prefix)
    {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(path))
            if (std::string name = entry.path().filename().string(); name.starts_with(prefix))
                names.push_back(std::move(name));
        return names;
    }

    TemporaryDirectory directory;
    const std::string runtime = directory.path();
    const std::string ports = runtime + "/telephony";
    const std::vector<std::string> environment = {
        "XDG_RUNTIME_DIR=" + runtime, "XDG_STATE_HOME=" + runtime + "/state", "ORVANE_PORTS="};
};

TEST_F(LeftoversTest, PortsOfKilledViewersAreGoneAfterTheNextStart)
{
    const auto server = servingTelephonyd();
    {
        const std::array viewers = {orvane({}), orvane({}), orvane({})};
        for (const auto& viewer : viewers)
            ASSERT_TRUE(viewer->waitForText("\"loading\":false"));
        for (const auto& viewer : viewers)
            kill(*viewer);
    }
    EXPECT_THAT(namesIn(ports, "OrvaneApp."), SizeIs(3));
    const auto viewer = orvane({});
    ASSERT_TRUE(viewer->waitForText("\"loading\":false"));
    EXPECT_THAT(namesIn(ports, "OrvaneApp."), SizeIs(1)) << "the running one's";
}

TEST_F(LeftoversTest, PortsOfEverybodyKilledAreGoneAfterTheServersNextStart)
{
    {
        const auto server = servingTelephonyd();
        const auto viewer = orvane({});
        ASSERT_TRUE(viewer->waitForText("\"loading\":false"));
        kill(*viewer);
        const auto other = orvane({});
        ASSERT_TRUE(other->waitForText("\"loading\":false"));
        kill(*server);
        kill(*other);
    }
    EXPECT_THAT(namesIn(ports, "TelephonyServer"), ::testing::Not(IsEmpty()));
    const auto server = servingTelephonyd();
    EXPECT_THAT(namesIn(ports, "TelephonyServer"), ElementsAre("TelephonyServer"));
    EXPECT_THAT(namesIn(ports, "OrvaneApp."), IsEmpty());
}

TEST_F(LeftoversTest, TheDirectoryOfAKilledDemoIsGoneAfterTheNextStart)
{
    const auto killed = orvane({"--demo"});
    ASSERT_TRUE(killed->waitForText("\"loading\":false"));
    const auto running = orvane({"--demo"});
    ASSERT_TRUE(running->waitForText("\"loading\":false"));
    kill(*killed);
    EXPECT_THAT(namesIn(runtime, "orvane-"), SizeIs(2));

    const auto next = orvane({});
    ASSERT_TRUE(next->waitForText("Connecting"));
    EXPECT_THAT(namesIn(runtime, "orvane-"), SizeIs(1)) << "the running one's";
    running->sendSignal(SIGTERM);
    EXPECT_EQ(running->waitForEnd(), 0);
    EXPECT_THAT(namesIn(runtime, "orvane-"), IsEmpty());
}

} // namespace
} // namespace orvane
