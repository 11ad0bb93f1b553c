#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/FileSystem.h"
#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <memory>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

// Runs the programs with their own ports directory and root.
class ProgramTest : public ::testing::Test
{
protected:
    std::unique_ptr<ChildProcess> orvane(std::vector<std::string> arguments)
    {
        std::vector<std::string> all = {
            ORVANE_PROGRAM, "--ports", ports(),     "--root", directory.path() + "/root",
            "--log",        "stderr",  "--refresh", "0.2"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return std::make_unique<ChildProcess>(all);
    }
    std::unique_ptr<ChildProcess> telephonyd(std::vector<std::string> arguments)
    {
        std::vector<std::string> all = {TELEPHONYD_PROGRAM, "--ports", ports(), "--log", "stderr"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return std::make_unique<ChildProcess>(all);
    }
    std::unique_ptr<ChildProcess> scriptedServer(const std::string& mode)
    {
        std::filesystem::create_directory(ports());
        std::filesystem::permissions(ports(), std::filesystem::perms::owner_all);
        auto server = std::make_unique<ChildProcess>(
            std::vector<std::string>{SCRIPTED_SERVER_PROGRAM, ports(), mode});
        EXPECT_TRUE(server->waitForText("ready"));
        return server;
    }
    [[nodiscard]] std::string ports() const { return directory.path() + "/ports"; }
    [[nodiscard]] std::string root() const { return directory.path() + "/root"; }
    void offerSaving()
    {
        std::filesystem::create_directories(
            root() + "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle");
        std::filesystem::create_directories(root() + "/var/mobile/Library/Logs/DiagDrop");
    }
    [[nodiscard]] static std::string recording(const std::string& name)
    {
        return testDataPath(name);
    }

    TemporaryDirectory directory;
};

constexpr const char* kRow = "\"name\":\"Physical Cell ID\"";
constexpr const char* kFirstLine = R"({"status":"Connecting","loading":true,"tree":null})";
constexpr const char* kWaitingLine = R"({"status":"Connecting...","loading":true,"tree":null})";
constexpr const char* kConnectedLine = R"({"status":"Connecting...","loading":false,"tree":null})";

} // namespace

TEST_F(ProgramTest, AnAbsentServerIsWaitedForAndFoundOnceStarted)
{
    const auto viewer = orvane({"--ui", "json"});
    EXPECT_EQ(viewer->waitForText("status"), kFirstLine);
    EXPECT_EQ(viewer->waitForText("status"), kWaitingLine);
    EXPECT_TRUE(viewer->waitForError("error: Could not create TSServerConnection\n"
                                     "error: Could not create the ports necessary\n"));
    const auto server = telephonyd({"--demo=lte"});
    EXPECT_EQ(viewer->waitForText("status"), kConnectedLine);
    EXPECT_TRUE(viewer->waitForText(kRow));
}

TEST_F(ProgramTest, AKilledServerShowsAndComesBackWithoutTouchingTheViewer)
{
    auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText(kRow));
    server->sendSignal(SIGKILL);
    const auto lost = viewer->waitForText(R"("status":"Connecting...","loading":true)");
    ASSERT_TRUE(lost);
    EXPECT_THAT(*lost, HasSubstr(kRow)) << "rows stay";
    EXPECT_TRUE(viewer->waitForError("***** INVALIDATED 0x"));

    server = telephonyd({"--demo=lte"});
    EXPECT_TRUE(viewer->waitForLine([](const std::string& line) {
        return line.find(R"("status":"Updated )") != std::string::npos &&
               line.find(kRow) != std::string::npos;
    }));
}

TEST_F(ProgramTest, AServerStoppedInOrderIsRemovedWithItsPorts)
{
    auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText(kRow));
    server->sendSignal(SIGTERM);
    EXPECT_EQ(server->waitForEnd(), 0);
    EXPECT_TRUE(viewer->waitForText(R"("status":"Connecting...","loading":true)"));
    EXPECT_FALSE(std::filesystem::exists(ports() + "/TelephonyServer"));
}

