// `orvane --ui terminal` as a user sees it.

#include "processes/support/ChildProcess.h"
#include "screens/terminal/LineWidth.h"
#include "screens/terminal/VirtualTerminal.h"
#include "support/Paths.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <regex>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::AllOf;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::Not;
using ::testing::StartsWith;

namespace fs = std::filesystem;

constexpr const char* kEscape = "\x1b";
constexpr const char* kEnter = "\r";
constexpr const char* kControlZ = "\x1a";
constexpr const char* kDown = "\x1bOB";
constexpr const char* kLeft = "\x1bOD";
constexpr const char* kRight = "\x1bOC";
constexpr const char* kSaveFolder = "/var/mobile/Library/Logs/DiagDrop";
constexpr const char* kMarker = "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle";

class TerminalProgramTest : public ::testing::Test
{
protected:
    std::unique_ptr<VirtualTerminal> start(const std::vector<std::string>& arguments,
                                           const std::vector<std::string>& more = {},
                                           int lines = 24, int columns = 80)
    {
        std::vector<std::string> all = {ORVANE_PROGRAM, "--ui",      "terminal", "--root",
                                        root(),         "--refresh", "0.2"};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return std::make_unique<VirtualTerminal>(all, environment(more), lines, columns);
    }
    std::unique_ptr<VirtualTerminal> startDemo(const std::vector<std::string>& more = {},
                                               int lines = 24, int columns = 80)
    {
        return start({"--demo", "--log", "none"}, more, lines, columns);
    }
    // Whether the place shown becomes that of the last row, as in "11/11".
    static bool waitForLastRow(VirtualTerminal& terminal)
    {
        static const std::regex kLastRow(" ([0-9]+)/\\1\\b");
        return terminal.waitUntil([&] { return std::regex_search(terminal.screen(), kLastRow); });
    }
    // An interactive shell, which can stop and continue the program.
    std::unique_ptr<VirtualTerminal> startShell()
    {
        return std::make_unique<VirtualTerminal>(
            std::vector<std::string>{"bash", "--norc", "--noprofile", "-i"},
            environment({"PS1=ready> "}));
    }
    [[nodiscard]] std::string commandLine(const std::string& arguments) const
    {
        return std::string(ORVANE_PROGRAM) + " --ui terminal --root " + root() +
               " --refresh 0.2 --demo " + arguments + kEnter;
    }
    std::vector<std::string> environment(const std::vector<std::string>& more) const
    {
        std::vector<std::string> all = {"TERM=xterm-256color", "LANG=C.UTF-8", "LC_ALL", "LC_CTYPE",
                                        "NO_COLOR", "LINES", "COLUMNS", "HOME=" + directory.path(),
                                        // The console's mouse driver leaks the terminal's name.
                                        "NCURSES_GPM_TERMS=none"};
        all.insert(all.end(), more.begin(), more.end());
        return all;
    }
    std::unique_ptr<ChildProcess> startServer()
    {
        return std::make_unique<ChildProcess>(std::vector<std::string>{
            TELEPHONYD_PROGRAM, "--ports", ports(), "--log", "none", "--demo=lte"});
    }
    [[nodiscard]] std::string root() const { return directory.path() + "/root"; }
    [[nodiscard]] std::string ports() const { return directory.path() + "/ports"; }
    void offerSaving(bool hasFolder)
    {
        fs::create_directories(root() + kMarker);
        if (hasFolder)
            fs::create_directories(root() + kSaveFolder);
    }
    // The program sends its screen in several writes, so a test must wait for all that it
    // expects.
    static void expectShown(VirtualTerminal& terminal, const std::string& text)
    {
        EXPECT_TRUE(terminal.waitFor(text)) << text << " is not in\n" << terminal.screen();
    }
    static void expectGone(VirtualTerminal& terminal, const std::string& text)
    {
        EXPECT_TRUE(terminal.waitForNo(text)) << text << " is still in\n" << terminal.screen();
    }
    static void expectLine(VirtualTerminal& terminal, int number,
                           const ::testing::Matcher<std::string>& matcher)
    {
        terminal.waitUntil([&] { return matcher.Matches(terminal.line(number)); });
        EXPECT_THAT(terminal.line(number), matcher);
    }
    // Sends the key again after each pause until the text is shown, for a state in which the
    // program may drop keys.
    static bool sendUntilShown(VirtualTerminal& terminal, const std::string& key,
                               const std::string& text, std::chrono::milliseconds pause)
    {
        const auto end = std::chrono::steady_clock::now() + VirtualTerminal::kPatience;
        do {
            terminal.send(key);
            if (terminal.waitUntil([&] { return terminal.shows(text); }, pause))
                return true;
        } while (std::chrono::steady_clock::now() < end);
        return false;
    }
    // Only for a program that has ended and sends nothing more.
    static void expectRestored(const VirtualTerminal& terminal)
    {
        EXPECT_FALSE(terminal.isOnOtherScreen());
        EXPECT_TRUE(terminal.isCursorVisible());
        EXPECT_FALSE(terminal.tellsOfMouse());
        EXPECT_TRUE(terminal.isInLineMode());
    }

