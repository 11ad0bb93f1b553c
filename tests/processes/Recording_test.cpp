#include "dlf/DlfReader.h"
#include "dlf/VersionReport.h"
#include "platform/services/FileSystem.h"
#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <memory>
#include <thread>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::Ge;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

// Records a live view.
class RecordingProgramTest : public ::testing::Test
{
protected:
    std::vector<std::string> viewerArguments(std::vector<std::string> more) const
    {
        std::vector<std::string> all = {ORVANE_PROGRAM,
                                        "--ports",
                                        directory.path() + "/ports",
                                        "--root",
                                        root(),
                                        "--log",
                                        "none",
                                        "--refresh",
                                        "0.1",
                                        "--ui",
                                        "json",
                                        "--record",
                                        file};
        all.insert(all.end(), more.begin(), more.end());
        return all;
    }
    std::unique_ptr<ChildProcess> record(std::vector<std::string> more = {}) const
    {
        return std::make_unique<ChildProcess>(viewerArguments(std::move(more)));
    }
    std::unique_ptr<ChildProcess> telephonyd(std::vector<std::string> more) const
    {
        std::vector<std::string> all = {TELEPHONYD_PROGRAM, "--ports", directory.path() + "/ports",
                                        "--log", "none"};
        all.insert(all.end(), more.begin(), more.end());
        return std::make_unique<ChildProcess>(all);
    }
    std::unique_ptr<ChildProcess> replay() const
    {
        return telephonyd({"--replay", kDrive, "--speed", "max"});
    }
    // Returns the values of all rows at the end of the log, without the time: an item that no
    // section subscribes to may set the time.
    static std::string rowsAtTheEnd(const std::string& log)
    {
        ChildProcess exporting(
            {ORVANE_PROGRAM, "export", "--log", "none", "--every", "86400", log});
        exporting.waitForEnd();
        if (exporting.lines().size() != 1)
            return "(not one line)";
        const std::string& line = exporting.lines().front();
        return line.substr(std::min(line.find(','), line.size()));
    }
    // Waits until the recording ends with these rows; false after the time-out.
    bool waitForRows(const std::string& rows) const
    {
        const auto deadline = std::chrono::steady_clock::now() + 30s;
        while (rowsAtTheEnd(file) != rows)
            if (std::chrono::steady_clock::now() > deadline)
                return false;
        return true;
    }
    // Waits until the recording is longer than that; false after the time-out.
    bool waitForMoreThan(std::size_t bytes) const
    {
        const auto deadline = std::chrono::steady_clock::now() + 30s;
        while (recorded().size() <= bytes) {
            if (std::chrono::steady_clock::now() > deadline)
                return false;
            std::this_thread::sleep_for(10ms);
        }
        return true;
    }
    [[nodiscard]] std::string root() const { return directory.path() + "/root"; }
    [[nodiscard]] Bytes recorded() const { return readFile(file).value_or(Bytes()); }

    const std::string kDrive = testDataPath("lte-drive.dlf");
    TemporaryDirectory directory;
    const std::string file = directory.path() + "/drive.dlf";
};

constexpr const char* kRow = "\"name\":\"Physical Cell ID\"";

} // namespace

TEST_F(RecordingProgramTest, WhatWasRecordedReplaysToTheSameRowsEvenAfterAKill)
{
    const std::string rows = rowsAtTheEnd(kDrive);
    ASSERT_THAT(rows, HasSubstr("/Serving Cell Info/Physical Cell ID"));
    const auto server = replay();
    const auto viewer = record();
    EXPECT_TRUE(waitForRows(rows));
    viewer->sendSignal(SIGKILL);
    EXPECT_EQ(viewer->waitForEnd(), -SIGKILL);
    EXPECT_EQ(rowsAtTheEnd(file), rows);

    const Bytes bytes = recorded();
    DlfReader reader(bytes);
    EXPECT_EQ(reader.next()->logCode, kDlfVersionReportCode);
    while (const auto item = reader.next())
        EXPECT_EQ(item->type, 1);
    EXPECT_EQ(reader.placedBytes(), bytes.size());
}