struct Misbehaviour {
    const char* mode;
    const char* line;
};

class MisbehavingServerTest : public ProgramTest, public ::testing::WithParamInterface<Misbehaviour>
{
};

TEST_P(MisbehavingServerTest, IsToldInTheLogAndTriedAgain)
{
    const auto server = scriptedServer(GetParam().mode);
    const auto viewer = orvane({"--ui", "json"});
    EXPECT_TRUE(viewer->waitForError(std::string("error: ") + GetParam().line + "\n"))
        << viewer->errors();
    EXPECT_TRUE(viewer->waitForText(kWaitingLine));
    viewer->writeLine("quit");
    EXPECT_EQ(viewer->waitForEnd(), 0);
    EXPECT_THAT(viewer->lines(), ElementsAre(kFirstLine, kWaitingLine));
}

INSTANTIATE_TEST_SUITE_P(
    Program, MisbehavingServerTest,
    ::testing::Values(
        Misbehaviour{"no-channel-reply",
                     "_TSServerConnectionNetworkMonitorCreateLogChannel returns error: -2!"},
        Misbehaviour{"garbage-channel-reply",
                     "_TSServerConnectionNetworkMonitorCreateLogChannel returns error: -4!"},
        Misbehaviour{"empty-port", "Could not create a log channel (TS returned null port)!"},
        Misbehaviour{"error-code",
                     "_TSServerConnectionNetworkMonitorCreateLogChannel returns error: 42!"},
        Misbehaviour{"no-reply", " ***** Could not send the GetTechnology command (got error=-2)"},
        Misbehaviour{"empty-reply", " ***** No response to GetTechnology; cannot configure"},
        Misbehaviour{"garbage-reply",
                     " ***** Could not parse reply to GetTechnology; cannot configure"},
        Misbehaviour{"no-key", " ***** Reply to GetTechnology had no answer; cannot configure"},
        Misbehaviour{"unknown-technology", "No log generator technology works"}),
    [](const auto& test) {
        std::string name = test.param.mode;
        std::erase(name, '-');
        return name;
    });

TEST_F(ProgramTest, AStartCommandThatCannotBeSentIsToldAndTriedAgain)
{
    const auto server = scriptedServer("dies-before-start");
    const auto viewer = orvane({"--ui", "json"});
    EXPECT_TRUE(viewer->waitForError(" ***** Could not send the START command (got error=-"))
        << viewer->errors();
}

TEST_F(ProgramTest, MessagesWithOtherIdsAreDropped)
{
    const auto server = scriptedServer("other-ids");
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(server->waitForText("started"));
    const auto shown = viewer->waitForText(kRow);
    ASSERT_TRUE(shown);
    EXPECT_THAT(*shown, HasSubstr(R"({"name":"Physical Cell ID","value":"3"})"));
}

TEST_F(ProgramTest, TheFirstRowsNeedNotWaitForTheFirstRefresh)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json", "--refresh", "3600"});
    EXPECT_TRUE(viewer->waitForText(kRow)) << "the server's notification refreshes";
}

TEST_F(ProgramTest, TextShowsTheOutline)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "text"});
    EXPECT_TRUE(viewer->waitForText("Updated "));
    EXPECT_EQ(viewer->waitForText("Orvane"), "Orvane");
    EXPECT_TRUE(viewer->waitForText("  Serving Cell Info"));
    EXPECT_TRUE(viewer->waitForText("    Physical Cell ID: "));
}

TEST_F(ProgramTest, AReplayShowsTheDrive)
{
    const auto server =
        telephonyd({"--replay", recording("lte-drive.dlf"), "--speed", "max", "--loop"});
    const auto viewer = orvane({"--ui", "json"});
    EXPECT_TRUE(viewer->waitForText(kRow));
}