    TemporaryDirectory directory;
};

class TerminalKindTest : public TerminalProgramTest,
                         public ::testing::WithParamInterface<const char*>
{
};

class TerminalCrashTest : public TerminalProgramTest, public ::testing::WithParamInterface<int>
{
};

} // namespace

TEST_F(TerminalProgramTest, APersonBrowsesToAValueAndBackAndQuits)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Measurements"));
    expectLine(*terminal, 0, AllOf(StartsWith(" Orvane"), EndsWith("simulated phone")));
    EXPECT_TRUE(terminal->waitUntil([&] {
        return terminal->isOnOtherScreen() && !terminal->isCursorVisible() &&
               terminal->tellsOfMouse();
    }));
    terminal->send(std::string(kDown) + kEnter);
    ASSERT_TRUE(terminal->waitFor("Measured RSRP"));
    expectLine(*terminal, 0, StartsWith(" Orvane › Serving Cell Measurements"));
    terminal->send(kLeft);
    ASSERT_TRUE(terminal->waitFor("Neighbor Cells List"));
    EXPECT_TRUE(terminal->waitUntil([&] {
        return terminal->isReversed("Serving Cell Measurements");
    })) << "still selected";
    terminal->send("q");
    EXPECT_EQ(terminal->waitForEnd(), 0);
    expectRestored(*terminal);
}

TEST_F(TerminalProgramTest, EscapeLeadsBackWithoutNoticeableDelay)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    // A busy machine can delay a round, but not all. ncurses' own delay is a second.
    constexpr int kRounds = 20;
    auto shortest = std::chrono::steady_clock::duration::max();
    for (int round = 0; round < kRounds && shortest >= 500ms; ++round) {
        terminal->send(kRight);
        ASSERT_TRUE(terminal->waitFor("Tracking Area Code"));
        const auto start = std::chrono::steady_clock::now();
        terminal->send(kEscape);
        ASSERT_TRUE(terminal->waitFor("Neighbor Cells List"));
        shortest = std::min(shortest, std::chrono::steady_clock::now() - start);
    }
    EXPECT_LT(shortest, 500ms);
}

TEST_F(TerminalProgramTest, KeysWithoutAMeaningDoNothing)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send("\x1b[1;5C\x1bx\x1b[25~zZ\x1b[200~pasted q\x1b[201~?");
    ASSERT_TRUE(terminal->waitFor("filter as you type")) << "the last key, at the root";
}

TEST_F(TerminalProgramTest, WhatTheTerminalAnswersIsNoKeys)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    for (const char* begin : {"]", "P", "_", "^", "X"}) {
        terminal->send(std::string(kEscape) + begin + "0;evil q\x07");
        terminal->send(std::string(kEscape) + begin + "evil q\x1b\\");
    }
    terminal->send("?");
    ASSERT_TRUE(terminal->waitFor("filter as you type")) << terminal->screen();
}

TEST_F(TerminalProgramTest, AnEndlessAnswerDoesNotKeepTheKeysForEver)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send(kEscape + ("]" + std::string(2000, 'x')));
    // A pause ends the answer.
    EXPECT_TRUE(sendUntilShown(*terminal, "?", "filter as you type", 500ms)) << terminal->screen();
}

