#include "platform/linux/QtMainQueue.h"

#include "platform/linux/QtTest.h"

#include <optional>
#include <string>
#include <vector>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using SteadyClock = std::chrono::steady_clock;

class QtMainQueueTest : public QtTest
{
protected:
    std::optional<QtMainQueue> queue{std::in_place};
};

TEST_F(QtMainQueueTest, TasksRunInOrderAndNotWithinTheCallThatQueuesThem)
{
    std::string order;
    queue->async([&] {
        queue->async([&] { order += 'c'; });
        order += 'a';
    });
    queue->async([&] { order += 'b'; });
    EXPECT_EQ(order, "");
    EXPECT_TRUE(runUntil([&] { return order.size() == 3; }));
    EXPECT_EQ(order, "abc");
}

TEST_F(QtMainQueueTest, TasksThatWaitAreDroppedWithTheQueue)
{
    const auto watched = std::make_shared<int>(0);
    queue->async([watched] { FAIL(); });
    queue->after(0ns, [watched] { FAIL(); });
    const auto timer = queue->repeatingTimer(1ns, [watched] { FAIL(); });
    queue.reset();
    EXPECT_LE(watched.use_count(), 2) << "only the timer, which outlives its queue, may hold on";
    turnOnce();
    timer->invalidate();
}

TEST_F(QtMainQueueTest, TheQueueMayBeDestroyedWithinItsOwnTask)
{
    bool hasRun = false;
    queue->async([&, captured = std::string(100, 'x')] {
        queue.reset();
        hasRun = captured.size() == 100;
    });
    queue->async([] { FAIL(); });
    EXPECT_TRUE(runUntil([&] { return hasRun; }));
    turnOnce();
}

TEST_F(QtMainQueueTest, TheQueueMayBeDestroyedWithinATimersTask)
{
    bool hasRun = false;
    const auto timer = queue->repeatingTimer(1ms, [&] {
        queue.reset();
        hasRun = true;
    });
    EXPECT_TRUE(runUntil([&] { return hasRun; }));
    turnOnce();
}

TEST_F(QtMainQueueTest, ATaskThatAlwaysQueuesAnotherLeavesTimersTheirTurn)
{
    bool isOver = false;
    std::function<void()> again = [&] {
        if (!isOver)
            queue->async(again);
    };
    again();
    queue->after(5ms, [&] { isOver = true; });
    EXPECT_TRUE(runUntil([&] { return isOver; }));
}

TEST_F(QtMainQueueTest, DelaysAreNeverShortened)
{
    for (const std::chrono::nanoseconds delay : {1ns, 999999ns, 1000001ns, 20000000ns}) {
        const auto start = SteadyClock::now();
        std::optional<SteadyClock::duration> taken;
        queue->after(delay, [&] { taken = SteadyClock::now() - start; });
        ASSERT_TRUE(runUntil([&] { return taken.has_value(); }));
        EXPECT_GE(*taken, delay);
    }
}

TEST_F(QtMainQueueTest, DelaysAndIntervalsOfZeroAndLessRunAtOnce)
{
    int calls = 0;
    queue->after(0ns, [&] { ++calls; });
    queue->after(-5s, [&] { ++calls; });
    const auto zero = queue->repeatingTimer(0ns, [&] { ++calls; });
    const auto negative = queue->repeatingTimer(-5s, [&] { ++calls; });
    EXPECT_EQ(calls, 0);
    EXPECT_TRUE(runUntil([&] { return calls >= 20; }));
}

TEST_F(QtMainQueueTest, DelaysBeyondQtsIntegerDoNotWrapAround)
{
    for (const std::chrono::nanoseconds delay :
         {std::chrono::nanoseconds(2147483648ms), std::chrono::nanoseconds(4294967296ms),
          std::chrono::nanoseconds(4294967297ms), std::chrono::nanoseconds::max()})
        queue->after(delay, [] { FAIL(); });
    const auto timer = queue->repeatingTimer(std::chrono::nanoseconds::max(), [] { FAIL(); });
    bool isOver = false;
    queue->after(20ms, [&] { isOver = true; });
    EXPECT_TRUE(runUntil([&] { return isOver; }));
}

TEST_F(QtMainQueueTest, ARepeatingTimerIsNeverAheadOfItsGrid)
{
    constexpr auto kInterval = 2500us; // between Qt's whole milliseconds
    const auto start = SteadyClock::now();
    int calls = 0;
    const auto timer = queue->repeatingTimer(kInterval, [&] {
        ++calls;
        EXPECT_GE(SteadyClock::now() - start, calls * kInterval) << calls;
    });
    EXPECT_TRUE(runUntil([&] { return calls == 12; }));
}

TEST_F(QtMainQueueTest, ARepeatingTimerDoesNotDrift)
{
    constexpr auto kInterval = 2500us;
    // A timer of whole milliseconds would be four intervals late at the last call. A busy machine
    // may be later, but not each time.
    constexpr int kCalls = 20;
    EXPECT_TRUE(eventually([&] {
        const auto start = SteadyClock::now();
        SteadyClock::time_point last;
        int calls = 0;
        const auto timer = queue->repeatingTimer(kInterval, [&] {
            if (++calls == kCalls)
                last = SteadyClock::now();
        });
        EXPECT_TRUE(runUntil([&] { return calls >= kCalls; }));
        return last - start < (kCalls + 2) * kInterval;
    }));
}

TEST_F(QtMainQueueTest, MissedCallsDoNotComeLater)
{
    int calls = 0;
    const auto timer = queue->repeatingTimer(10ms, [&] {
        if (++calls > 1)
            return;
        const auto end = SteadyClock::now() + 45ms;
        while (SteadyClock::now() < end) {
        }
    });
    const auto start = SteadyClock::now();
    ASSERT_TRUE(runUntil([&] { return calls == 3; }));
    EXPECT_GE(SteadyClock::now() - start, 65ms) << "the missed calls came in a burst";
}

TEST_F(QtMainQueueTest, NoCallComesAfterInvalidation)
{
    int calls = 0;
    std::unique_ptr<Timer> timer = queue->repeatingTimer(1ms, [&] {
        ++calls;
        timer->invalidate();
        timer->invalidate();
    });
    const auto never = queue->repeatingTimer(1ms, [] { FAIL(); });
    never->invalidate();
    bool isOver = false;
    queue->after(20ms, [&] { isOver = true; });
    EXPECT_TRUE(runUntil([&] { return isOver; }));
    EXPECT_EQ(calls, 1);
}

TEST_F(QtMainQueueTest, ATimerMayBeDestroyedWithinItsOwnTask)
{
    std::unique_ptr<Timer> timer;
    std::size_t seen = 0;
    timer = queue->repeatingTimer(1ms, [&, captured = std::string(100, 'x')] {
        timer.reset();
        seen = captured.size();
    });
    EXPECT_TRUE(runUntil([&] { return seen == 100; }));
    turnOnce();
}

TEST_F(QtMainQueueTest, EmptyTasksAreNoTasks)
{
    queue->async({});
    queue->after(0ns, {});
    const auto timer = queue->repeatingTimer(0ns, {});
    bool isOver = false;
    queue->after(1ms, [&] { isOver = true; });
    EXPECT_TRUE(runUntil([&] { return isOver; }));
}

} // namespace
} // namespace orvane