TEST_F(ProgramTest, SavingWritesASnapshotBelowTheRoot)
{
    offerSaving();
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText(kRow));
    viewer->writeLine("save at the old mill");
    const auto answer = viewer->waitForText("{\"saved\":");
    ASSERT_TRUE(answer);
    EXPECT_THAT(*answer, StartsWith("{\"saved\":\"" + root() +
                                    "/var/mobile/Library/Logs/DiagDrop/OrvaneSnapshot-"));
    const std::string path = answer->substr(10, answer->size() - 12);
    const auto content = readFile(path);
    ASSERT_TRUE(content) << path;
    const PropertyValue snapshot = readPropertyList(*content).value;
    EXPECT_EQ(snapshot["Description"], PropertyValue("at the old mill"));
    EXPECT_GE(snapshot["Data"].asArray()->size(), 2U);
}

TEST_F(ProgramTest, SavingWhereItIsNotOfferedAndUnknownCommandsAreAnswered)
{
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText("status"));
    viewer->writeLine("save x");
    EXPECT_THAT(viewer->waitForText("error").value_or(""), HasSubstr("saving is not offered"));
    viewer->writeLine("dance");
    EXPECT_THAT(viewer->waitForText("error").value_or(""), HasSubstr("unknown command"));
}

TEST_F(ProgramTest, SavingWhereTheFolderCannotBeMadeIsAnAlert)
{
    offerSaving();
    std::filesystem::remove_all(root() + "/var");
    ASSERT_TRUE(writeFile(root() + "/var", {})); // so that the folder cannot be made
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText("status"));
    viewer->writeLine("save x");
    EXPECT_EQ(viewer->waitForText("alert"),
              R"({"alert":"File Error","message":"Unable to write file to disk"})");
    EXPECT_TRUE(viewer->waitForError("error: Unable to write snapshot to "));
    EXPECT_TRUE(viewer->waitForError("error: The snapshot was not saved: Not a directory"));
}

TEST_F(ProgramTest, TheEndOfInputEndsNothing)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json"});
    viewer->closeInput();
    EXPECT_TRUE(viewer->waitForText(kRow));
}

TEST_F(ProgramTest, SignalsEndItInOrder)
{
    for (const int signal : {SIGINT, SIGTERM}) {
        const auto viewer = orvane({"--ui", "text"});
        ASSERT_TRUE(viewer->waitForText("Connecting"));
        viewer->sendSignal(signal);
        EXPECT_EQ(viewer->waitForEnd(), 0);
    }
}

TEST_F(ProgramTest, ASignalEndsItAlsoWhileNobodyReadsItsOutput)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "text", "--refresh", "0.01"});
    ASSERT_TRUE(viewer->waitForFullOutput());
    viewer->sendSignal(SIGTERM);
    EXPECT_EQ(viewer->waitForEnd(), 0);
}

TEST_F(ProgramTest, AReaderThatLeavesEndsIt)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json"});
    ASSERT_TRUE(viewer->waitForText("status"));
    viewer->closeOutput();
    EXPECT_EQ(viewer->waitForEnd(), 0);
}

TEST_F(ProgramTest, TheDemoMarksItsPhoneAsSimulatedAndOffersSaving)
{
    const std::vector<std::string> environment = {"XDG_STATE_HOME=" + directory.path()};
    ChildProcess viewer({ORVANE_PROGRAM, "--demo", "--ui", "json", "--log", "none"}, environment);
    const auto shown = viewer.waitForText(kRow);
    ASSERT_TRUE(shown);
    EXPECT_THAT(*shown, EndsWith(",\"simulated\":true}"));
    viewer.writeLine("save demo");
    EXPECT_THAT(viewer.waitForText("saved").value_or(""),
                StartsWith("{\"saved\":\"" + directory.path() + "/orvane/demo/var/mobile/"));
    viewer.writeLine("quit");
    EXPECT_EQ(viewer.waitForEnd(), 0);
    EXPECT_THAT(viewer.errors(), Not(HasSubstr("error")));
}