TEST_F(TerminalProgramTest, TheCodesOfOtherTerminalsForTheSameKeysWorkToo)
{
    const auto terminal = startDemo({}, 10);
    ASSERT_TRUE(terminal->waitFor(" 1/"));
    for (const std::string end : {"[4~", "[F", "[8~", "OF"})
        for (const std::string home : {"[1~", "[H", "[7~", "OH"}) {
            terminal->send(kEscape + end);
            ASSERT_TRUE(waitForLastRow(*terminal)) << end;
            terminal->send(kEscape + home);
            ASSERT_TRUE(terminal->waitFor(" 1/")) << home;
        }
    for (const std::string kind : {"[", "O"}) {
        terminal->send(kEscape + kind + "B");
        ASSERT_TRUE(terminal->waitFor(" 2/")) << kind;
        terminal->send(kEscape + kind + "A");
        ASSERT_TRUE(terminal->waitFor(" 1/")) << kind;
    }
    terminal->send(std::string(kEscape) + "[6~");
    ASSERT_TRUE(terminal->waitFor(" 7/")) << terminal->screen();
    terminal->send(std::string(kEscape) + "[5~");
    ASSERT_TRUE(terminal->waitFor(" 1/"));
}

TEST_F(TerminalProgramTest, APasteWhoseEndIsLostEndsWithAPause)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send("\x1b[200~xyz?");
    EXPECT_FALSE(
        terminal->waitUntil([&] { return terminal->shows("filter as you type"); }, 1200ms));
    EXPECT_TRUE(sendUntilShown(*terminal, "?", "filter as you type", 2000ms)) << terminal->screen();
}

TEST_F(TerminalProgramTest, ControlCEndsItInOrderAlsoWithinAPaste)
{
    for (const std::string before : {"", "\x1b[200~xyz"}) {
        const auto terminal = startDemo();
        ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
        terminal->send(before + "\x03");
        EXPECT_EQ(terminal->waitForEnd(), 0);
        expectRestored(*terminal);
    }
}

TEST_F(TerminalProgramTest, TheFilterNarrowsTheRows)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send("/neigh");
    ASSERT_TRUE(terminal->waitFor("Filter: neigh"));
    expectGone(*terminal, "Serving Cell Info");
    expectShown(*terminal, "Neighbor Cells List");
    EXPECT_TRUE(terminal->waitUntil([&] { return terminal->isCursorVisible(); }));
    terminal->send(kEscape);
    expectShown(*terminal, "Serving Cell Info");
}

TEST_F(TerminalProgramTest, AResizeIsFollowed)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->resize(10, 40);
    ASSERT_TRUE(terminal->waitUntil([&] {
        return terminal->line(0) == " Orvane                       simulated" &&
               terminal->line(9).find("q quit") != std::string::npos;
    })) << terminal->screen();
    terminal->resize(100, 300);
    ASSERT_TRUE(terminal->waitUntil([&] {
        return columnsOf(terminal->line(0)) == 299 && terminal->shows("PDP Context Info") &&
               terminal->line(99).find("q quit") != std::string::npos;
    })) << terminal->screen();
    expectShown(*terminal, "Serving Cell Info");
}

TEST_F(TerminalProgramTest, ASnapshotIsSavedWithADescription)
{
    offerSaving(true);
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send("s");
    ASSERT_TRUE(terminal->waitFor("What will be saved:"));
    terminal->send("bei der Brücke 世界");
    ASSERT_TRUE(terminal->waitFor("Description: bei der Brücke 世界"));
    terminal->send(kEnter);
    ASSERT_TRUE(terminal->waitFor("Enter save"));
    terminal->send(kEnter);
    ASSERT_TRUE(terminal->waitFor("[ Close ]"));
    expectShown(*terminal, "Saved");
    expectShown(*terminal, "OrvaneSnapshot-");
    terminal->send(kEnter);
    expectGone(*terminal, "[ Close ]");
    expectShown(*terminal, "Serving Cell Info");
    const fs::directory_iterator files(root() + kSaveFolder);
    ASSERT_NE(files, fs::directory_iterator());
    EXPECT_THAT(files->path().filename().string(), StartsWith("OrvaneSnapshot-"));
    EXPECT_GT(fs::file_size(files->path()), 100U);
}

TEST_F(TerminalProgramTest, WhereTheFolderCannotBeMadeTheAlertIsShown)
{
    offerSaving(false);
    std::ofstream(root() + "/var") << "not a folder";
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    terminal->send(std::string("s") + kEnter + kEnter);
    ASSERT_TRUE(terminal->waitFor("File Error"));
    expectShown(*terminal, "Unable to write file to disk");
    expectShown(*terminal, "[ Close ]");
    terminal->send(kEnter);
    expectGone(*terminal, "File Error");
}

