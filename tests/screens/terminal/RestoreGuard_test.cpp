#include "screens/terminal/RestoreGuard.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <pty.h>
#include <stdexcept>
#include <string>
#include <sys/resource.h>
#include <sys/wait.h>
#include <termios.h>
#include <thread>
#include <unistd.h>

namespace orvane
{

namespace
{

using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;

// The result of running a function in a child process at a terminal.
struct Outcome {
    std::string output;
    int status = 0; // as of waitpid()
};

Outcome outcomeOf(const std::function<void()>& body)
{
    int terminal = -1;
    const pid_t process = ::forkpty(&terminal, nullptr, nullptr, nullptr);
    if (process == 0) {
        const rlimit noCore{0, 0};
        ::setrlimit(RLIMIT_CORE, &noCore);
        body();
        ::_exit(0);
    }
    Outcome outcome;
    std::array<char, 4096> block{};
    ssize_t count = 0;
    while ((count = ::read(terminal, block.data(), block.size())) > 0)
        outcome.output.append(block.data(), static_cast<std::size_t>(count));
    ::close(terminal);
    ::waitpid(process, &outcome.status, 0);
    return outcome;
}

void say(const char* text) { std::fputs(text, stderr); }

} // namespace

TEST(RestoreGuardTest, ErrorLinesComeOutOnceTheScreenIsGone)
{
    const Outcome outcome = outcomeOf([] {
        RestoreGuard guard(STDOUT_FILENO);
        guard.arm("never written");
        say("held\n");
        [[maybe_unused]] const auto written = ::write(STDOUT_FILENO, "screen\n", 7);
        guard.disarm();
        say("after\n");
    });
    EXPECT_EQ(outcome.output, "screen\r\nheld\r\nafter\r\n");
}

TEST(RestoreGuardTest, OfManyLinesTheLatestAreKept)
{
    const Outcome outcome = outcomeOf([] {
        RestoreGuard guard(STDOUT_FILENO);
        guard.arm("");
        for (int i = 0; i < 20000; ++i) {
            std::fprintf(stderr, "line %d\n", i);
            if (i % 100 == 0)
                guard.heldErrors().collect();
        }
        guard.disarm();
    });
    EXPECT_THAT(outcome.output, StartsWith("(earlier lines were too many to keep)\r\nline "));
    EXPECT_THAT(outcome.output, EndsWith("line 19999\r\n"));
    EXPECT_LT(outcome.output.size(), 80U * 1024);
}

TEST(RestoreGuardTest, WritersNeverWaitForSomebodyToCollect)
{
    const Outcome outcome = outcomeOf([] {
        RestoreGuard guard(STDOUT_FILENO);
        guard.arm("");
        for (int i = 0; i < 50000; ++i)
            std::fprintf(stderr, "line %d\n", i);
        guard.disarm();
    });
    EXPECT_THAT(outcome.output, StartsWith("line 0\r\n"));
    EXPECT_TRUE(WIFEXITED(outcome.status));
}

TEST(RestoreGuardTest, AnUncaughtExceptionRestoresAndTells)
{
    const Outcome outcome = outcomeOf([] {
        RestoreGuard guard(STDOUT_FILENO);
        guard.arm("restored;");
        std::thread([] { throw std::runtime_error("what was wrong"); }).join();
    });
    EXPECT_THAT(outcome.output, StartsWith("restored;"));
    EXPECT_THAT(outcome.output, HasSubstr("what was wrong"));
    EXPECT_TRUE(WIFSIGNALED(outcome.status));
}

TEST(RestoreGuardTest, AnExitFromDeepDownRestores)
{
    const Outcome outcome = outcomeOf([] {
        RestoreGuard guard(STDOUT_FILENO);
        guard.arm("restored;");
        std::exit(3);
    });
    EXPECT_THAT(outcome.output, StartsWith("restored;"));
    EXPECT_EQ(WEXITSTATUS(outcome.status), 3);
}

TEST(RestoreGuardTest, ACrashBringsTheModesBack)
{
    int terminal = -1;
    int programsEnd = -1;
    ASSERT_EQ(::openpty(&terminal, &programsEnd, nullptr, nullptr, nullptr), 0);
    const pid_t process = ::fork();
    if (process == 0) {
        RestoreGuard guard(programsEnd);
        guard.arm("");
        termios raw{};
        ::cfmakeraw(&raw);
        ::tcsetattr(programsEnd, TCSANOW, &raw);
        ::raise(SIGUSR1);
    }
    ::waitpid(process, nullptr, 0);
    termios modes{};
    ASSERT_EQ(::tcgetattr(programsEnd, &modes), 0);
    EXPECT_TRUE(modes.c_lflag & ECHO);
    EXPECT_TRUE(modes.c_lflag & ICANON);
    ::close(terminal);
    ::close(programsEnd);
}

TEST(RestoreGuardTest, UnarmedItWritesNothing)
{
    const Outcome outcome = outcomeOf([] {
        const RestoreGuard guard(STDOUT_FILENO);
        say("told at once\n");
        ::raise(SIGUSR1);
    });
    EXPECT_EQ(outcome.output, "told at once\r\n");
    EXPECT_EQ(WTERMSIG(outcome.status), SIGUSR1);
}

} // namespace orvane
