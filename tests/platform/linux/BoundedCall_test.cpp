#include "platform/linux/BoundedCall.h"

#include <gtest/gtest.h>

#include <csignal>
#include <future>
#include <memory>
#include <stdexcept>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

TEST(BoundedCallTest, ATaskThatEndsIsWaitedFor)
{
    bool hasRun = false;
    EXPECT_TRUE(runWithin(60s, [&] { hasRun = true; }));
    EXPECT_TRUE(hasRun);
    EXPECT_EQ(exitStatusAfterTasks(7), 7);
}

TEST(BoundedCallTest, WhatATaskThrowsEndsItAlone)
{
    EXPECT_TRUE(runWithin(60s, [] { throw std::runtime_error("lost"); }));
}

TEST(BoundedCallTest, ATasksThreadGetsNoSignals)
{
    bool isBlocked = false;
    runWithin(60s, [&] {
        sigset_t blocked;
        ::pthread_sigmask(SIG_BLOCK, nullptr, &blocked);
        isBlocked = ::sigismember(&blocked, SIGTERM) == 1;
    });
    EXPECT_TRUE(isBlocked);
    sigset_t own;
    ::pthread_sigmask(SIG_BLOCK, nullptr, &own);
    EXPECT_EQ(::sigismember(&own, SIGTERM), 0);
}

// In a process of its own, which the abandoned task must not keep from ending.
void abandonATask()
{
    static const struct LastWords {
        ~LastWords() { std::_Exit(3); }
    } destroyedAtAnOrdinaryEnd;
    const auto never = std::make_shared<std::promise<void>>();
    const bool hasEnded = runWithin(10ms, [never] { never->get_future().wait(); });
    std::exit(exitStatusAfterTasks(hasEnded ? 2 : 7));
}

TEST(BoundedCallTest, ATaskThatDoesNotEndIsAbandonedAndNothingWaitsForIt)
{
    EXPECT_EXIT(abandonATask(), testing::ExitedWithCode(7), "");
}

} // namespace
} // namespace orvane