TEST_F(TerminalProgramTest, AnAbsentServerIsWaitedForAndAKilledOneShows)
{
    const auto terminal = start({"--ports", ports(), "--log", "none"});
    ASSERT_TRUE(terminal->waitFor("Waiting for the telephony server"));
    EXPECT_TRUE(terminal->waitFor("Start telephonyd"));
    EXPECT_TRUE(terminal->waitFor("Connecting..."));
    auto server = startServer();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    ASSERT_TRUE(terminal->waitFor("Updated 20"));
    EXPECT_FALSE(terminal->shows("simulated phone"));
    server->sendSignal(SIGKILL);
    ASSERT_TRUE(terminal->waitFor("Connecting..."));
    expectShown(*terminal, "Serving Cell Info"); // rows stay
    const std::string status = terminal->line(22);
    EXPECT_TRUE(terminal->waitUntil([&] { return terminal->line(22) != status; })) << "it turns";
    server = startServer();
    EXPECT_TRUE(terminal->waitFor("Updated 20"));
}

TEST_F(TerminalProgramTest, ARefreshOfTheServingMeasurementsSendsLittle)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Measurements"));
    terminal->send(std::string(kDown) + kEnter);
    ASSERT_TRUE(terminal->waitFor("Measured RSRP"));
    // Waits until the time in the status has changed five times. There are at most as many
    // refreshes as periods; a busy machine makes fewer.
    const auto start = std::chrono::steady_clock::now();
    const std::size_t before = terminal->received().size();
    for (int i = 0; i < 5; ++i) {
        const std::string status = terminal->line(22);
        ASSERT_TRUE(terminal->waitUntil([&] { return terminal->line(22) != status; }));
    }
    const auto refreshes =
        static_cast<std::size_t>((std::chrono::steady_clock::now() - start) / 200ms) + 1;
    const std::size_t bytes = (terminal->received().size() - before) / refreshes;
    RecordProperty("BytesARefresh", static_cast<int>(bytes));
    EXPECT_LT(bytes, 512U);
}

TEST_F(TerminalProgramTest, ChangedValuesAreMarked)
{
    const auto terminal = startDemo();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Measurements"));
    terminal->send(std::string(kDown) + kEnter);
    ASSERT_TRUE(terminal->waitFor("Average RSRP"));
    EXPECT_TRUE(terminal->waitUntil([&] {
        const std::string row = terminal->line(5);
        return row.find("Measured RSRP") != std::string::npos && row.find('-') < row.size() &&
               terminal->isBold(row.substr(row.find('-')));
    })) << terminal->screen();
}

TEST_F(TerminalProgramTest, TextsKeepTheTerminalsColoursAndOnlyMarksAreColoured)
{
    const auto play = [this](const std::vector<std::string>& more) {
        return std::make_unique<VirtualTerminal>(
            std::vector<std::string>{ORVANE_PROGRAM, "open", testDataPath("lte-drive-damaged.dlf"),
                                     "--ui", "terminal", "--log", "none"},
            environment(more));
    };
    const auto terminal = play({});
    ASSERT_TRUE(terminal->waitUntil([&] { return terminal->isColoured("\u2016"); }))
        << "the mark of a recording that is paused";
    for (const char* text : {"Orvane", "paused", "q quit", "could not be placed"}) {
        ASSERT_TRUE(terminal->waitFor(text)) << terminal->screen();
        EXPECT_FALSE(terminal->isColoured(text)) << text;
    }
    EXPECT_TRUE(terminal->isReversed("Orvane"));
    EXPECT_TRUE(terminal->isBold("q quit"));
    const auto plain = play({"NO_COLOR=1"});
    ASSERT_TRUE(plain->waitFor("q quit"));
    ASSERT_TRUE(plain->waitFor("paused"));
    EXPECT_FALSE(plain->isColoured("\u2016"));
}

TEST_F(TerminalProgramTest, WithoutUtf8OnlyAsciiIsSent)
{
    const auto terminal = startDemo({"LANG=C"});
    ASSERT_TRUE(terminal->waitFor("Serving Cell Measurements"));
    terminal->send(kEnter);
    ASSERT_TRUE(terminal->waitFor("Orvane > Serving Cell Info"));
    for (const char character : terminal->received())
        ASSERT_LT(static_cast<unsigned char>(character), 0x80);
}