TEST_F(RecordingProgramTest, AKillInTheMiddleLeavesAFileThatCanBeRead)
{
    const auto server = telephonyd({"--replay", kDrive, "--speed", "100", "--loop"});
    const auto viewer = record();
    ASSERT_TRUE(viewer->waitForText(kRow));
    viewer->sendSignal(SIGKILL);
    EXPECT_EQ(viewer->waitForEnd(), -SIGKILL);
    EXPECT_THAT(rowsAtTheEnd(file), HasSubstr("/Serving Cell Info/Physical Cell ID"));
}

TEST_F(RecordingProgramTest, AReconnectionGoesOnInTheSameFile)
{
    auto server = telephonyd({"--demo=lte"});
    const auto viewer = record();
    ASSERT_TRUE(viewer->waitForText(kRow));
    server.reset();
    ASSERT_TRUE(viewer->waitForText("\"loading\":true"));
    const std::size_t before = recorded().size();
    ASSERT_GT(before, kDlfVersionReportBytes);
    server = telephonyd({"--demo=utran"});
    ASSERT_TRUE(viewer->waitForText("\"name\":\"RRC Info\""));
    EXPECT_TRUE(waitForMoreThan(before));
    EXPECT_THAT(viewer->errors(), Not(HasSubstr("ecord")));
}

TEST_F(RecordingProgramTest, AnExistingFileIsOverwrittenOnlyByForce)
{
    ASSERT_TRUE(writeFile(file, Bytes{'o', 'l', 'd'}));
    {
        const auto viewer = record();
        EXPECT_EQ(viewer->waitForEnd(), 1);
        EXPECT_THAT(viewer->lines(), IsEmpty());
        EXPECT_EQ(viewer->errors(), "orvane: \"" + file +
                                        "\" already exists: give --force to overwrite it, or "
                                        "another name\n");
        EXPECT_EQ(recorded(), (Bytes{'o', 'l', 'd'}));
    }
    const auto viewer = record({"--force"});
    ASSERT_TRUE(viewer->waitForText("status"));
    EXPECT_EQ(recorded().size(), kDlfVersionReportBytes);
}

TEST_F(RecordingProgramTest, AFileThatCannotBeMadeEndsItBeforeTheView)
{
    for (const std::string& name : {directory.path(), directory.path() + "/nowhere/drive.dlf"}) {
        const auto viewer = record({"--record", name});
        EXPECT_EQ(viewer->waitForEnd(), 1);
        EXPECT_THAT(viewer->lines(), IsEmpty());
        EXPECT_THAT(viewer->errors(), StartsWith("orvane: \"" + name + "\" cannot be written ("));
    }
}

TEST_F(RecordingProgramTest, AFullDiskEndsTheRecordingWhileTheViewGoesOn)
{
    // The shell counts file sizes in units of 512 bytes.
    std::vector<std::string> limited = {"/bin/sh", "-c", "ulimit -f 1; exec \"$0\" \"$@\""};
    for (const std::string& argument : viewerArguments({}))
        limited.push_back(argument);
    const auto server = telephonyd({"--replay", kDrive, "--speed", "100", "--loop"});
    ChildProcess viewer(limited);
    EXPECT_TRUE(viewer.waitForError("Recording to \"" + file +
                                    "\" has ended: File too large. What "
                                    "came before is kept.\n"));
    const Bytes bytes = recorded();
    DlfReader reader(bytes);
    while (reader.next()) {
    }
    EXPECT_THAT(bytes.size(), Ge(kDlfVersionReportBytes + 64U));
    EXPECT_EQ(reader.placedBytes(), bytes.size()) << "whole items only";
    EXPECT_TRUE(viewer.waitForText(kRow));
    EXPECT_TRUE(viewer.waitForText(kRow));
    EXPECT_EQ(recorded(), bytes);
    viewer.writeLine("quit");
    EXPECT_EQ(viewer.waitForEnd(), 0);
}

TEST_F(RecordingProgramTest, ACellMonitorSaysThatThereIsNothingToRecord)
{
    const auto server = telephonyd({"--demo=cellmonitor"});
    const auto viewer = record();
    EXPECT_TRUE(viewer->waitForError("Nothing to record to \"" + file +
                                     "\": a cell monitor has no messages of a modem.\n"));
    ASSERT_TRUE(viewer->waitForText("\"children\":"));
    EXPECT_EQ(recorded().size(), kDlfVersionReportBytes);
}

} // namespace orvane
