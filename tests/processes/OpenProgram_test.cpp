// `orvane open FILE` as a user runs it.

#include "dlf/DlfReader.h"
#include "platform/services/FileSystem.h"
#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/Sanitizers.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <csignal>
#include <filesystem>
#include <fstream>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::AllOf;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

std::string recording(const std::string& name) { return testDataPath(name); }

std::unique_ptr<ChildProcess> orvane(std::vector<std::string> arguments)
{
    std::vector<std::string> all = {ORVANE_PROGRAM, "open", "--log", "none"};
    all.insert(all.end(), arguments.begin(), arguments.end());
    return std::make_unique<ChildProcess>(all);
}

// Resident memory of the process, in kilobytes.
long residentKilobytes(pid_t pid)
{
    std::ifstream status("/proc/" + std::to_string(pid) + "/status");
    for (std::string line; std::getline(status, line);)
        if (line.starts_with("VmRSS:"))
            return std::stol(line.substr(6));
    return 0;
}

// Writes the LTE drive over and over, each round later than the last, up to that many bytes.
std::string longDrive(const TemporaryDirectory& directory, std::size_t bytes)
{
    const Bytes drive = readFile(recording("lte-drive.dlf")).value_or(Bytes());
    const std::string path = directory.path() + "/long.dlf";
    std::ofstream file(path, std::ios::binary);
    const std::uint64_t roundLength = (std::uint64_t{301} * 800) << 16;
    std::size_t written = 0;
    for (std::uint64_t round = 0; written < bytes; ++round) {
        DlfReader reader(drive);
        while (const auto item = reader.next()) {
            Bytes copy(item->bytes.begin(), item->bytes.end());
            const std::uint64_t timestamp =
                item->timestamp == 0 ? 0 : item->timestamp + round * roundLength;
            for (int i = 0; i < 8; ++i)
                copy[static_cast<std::size_t>(4 + i)] =
                    static_cast<std::uint8_t>(timestamp >> 8 * i);
            file.write(reinterpret_cast<const char*>(copy.data()),
                       static_cast<std::streamsize>(copy.size()));
            written += copy.size();
        }
    }
    return path;
}

TEST(OpenProgramTest, AFilesNameDoesNotActOnTheTerminal)
{
    const auto program = orvane({"/missing/\x1b[2J\u009b.dlf", "--ui", "text"});
    EXPECT_EQ(program->waitForEnd(), 1);
    EXPECT_THAT(program->errors(), HasSubstr("/missing/\uFFFD[2J\uFFFD.dlf"));
    EXPECT_EQ(program->errors().find('\x1b'), std::string::npos);
}

TEST(OpenProgramTest, ALogIsALineAPeriodAndThenTheProgramEnds)
{
    const auto program = orvane({recording("lte-drive.dlf"), "--ui", "json"});
    EXPECT_EQ(program->waitForEnd(), 0);
    ASSERT_EQ(program->lines().size(), 150U);
    EXPECT_THAT(program->lines().front(),
                AllOf(StartsWith("{\"status\":\"2026-11-26 10:00:01 UTC\",\"loading\":false,"),
                      EndsWith(",\"time\":\"2026-11-26T10:00:01.950Z\"}")));
    for (const std::string& line : program->lines())
        EXPECT_THAT(line, HasSubstr("\"tree\":{\"name\":\"Orvane\""));
}

TEST(OpenProgramTest, PeriodsAreAsLongAsTheRefreshPeriod)
{
    const auto program = orvane({recording("lte-drive.dlf"), "--ui", "json", "--refresh", "100"});
    EXPECT_EQ(program->waitForEnd(), 0);
    EXPECT_EQ(program->lines().size(), 3U);
}

TEST(OpenProgramTest, ADamagedLogShowsWhatCanBePlacedAndTellsTheRest)
{
    const auto program = orvane({recording("lte-drive-damaged.dlf"), "--ui", "text"});
    EXPECT_EQ(program->waitForEnd(), 0);
    EXPECT_GT(program->lines().size(), 5000U);
    EXPECT_THAT(program->errors(),
                EndsWith("lte-drive-damaged.dlf: 198 bytes could not be placed: 67 at byte 35165, "
                         "131 at byte 70228\n"));
}