TEST_F(ProgramTest, WithoutARootAnOrdinaryMachineSavesInTheUsersStateDirectory)
{
    const std::vector<std::string> environment = {"XDG_STATE_HOME=" + directory.path()};
    ChildProcess viewer({ORVANE_PROGRAM, "--ports", ports(), "--ui", "json", "--log", "none"},
                        environment);
    ASSERT_TRUE(viewer.waitForText("status"));
    viewer.writeLine("save x");
    EXPECT_THAT(viewer.waitForText("saved").value_or(""),
                StartsWith("{\"saved\":\"" + directory.path() + "/orvane/root/var/mobile/"));
    EXPECT_EQ(std::filesystem::status(directory.path() + "/orvane/root").permissions(),
              std::filesystem::perms::owner_all);
}

TEST_F(ProgramTest, OncePrintsTheFirstDisplayWithRowsAndEnds)
{
    const auto server = telephonyd({"--demo=lte"});
    const auto viewer = orvane({"--ui", "json", "--once"});
    EXPECT_EQ(viewer->waitForEnd(), 0);
    ASSERT_EQ(viewer->lines().size(), 1U);
    EXPECT_THAT(viewer->lines()[0], StartsWith("{\"status\":\"Updated "));
    EXPECT_THAT(viewer->lines()[0], HasSubstr("\"value\":"));
}

TEST_F(ProgramTest, OnceFailsWithOneLineWhereNoDisplayComes)
{
    const auto viewer = orvane({"--once=0.2", "--log", "none"});
    EXPECT_EQ(viewer->waitForEnd(), 1);
    EXPECT_THAT(viewer->lines(), IsEmpty());
    EXPECT_EQ(viewer->errors(), "orvane: no display with rows came in time: start telephonyd, or "
                                "give --once=SECONDS more time\n");
}

TEST_F(ProgramTest, UnusableArgumentsEndItWithOneLineAndStatusTwo)
{
    const std::vector<std::vector<std::string>> kArguments = {
        {"--nonsense" },
        {"--ui",        "hologram"},
        {"--refresh",             "soon"},
        {"--refresh","0"},
        {"--log",   "paper"},
        {"--log-level",             "loud"},
        {"--demo=mars"   },
        {"--demo", "--ports", "/tmp"},
        {"stray"            },
    };
    for (const auto& arguments : kArguments) {
        std::vector<std::string> all = {ORVANE_PROGRAM};
        all.insert(all.end(), arguments.begin(), arguments.end());
        ChildProcess viewer(all);
        EXPECT_EQ(viewer.waitForEnd(), 2) << arguments[0];
        EXPECT_THAT(viewer.lines(), IsEmpty());
        EXPECT_THAT(viewer.errors(), StartsWith("orvane: "));
        EXPECT_EQ(std::count(viewer.errors().begin(), viewer.errors().end(), '\n'), 1);
    }
}

TEST_F(ProgramTest, ARefusedPortsDirectoryEndsItWithStatusOne)
{
    std::filesystem::create_directory(ports());
    std::filesystem::permissions(ports(), std::filesystem::perms::all);
    const auto viewer = orvane({"--ui", "json"});
    EXPECT_EQ(viewer->waitForEnd(), 1);
    EXPECT_THAT(viewer->lines(), IsEmpty());
    EXPECT_THAT(viewer->errors(), StartsWith("orvane: "));
}

TEST_F(ProgramTest, HelpAndVersionSayWhatTheyAreAskedFor)
{
    for (const char* program : {ORVANE_PROGRAM, TELEPHONYD_PROGRAM}) {
        ChildProcess help({program, "--help"});
        EXPECT_EQ(help.waitForEnd(), 0);
        EXPECT_TRUE(help.waitForText("Usage: ", 0ms));
        ChildProcess version({program, "--version"});
        EXPECT_EQ(version.waitForEnd(), 0);
        EXPECT_THAT(version.lines(), ::testing::SizeIs(1));
    }
}

} // namespace orvane
