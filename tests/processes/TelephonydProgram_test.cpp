#include "platform/services/FileSystem.h"
#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/Sanitizers.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <memory>

namespace orvane
{

namespace
{

using ::testing::IsEmpty;
using ::testing::StartsWith;

// Runs the server as a process with its own ports directory.
class TelephonydProgramTest : public ::testing::Test
{
protected:
    std::unique_ptr<ChildProcess> telephonyd(const std::vector<std::string>& arguments)
    {
        std::vector<std::string> all = {TELEPHONYD_PROGRAM};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return std::make_unique<ChildProcess>(all, std::vector{"ORVANE_PORTS=" + ports()});
    }
    // Starts the server and waits until clients can connect.
    std::unique_ptr<ChildProcess> servingTelephonyd(std::vector<std::string> arguments)
    {
        arguments.insert(arguments.end(), {"--log", "stderr", "--log-level", "notice"});
        auto server = telephonyd(arguments);
        EXPECT_TRUE(server->waitForError("notice: Serving in " + ports() + "\n"));
        return server;
    }
    std::unique_ptr<ChildProcess> viewer()
    {
        return std::make_unique<ChildProcess>(
            std::vector<std::string>{ORVANE_PROGRAM, "--ports", ports(), "--ui", "json",
                                     "--refresh", "0.1", "--log", "none"});
    }
    // Expects it to end with the status, and to print one line, on standard error.
    void expectRefusal(const std::vector<std::string>& arguments, int status)
    {
        const auto server = telephonyd(arguments);
        const std::string all = ::testing::PrintToString(arguments);
        EXPECT_EQ(server->waitForEnd(), status) << all;
        EXPECT_THAT(server->lines(), IsEmpty()) << all;
        EXPECT_THAT(server->errors(), StartsWith("telephonyd: ")) << all;
        EXPECT_EQ(server->errors().find('\x1b'), std::string::npos) << all;
        EXPECT_EQ(std::count(server->errors().begin(), server->errors().end(), '\n'), 1) << all;
    }
    [[nodiscard]] std::string ports() const { return directory.path() + "/ports"; }
    [[nodiscard]] std::string file(const std::string& name) const
    {
        return directory.path() + "/" + name;
    }

    TemporaryDirectory directory;
    const std::string drive = testDataPath("lte-drive.dlf");
};

// The most memory that the process has had resident so far.
long peakResidentKilobytes(pid_t process)
{
    std::ifstream status("/proc/" + std::to_string(process) + "/status");
    for (std::string line; std::getline(status, line);)
        if (line.starts_with("VmHWM:"))
            return std::stol(line.substr(6));
    return LONG_MAX;
}

constexpr const char* kRow = "\"name\":\"Physical Cell ID\"";

} // namespace

TEST_F(TelephonydProgramTest, AClientThatDiesWhileItIsSentToCostsTheServerNothing)
{
    const auto server = servingTelephonyd({"--replay", drive, "--speed", "max", "--loop"});
    for (int round = 0; round < 2; ++round) {
        const auto client = viewer();
        ASSERT_TRUE(client->waitForText(kRow)) << "round " << round;
        client->sendSignal(SIGKILL);
    }
    server->sendSignal(SIGTERM);
    EXPECT_EQ(server->waitForEnd(), 0);
}

TEST_F(TelephonydProgramTest, ALongRecordingIsNotHeldInMemory)
{
    if (ORVANE_ADDRESS_SANITIZER)
        GTEST_SKIP() << "the address sanitizer makes memory seem to grow";
    constexpr std::size_t kFileBytes = 60'000'000;
    const Bytes once = readFile(drive).value_or(Bytes());
    ASSERT_FALSE(once.empty());
    Bytes content;
    while (content.size() < kFileBytes)
        content.insert(content.end(), once.begin(), once.end());
    ASSERT_TRUE(writeFile(file("long.dlf"), content));
    const auto server = servingTelephonyd({"--replay", file("long.dlf"), "--speed", "max"});
    const auto client = viewer();
    ASSERT_TRUE(client->waitForText(kRow));
    EXPECT_LT(peakResidentKilobytes(server->pid()), 25'000);
    server->sendSignal(SIGTERM);
    EXPECT_EQ(server->waitForEnd(), 0);
}

TEST_F(TelephonydProgramTest, SignalsEndItInOrderAndRemoveItsPort)
{
    for (const int signal : {SIGINT, SIGTERM}) {
        const auto server = servingTelephonyd({"--demo=lte"});
        EXPECT_TRUE(std::filesystem::exists(ports() + "/TelephonyServer"));
        server->sendSignal(signal);
        EXPECT_EQ(server->waitForEnd(), 0) << signal;
        EXPECT_FALSE(std::filesystem::exists(ports() + "/TelephonyServer"));
    }
}

TEST_F(TelephonydProgramTest, ATypedMessageIsOnTheScreen)
{
    const auto server = servingTelephonyd({"--messages=lte"});
    server->writeLine("0xB0C2 this is not a message");
    EXPECT_TRUE(
        server->waitForError("telephonyd: a byte is two hexadecimal digits, not \"this\"\n"));
    server->writeLine(
        "0xB0C2 01 DD 00 9C 18 EC 5E 32 32 01 01 1B 00 06 10 14 00 00 00 00 00 00 00 00 00");
    server->closeInput(); // ends nothing
    const auto client = viewer();
    EXPECT_TRUE(client->waitForText(R"({"name":"Physical Cell ID","value":"221"})"));
    server->sendSignal(SIGTERM);
    EXPECT_EQ(server->waitForEnd(), 0);
}

TEST_F(TelephonydProgramTest, UnusableArgumentsEndItWithStatusTwo)
{
    expectRefusal({}, 2);
    expectRefusal({"--nonsense"}, 2);
    expectRefusal({"--demo=mars"}, 2);
    expectRefusal({"--demo=lte", "stray"}, 2);
    expectRefusal({"--demo=lte", "--speed", "2"}, 2);
    expectRefusal({"--demo=lte", "--replay", drive}, 2);
    expectRefusal({"--demo=lte", "--log", "paper"}, 2);
    expectRefusal({"--replay", "/missing/\x1b[2J\n.dlf"}, 1);
    expectRefusal({"--replay", drive, "--speed", "fast"}, 2);
    expectRefusal({"--replay", drive, "--technology", "smoke"}, 2);
}

TEST_F(TelephonydProgramTest, ARecordingThatCannotBeServedEndsItWithStatusOne)
{
    ASSERT_TRUE(writeFile(file("zeros.dlf"), Bytes(100)));
    expectRefusal({"--replay", file("absent.dlf")}, 1);
    expectRefusal({"--replay", directory.path()}, 1);
    expectRefusal({"--replay", file("zeros.dlf")}, 1);
}

TEST_F(TelephonydProgramTest, ASecondServerOfTheSameDirectoryEndsWithStatusOne)
{
    const auto first = servingTelephonyd({"--demo=lte"});
    expectRefusal({"--demo=lte", "--log", "none"}, 1);
}

} // namespace orvane