// Runs a shell command with $orvane as the program and $log as a recording.
ChildProcess shell(const std::string& command)
{
    return ChildProcess({"/bin/sh", "-c", command}, {std::string("orvane=") + ORVANE_PROGRAM,
                                                     "log=" + recording("lte-drive.dlf")});
}

TEST(OpenProgramTest, AFileNameAloneIsOpened)
{
    ChildProcess program = shell("\"$orvane\" --log none --ui json \"$log\" | wc -l");
    EXPECT_EQ(program.waitForEnd(), 0);
    EXPECT_THAT(program.lines(), ElementsAre("150"));
}

TEST(OpenProgramTest, ARecordingComesFromStandardInputToo)
{
    for (const char* command : {"open - --ui json", "- --ui json", "export -"}) {
        ChildProcess program =
            shell("cat \"$log\" | \"$orvane\" --log none " + std::string(command) + " | wc -l");
        EXPECT_EQ(program.waitForEnd(), 0) << command;
        EXPECT_THAT(program.lines(), ElementsAre("150")) << command;
    }
}

TEST(OpenProgramTest, AnEmptyStandardInputIsOneClearLine)
{
    ChildProcess program = shell("\"$orvane\" --log none export - </dev/null");
    EXPECT_EQ(program.waitForEnd(), 1);
    EXPECT_THAT(program.errors(), StartsWith("orvane: "));
}

TEST(OpenProgramTest, WhatCannotBeOpenedIsOneClearLine)
{
    const TemporaryDirectory directory;
    const std::string text = directory.path() + "/a.dlf";
    ASSERT_TRUE(writeFile(text, Bytes(1000, 'x')));
    const struct {
        std::string file;
        const char* error;
    } cases[] = {
        {directory.path() + "/none", "(No such file or directory)"},
        {directory.path(),           "(Is a directory)"           },
        {text,                       "is neither a diagnostic log"},
    };
    for (const auto& each : cases)
        for (const char* frontEnd : {"json", "text"}) {
            const auto program = orvane({each.file, "--ui", frontEnd});
            EXPECT_EQ(program->waitForEnd(), 1);
            EXPECT_THAT(program->errors(), AllOf(StartsWith("orvane: "), HasSubstr(each.error)));
            EXPECT_EQ(std::count(program->errors().begin(), program->errors().end(), '\n'), 1);
            EXPECT_THAT(program->lines(), IsEmpty());
        }
}

TEST(OpenProgramTest, UnusableArgumentsAreStatusTwo)
{
    const auto program = orvane({});
    EXPECT_EQ(program->waitForEnd(), 2);
}

TEST(OpenProgramTest, ASlowReaderCostsNoMemoryAndASignalEndsTheProgram)
{
    const TemporaryDirectory directory;
    const std::string path = longDrive(directory, 20'000'000);
    const auto program = orvane({path, "--ui", "json"});
    // Nobody reads, until the pipe is full and the program waits.
    ASSERT_TRUE(program->waitForFullOutput());
    if (!ORVANE_ADDRESS_SANITIZER) {
        EXPECT_LT(residentKilobytes(program->pid()), 60'000);
    }
    program->sendSignal(SIGINT);
    EXPECT_EQ(program->waitForEnd(), 0);
    EXPECT_THAT(program->errors(), IsEmpty());
}

TEST(OpenProgramTest, AReaderThatGoesEndsTheProgram)
{
    const TemporaryDirectory directory;
    const auto program = orvane({longDrive(directory, 5'000'000), "--ui", "json"});
    ASSERT_TRUE(program->waitForText("Orvane"));
    program->closeOutput();
    EXPECT_EQ(program->waitForEnd(), 0);
}

TEST(OpenProgramTest, CommandsAreTakenAndQuitEndsTheProgram)
{
    const TemporaryDirectory directory;
    const auto program = orvane({longDrive(directory, 20'000'000), "--ui", "json"});
    program->writeLine("save me");
    EXPECT_TRUE(program->waitForText("{\"error\":"));
    program->writeLine("quit");
    EXPECT_EQ(program->waitForEnd(), 0);
}

} // namespace
} // namespace orvane
