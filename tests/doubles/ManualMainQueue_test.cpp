#include "doubles/ManualMainQueue.h"

#include <gmock/gmock.h>

#include <stdexcept>
#include <string>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

class ManualMainQueueTest : public testing::Test
{
protected:
    MainQueue::Task note(std::string text)
    {
        return [this, text] { notes.push_back(text); };
    }

    std::vector<std::string> notes;
    ManualMainQueue queue;
};

TEST_F(ManualMainQueueTest, RunsNothingWithinTheCallThatQueuesIt)
{
    queue.async(note("task"));
    EXPECT_THAT(notes, IsEmpty());
    EXPECT_EQ(queue.waitingTasks(), 1U);
    queue.runPending();
    EXPECT_THAT(notes, ElementsAre("task"));
    EXPECT_EQ(queue.waitingTasks(), 0U);
}

TEST_F(ManualMainQueueTest, RunsTasksInTimeOrderAndOfOneTimeInTheirOwn)
{
    queue.after(2s, note("2 s"));
    queue.after(1s, note("1 s first"));
    queue.after(1s, note("1 s second"));
    queue.async(note("now"));
    queue.advance(2s);
    EXPECT_THAT(notes, ElementsAre("now", "1 s first", "1 s second", "2 s"));
}

TEST_F(ManualMainQueueTest, RunsADelayedTaskNotAnInstantTooSoon)
{
    queue.after(5s, note("task"));
    queue.advance(5s - 1ns);
    EXPECT_THAT(notes, IsEmpty());
    queue.advance(1ns);
    EXPECT_THAT(notes, ElementsAre("task"));
    EXPECT_EQ(queue.now(), 5s);
}

TEST_F(ManualMainQueueTest, RunsWhatTasksQueueAtTheirOwnTime)
{
    queue.after(1s, [this] {
        notes.push_back("first at " + std::to_string(queue.now() / 1s));
        queue.after(1s, [this] { notes.push_back("then at " + std::to_string(queue.now() / 1s)); });
        queue.async(note("soon"));
    });
    queue.advance(10s);
    EXPECT_THAT(notes, ElementsAre("first at 1", "soon", "then at 2"));
}

TEST_F(ManualMainQueueTest, RepeatsATimerUntilItIsInvalidated)
{
    const auto timer = queue.repeatingTimer(2s, note("tick"));
    queue.advance(1999ms);
    EXPECT_THAT(notes, IsEmpty());
    queue.advance(1ms);
    queue.advance(4s);
    EXPECT_THAT(notes, ElementsAre("tick", "tick", "tick"));
    timer->invalidate();
    timer->invalidate();
    queue.advance(10s);
    EXPECT_EQ(notes.size(), 3U);
    EXPECT_EQ(queue.waitingTasks(), 0U);
}

TEST_F(ManualMainQueueTest, StopsATimerThatIsDestroyedEvenFromItsOwnTask)
{
    std::unique_ptr<Timer> timer;
    timer = queue.repeatingTimer(1s, [this, &timer] {
        timer.reset();
        notes.push_back("tick");
    });
    queue.advance(5s);
    EXPECT_THAT(notes, ElementsAre("tick"));
}

TEST_F(ManualMainQueueTest, DropsWhatStillWaitsWhenItIsDestroyed)
{
    const auto held = std::make_shared<int>(0);
    std::unique_ptr<Timer> timer;
    {
        ManualMainQueue other;
        other.async([held, this] { notes.push_back("task"); });
        timer = other.repeatingTimer(1s, [held] {});
        EXPECT_EQ(held.use_count(), 3);
    }
    timer.reset();
    EXPECT_EQ(held.use_count(), 1);
    EXPECT_THAT(notes, IsEmpty());
}

TEST_F(ManualMainQueueTest, ToleratesADroppedTaskWhoseCapturesQueueAnother)
{
    struct QueuesAtTheEnd {
        explicit QueuesAtTheEnd(ManualMainQueue& queue) : _queue(queue) {}
        ~QueuesAtTheEnd()
        {
            _queue.async([] {});
        }
        ManualMainQueue& _queue;
    };
    auto other = std::make_unique<ManualMainQueue>();
    other->async([held = std::make_shared<QueuesAtTheEnd>(*other)] {});
    other.reset();
}

TEST_F(ManualMainQueueTest, FailsATestWhoseTasksQueueThemselvesForEver)
{
    std::function<void()> again = [&] { queue.async(again); };
    again();
    EXPECT_THROW(queue.runPending(), std::logic_error);
}

TEST_F(ManualMainQueueTest, QueuesOfOneClockRunTogetherInTimeOrder)
{
    ManualMainQueue peer(queue);
    peer.after(1s, note("peer 1 s"));
    queue.after(2s, note("queue 2 s"));
    peer.after(3s, note("peer 3 s"));
    queue.advance(2s);
    EXPECT_THAT(notes, ElementsAre("peer 1 s", "queue 2 s"));
    peer.advance(1s);
    EXPECT_EQ(queue.now(), 3s);
    EXPECT_EQ(notes.back(), "peer 3 s");
}

TEST_F(ManualMainQueueTest, WaitingRunsOtherQueuesOnlyUntilToldToStop)
{
    ManualMainQueue peer(queue);
    queue.async(note("own"));
    peer.after(1s, note("peer 1 s"));
    peer.after(2s, note("peer 2 s"));
    queue.runOthers(5s, [this] { return !notes.empty(); });
    EXPECT_THAT(notes, ElementsAre("peer 1 s"));
    EXPECT_EQ(queue.now(), 1s);
}

TEST_F(ManualMainQueueTest, WaitingInVainTurnsTheClockOnByTheTimeout)
{
    queue.after(1s, note("own"));
    queue.runOthers(3s, [] { return false; });
    EXPECT_THAT(notes, IsEmpty());
    EXPECT_EQ(queue.now(), 3s);
    queue.runPending(); // what has become due meanwhile
    EXPECT_THAT(notes, ElementsAre("own"));
}

TEST_F(ManualMainQueueTest, AQueueThatWaitsIsNotRunByOneThatWaitsForIt)
{
    ManualMainQueue peer(queue);
    queue.async(note("own"));
    peer.async([&] { peer.runOthers(1s, [] { return false; }); });
    queue.runOthers(5s, [] { return false; });
    EXPECT_THAT(notes, IsEmpty());
}

TEST_F(ManualMainQueueTest, TicksMissedDuringAWaitComeAsOne)
{
    const auto timer = queue.repeatingTimer(2s, note("tick"));
    queue.runOthers(7s, [] { return false; });
    queue.runPending();
    EXPECT_THAT(notes, ElementsAre("tick"));
    queue.advance(1s); // the grid stays
    EXPECT_THAT(notes, ElementsAre("tick", "tick"));
}

} // namespace
} // namespace orvane