TEST_F(TerminalProgramTest, TheMouseOpensAndScrolls)
{
    const auto terminal = startDemo({}, 10, 80);
    ASSERT_TRUE(terminal->waitFor(" 1/"));
    terminal->send("\x1b[<65;5;5M");
    ASSERT_TRUE(terminal->waitFor(" 4/"));
    terminal->send("\x1b[<64;5;5M\x1b[<0;5;2M\x1b[<0;5;2m");
    EXPECT_TRUE(terminal->waitFor("Tracking Area Code")) << terminal->screen();
}

TEST_F(TerminalProgramTest, ControlZGivesTheTerminalBackAndTheShellContinues)
{
    const auto shell = startShell();
    ASSERT_TRUE(shell->waitFor("ready>"));
    shell->send(commandLine("--log none"));
    ASSERT_TRUE(shell->waitFor("Serving Cell Info"));
    shell->send(kControlZ);
    ASSERT_TRUE(shell->waitFor("Stopped")) << shell->screen();
    EXPECT_TRUE(
        shell->waitUntil([&] { return !shell->isOnOtherScreen() && !shell->tellsOfMouse(); }));
    const std::size_t before = shell->received().size();
    shell->send(std::string("fg") + kEnter);
    ASSERT_TRUE(shell->waitUntil(
        [&] { return shell->isOnOtherScreen() && shell->shows("Serving Cell Info"); }));
    EXPECT_TRUE(shell->waitUntil([&] { return !shell->isInLineMode(); }));
    shell->send(kEnter);
    ASSERT_TRUE(shell->waitFor("Tracking Area Code"));
    const std::string sent = shell->received().substr(before);
    const std::string clear = "\x1b[2J";
    ASSERT_THAT(sent, HasSubstr(clear));
    EXPECT_EQ(sent.find(clear, sent.find(clear) + 1), std::string::npos) << "drawn twice";
    shell->send("q");
    EXPECT_TRUE(shell->waitUntil([&] { return !shell->isOnOtherScreen(); }));
}

TEST_F(TerminalProgramTest, ASuspendedProgramEndsInOrderWhenTheShellKillsIt)
{
    const auto shell = startShell();
    ASSERT_TRUE(shell->waitFor("ready>"));
    shell->send(commandLine("--log none"));
    ASSERT_TRUE(shell->waitFor("Serving Cell Info"));
    shell->send(kControlZ);
    ASSERT_TRUE(shell->waitFor("Stopped"));
    const std::size_t before = shell->received().size();
    shell->send(std::string("kill %1; wait -f %1; echo status $?.") + kEnter);
    EXPECT_TRUE(shell->waitFor("status 0.")) << shell->screen();
    EXPECT_THAT(shell->received().substr(before), Not(HasSubstr("\x1b[?1049")));
}

TEST_F(TerminalProgramTest, InTheBackgroundItLeavesTheTerminalToTheShellUntilItIsInFront)
{
    const auto shell = startShell();
    ASSERT_TRUE(shell->waitFor("ready>"));
    shell->send(commandLine("--log none"));
    ASSERT_TRUE(shell->waitFor("Serving Cell Info"));
    shell->send(kControlZ);
    ASSERT_TRUE(shell->waitFor("Stopped"));
    shell->send(std::string("bg; sleep 0.5; jobs; echo do''ne") + kEnter);
    ASSERT_TRUE(shell->waitFor("done")) << shell->screen();
    expectShown(*shell, "Running");
    EXPECT_FALSE(shell->isOnOtherScreen());
    shell->send(std::string("fg") + kEnter);
    ASSERT_TRUE(shell->waitUntil([&] {
        return shell->isOnOtherScreen() && shell->shows("Serving Cell Info");
    })) << shell->screen();
    shell->send("q");
    EXPECT_TRUE(shell->waitUntil([&] { return !shell->isOnOtherScreen(); }));
}

TEST_F(TerminalProgramTest, LogLinesWaitUntilTheScreenIsRestored)
{
    const auto terminal = start({"--ports", ports(), "--log", "stderr"});
    ASSERT_TRUE(terminal->waitFor("Waiting for the telephony server"));
    auto server = startServer();
    ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
    EXPECT_THAT(terminal->received(), Not(HasSubstr("error:")));
    terminal->send("q");
    EXPECT_EQ(terminal->waitForEnd(), 0);
    const std::string& all = terminal->received();
    const auto restored = all.rfind("\x1b[?1049l");
    ASSERT_NE(restored, std::string::npos);
    EXPECT_THAT(all.substr(restored), HasSubstr("error: Could not create TSServerConnection\r\n"));
}

