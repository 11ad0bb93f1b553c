#include "platform/linux/SignalWatcher.h"

#include "platform/linux/QtTest.h"

#include <cstdlib>
#include <optional>
#include <stdexcept>

namespace orvane
{
namespace
{

class SignalWatcherTest : public QtTest
{
protected:
    std::vector<int> received;
    SignalWatcher::Callback record = [this](int signal) { received.push_back(signal); };
};

volatile std::sig_atomic_t handledDirectly = 0;
void handleDirectly(int) { handledDirectly = handledDirectly + 1; }

TEST_F(SignalWatcherTest, SignalsThatEndAProgramBecomeCallsFromTheLoop)
{
    const SignalWatcher watcher(record);
    std::raise(SIGTERM);
    std::raise(SIGINT);
    EXPECT_TRUE(received.empty());
    EXPECT_TRUE(runUntil([&] { return received.size() == 2; }));
    EXPECT_EQ(received, (std::vector{SIGTERM, SIGINT}));
}

TEST_F(SignalWatcherTest, TheEarlierHandlerIsBackAtTheEnd)
{
    const auto before = std::signal(SIGUSR1, handleDirectly);
    handledDirectly = 0;
    {
        const SignalWatcher watcher(record, {SIGUSR1});
        std::raise(SIGUSR1);
        EXPECT_TRUE(runUntil([&] { return received.size() == 1; }));
        EXPECT_EQ(handledDirectly, 0);
    }
    std::raise(SIGUSR1);
    EXPECT_EQ(handledDirectly, 1);
    std::signal(SIGUSR1, before);
}

TEST_F(SignalWatcherTest, TheInnerOfTwoWatchersGetsTheSignal)
{
    const SignalWatcher outer(record, {SIGUSR1});
    {
        int inner = 0;
        const SignalWatcher watcher([&](int) { ++inner; }, {SIGUSR1});
        std::raise(SIGUSR1);
        EXPECT_TRUE(runUntil([&] { return inner == 1; }));
        EXPECT_TRUE(received.empty());
    }
    std::raise(SIGUSR1);
    EXPECT_TRUE(runUntil([&] { return received.size() == 1; }));
}

TEST_F(SignalWatcherTest, AFloodOfSignalsNeitherBlocksNorIsLostAltogether)
{
    const SignalWatcher watcher(record, {SIGUSR1});
    for (int i = 0; i < 70000; ++i) // more than a pipe holds
        std::raise(SIGUSR1);
    EXPECT_TRUE(runUntil([&] { return !received.empty(); }));
}

TEST_F(SignalWatcherTest, TheCallbackMayDestroyTheWatcher)
{
    const auto before = std::signal(SIGUSR1, handleDirectly);
    std::optional<SignalWatcher> watcher;
    int calls = 0;
    watcher.emplace(
        [&](int) {
            ++calls;
            watcher.reset();
        },
        std::vector{SIGUSR1});
    std::raise(SIGUSR1);
    std::raise(SIGUSR1);
    EXPECT_TRUE(runUntil([&] { return calls > 0; }));
    turnOnce();
    EXPECT_EQ(calls, 1);
    std::signal(SIGUSR1, before);
}

TEST_F(SignalWatcherTest, NumbersThatAreNoSignalsAreRefusedAndLeaveNothingBehind)
{
    const auto before = std::signal(SIGUSR1, handleDirectly);
    handledDirectly = 0;
    for (const int number : {-1, 0, SIGKILL, 65, 1000})
        EXPECT_THROW(SignalWatcher(record, {SIGUSR1, number}), std::invalid_argument) << number;
    std::raise(SIGUSR1);
    EXPECT_EQ(handledDirectly, 1);
    std::signal(SIGUSR1, before);
}

// In a process of its own. No event loop runs, as in a program that is stuck.
void raiseEndSignals(int first, int second)
{
    const SignalWatcher watcher([](int) {}, {SIGINT, SIGTERM, SIGHUP},
                                SignalWatcher::Second::EndsProgram);
    std::raise(first);
    std::raise(second);
    std::_Exit(0);
}

TEST_F(SignalWatcherTest, ASecondSignalEndsTheProgramEvenWhereItsLoopDoesNotRun)
{
    EXPECT_EXIT(raiseEndSignals(SIGTERM, SIGTERM), testing::KilledBySignal(SIGTERM), "");
    EXPECT_EXIT(raiseEndSignals(SIGTERM, SIGINT), testing::KilledBySignal(SIGINT), "");
    EXPECT_EXIT(raiseEndSignals(SIGHUP, SIGTERM), testing::KilledBySignal(SIGTERM), "");
    EXPECT_EXIT(raiseEndSignals(SIGTERM, SIGHUP), testing::ExitedWithCode(0), "")
        << "a terminal that closes sends it on its own";
}

TEST_F(SignalWatcherTest, ASecondSignalDoesWhatItDidBeforeTheWatcher)
{
    const auto before = std::signal(SIGTERM, handleDirectly);
    handledDirectly = 0;
    {
        const SignalWatcher watcher(record, {SIGINT, SIGTERM}, SignalWatcher::Second::EndsProgram);
        std::raise(SIGTERM);
        EXPECT_EQ(handledDirectly, 0);
        std::raise(SIGTERM);
        EXPECT_EQ(handledDirectly, 1);
        EXPECT_TRUE(runUntil([&] { return received.size() == 1; }));
    }
    std::signal(SIGTERM, before);
}

} // namespace
} // namespace orvane
