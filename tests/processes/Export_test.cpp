#include "platform/services/FileSystem.h"
#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>

namespace orvane
{

namespace
{

using ::testing::AllOf;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::SizeIs;
using ::testing::StartsWith;

const std::string kDrive = testDataPath("lte-drive.dlf");
constexpr const char* kLevel = "/Serving Cell Measurements/Measured RSRP";
constexpr const char* kCell = "/Serving Cell Info/Physical Cell ID";

std::vector<std::string> exportArguments(std::vector<std::string> more)
{
    std::vector<std::string> all = {ORVANE_PROGRAM, "export", "--log", "none"};
    all.insert(all.end(), more.begin(), more.end());
    return all;
}

// Expects one line on standard error and none on standard output.
void expectFailure(std::vector<std::string> arguments, int status)
{
    ChildProcess program(exportArguments(std::move(arguments)));
    EXPECT_EQ(program.waitForEnd(), status);
    EXPECT_THAT(program.lines(), IsEmpty());
    EXPECT_THAT(program.errors(), StartsWith("orvane: "));
    EXPECT_EQ(std::count(program.errors().begin(), program.errors().end(), '\n'), 1);
}

} // namespace

TEST(ExportProgramTest, TwoRowsOfADriveAsCsv)
{
    ChildProcess program(exportArguments({kDrive, kLevel, kCell}));
    EXPECT_EQ(program.waitForEnd(), 0);
    ASSERT_THAT(program.lines(), SizeIs(151));
    EXPECT_EQ(program.lines()[0], "time,/Serving Cell Measurements/Measured RSRP [dBm],"
                                  "/Serving Cell Info/Physical Cell ID");
    EXPECT_EQ(program.lines()[1], "2026-11-26T10:00:01.950Z,-96.50,68");
    EXPECT_THAT(program.errors(), IsEmpty());
}

TEST(ExportProgramTest, EveryRowAsJsonLines)
{
    ChildProcess program(exportArguments({kDrive}));
    EXPECT_EQ(program.waitForEnd(), 0);
    ASSERT_THAT(program.lines(), SizeIs(150));
    EXPECT_THAT(program.lines()[0],
                AllOf(StartsWith("{\"time\":\"2026-11-26T10:00:01.950Z\",\"/Serving Cell Info/"),
                      HasSubstr(",\"/Serving Cell Measurements/Measured RSRP\":\"-96.50 dBm\",")));
}

TEST(ExportProgramTest, TheListOfPathsExportsAsItStands)
{
    ChildProcess list(exportArguments({"--list", kDrive}));
    EXPECT_EQ(list.waitForEnd(), 0);
    EXPECT_THAT(list.lines(), Contains(kLevel));
    EXPECT_THAT(list.lines(), Contains("/Neighbor Cells List/1/Physical Cell ID"));
    std::vector<std::string> paths = {kDrive};
    paths.insert(paths.end(), list.lines().begin(), list.lines().end());
    ChildProcess program(exportArguments(paths));
    EXPECT_EQ(program.waitForEnd(), 0);
    EXPECT_EQ(std::count(program.lines()[0].begin(), program.lines()[0].end(), ','),
              static_cast<std::ptrdiff_t>(list.lines().size()));
    EXPECT_THAT(program.errors(), IsEmpty());
}

TEST(ExportProgramTest, WhatCannotBeExportedIsOneLineAndStatusOne)
{
    const TemporaryDirectory directory;
    const std::string noRecording = directory.path() + "/notes.txt";
    ASSERT_TRUE(writeFile(noRecording, Bytes(1000, 'x')));
    expectFailure({"/nowhere/drive.dlf"}, 1);
    expectFailure({noRecording}, 1);
    expectFailure({directory.path()}, 1);
    expectFailure({kDrive, "/Nowhere"}, 1);
}

TEST(ExportProgramTest, UnusableArgumentsAreOneLineAndStatusTwo)
{
    expectFailure({}, 2);
    expectFailure({kDrive, "--every", "0"}, 2);
    expectFailure({kDrive, "--format", "xml"}, 2);
    expectFailure({kDrive, "--nonsense"}, 2);
}

TEST(ExportProgramTest, AReaderThatLeavesEndsItNormally)
{
    ChildProcess program(exportArguments({kDrive, "--every", "0.001"}));
    ASSERT_TRUE(program.waitForText("time"));
    program.closeOutput();
    EXPECT_EQ(program.waitForEnd(), 0);
    EXPECT_THAT(program.errors(), IsEmpty());
}

TEST(ExportProgramTest, SignalsEndItInOrderAlsoWhileNobodyReads)
{
    for (const int signal : {SIGINT, SIGTERM}) {
        ChildProcess program(exportArguments({kDrive, "--every", "0.001"}));
        ASSERT_TRUE(program.waitForFullOutput());
        program.sendSignal(signal);
        EXPECT_EQ(program.waitForEnd(), 0);
        EXPECT_THAT(program.errors(), IsEmpty());
    }
}

TEST(ExportProgramTest, AFullDiskUnderTheOutputIsAFailure)
{
    ChildProcess program({"/bin/sh", "-c", "exec \"$0\" export --log none \"$1\" > /dev/full",
                          ORVANE_PROGRAM, kDrive});
    EXPECT_EQ(program.waitForEnd(), 1);
    EXPECT_EQ(program.errors(), "orvane: standard output cannot be written: No space left on "
                                "device; send it somewhere else\n");
}

// `script` gives its command a terminal as standard output and standard error.
TEST(ExportProgramTest, ProgressIsShownOnATerminalThatTheRowsDoNotGoTo)
{
    const std::string command =
        std::string("'") + ORVANE_PROGRAM + "' export --log none '" + kDrive + "'";
    ChildProcess apart({"/usr/bin/script", "-qec", command + " > /dev/null; echo", "/dev/null"});
    EXPECT_EQ(apart.waitForEnd(), 0);
    EXPECT_THAT(apart.lines(), ElementsAre(AllOf(StartsWith("\rReading " + std::string(kDrive)),
                                                 HasSubstr("drive.dlf: 50 %"))));

    ChildProcess together({"/usr/bin/script", "-qec", command, "/dev/null"});
    EXPECT_EQ(together.waitForEnd(), 0);
    EXPECT_THAT(together.lines(), SizeIs(150));
    EXPECT_THAT(together.lines(), ::testing::Each(StartsWith("{")));
}

TEST(ExportProgramTest, HelpSaysWhatItTakes)
{
    ChildProcess help({ORVANE_PROGRAM, "export", "--help"});
    EXPECT_EQ(help.waitForEnd(), 0);
    EXPECT_THAT(help.lines(), Contains("Usage: orvane export FILE [OPTION...] [PATH...]"));
}

} // namespace orvane