TEST_F(TerminalProgramTest, LogLinesThatGoElsewhereDoNotWait)
{
    const auto shell = startShell();
    ASSERT_TRUE(shell->waitFor("ready>"));
    const std::string log = directory.path() + "/log";
    shell->send(std::string(ORVANE_PROGRAM) + " --ui terminal --log stderr --ports " + ports() +
                " 2>" + log + kEnter);
    ASSERT_TRUE(shell->waitFor("Waiting for the telephony server"));
    EXPECT_TRUE(shell->waitUntil([&] { return fs::file_size(log) > 0; }));
}

TEST_F(TerminalProgramTest, SignalsEndItInOrder)
{
    for (const int signal : {SIGTERM, SIGINT, SIGHUP}) {
        const auto terminal = startDemo();
        ASSERT_TRUE(terminal->waitFor("Serving Cell Info"));
        terminal->sendSignal(signal);
        EXPECT_EQ(terminal->waitForEnd(), 0);
        expectRestored(*terminal);
    }
}

TEST_P(TerminalCrashTest, TheTerminalIsRestored)
{
    const auto terminal = start({"--ports", ports(), "--log", "stderr"});
    ASSERT_TRUE(terminal->waitFor("⠹ Connecting...")); // after the first attempt
    terminal->sendSignal(GetParam());
    const auto status = terminal->waitForEnd();
    ASSERT_TRUE(status);
    EXPECT_NE(*status, 0);
    expectRestored(*terminal);
    EXPECT_THAT(terminal->received(), HasSubstr("error: Could not create TSServerConnection"));
}

INSTANTIATE_TEST_SUITE_P(Signals, TerminalCrashTest,
                         ::testing::Values(SIGSEGV, SIGABRT, SIGBUS, SIGFPE, SIGILL, SIGQUIT,
                                           SIGUSR1),
                         [](const auto& parameter) {
                             return std::string(sigabbrev_np(parameter.param));
                         });

TEST_P(TerminalKindTest, ShowsThePanesAndIsRestored)
{
    const auto terminal = startDemo({std::string("TERM=") + GetParam()});
    ASSERT_TRUE(terminal->waitFor("Serving Cell Measurements"));
    expectLine(*terminal, 0, AllOf(StartsWith(" Orvane"), EndsWith("simulated phone")));
    terminal->send(kEnter);
    ASSERT_TRUE(terminal->waitFor("Tracking Area Code"));
    expectLine(*terminal, 23, HasSubstr("q quit"));
    terminal->send("h");
    ASSERT_TRUE(terminal->waitFor("Neighbor Cells List"));
    terminal->send("q");
    EXPECT_EQ(terminal->waitForEnd(), 0);
    expectRestored(*terminal);
}

INSTANTIATE_TEST_SUITE_P(Kinds, TerminalKindTest,
                         ::testing::Values("xterm-256color", "xterm", "linux", "tmux",
                                           "tmux-256color", "screen", "vt100"),
                         [](const auto& parameter) {
                             std::string name = parameter.param;
                             std::replace(name.begin(), name.end(), '-', '_');
                             return name;
                         });

TEST_F(TerminalProgramTest, ATerminalThatCannotMoveItsCursorIsRefusedWithAdvice)
{
    const auto dumb = startDemo({"TERM=dumb"});
    EXPECT_EQ(dumb->waitForEnd(), 1);
    EXPECT_THAT(dumb->received(), HasSubstr("--ui text"));
    EXPECT_THAT(dumb->received(), Not(HasSubstr("\x1b")));
    const auto unknown = startDemo({"TERM=no-such-terminal"});
    EXPECT_EQ(unknown->waitForEnd(), 1);
    EXPECT_THAT(unknown->received(), HasSubstr("no-such-terminal"));
}

TEST_F(TerminalProgramTest, WithoutADisplayTheTerminalIsChosenAndTextWhereItCannotBe)
{
    const std::vector<std::string> arguments = {ORVANE_PROGRAM, "--demo", "--root", root()};
    VirtualTerminal able(arguments, environment({"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"}));
    ASSERT_TRUE(able.waitFor("q quit"));
    VirtualTerminal dumb(
        arguments, environment({"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM", "TERM=dumb"}));
    EXPECT_TRUE(dumb.waitFor("Connecting (simulated phone)"));
}

} // namespace orvane
