#pragma once

#include "platform/services/MainQueue.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <vector>

namespace orvane
{

// A main queue on a clock that only the test advances.
//
// Tasks run in the order of their times; tasks of the same time, in the order of queuing. Several
// queues may share one clock, as processes of one machine do: advancing any of them runs the tasks
// of all, merged in that order. The destructor drops waiting tasks.
class ManualMainQueue final : public MainQueue
{
public:
    ManualMainQueue();
    // Another queue on the clock of `sameClock`.
    explicit ManualMainQueue(ManualMainQueue& sameClock);
    ~ManualMainQueue() override;
    ManualMainQueue(const ManualMainQueue&) = delete;
    ManualMainQueue& operator=(const ManualMainQueue&) = delete;

    void async(Task task) override;
    void after(std::chrono::nanoseconds delay, Task task) override;
    // Ticks missed during a wait are delivered as one, as in a real event loop. Intervals below
    // one millisecond count as one millisecond.
    [[nodiscard]] std::unique_ptr<Timer> repeatingTimer(std::chrono::nanoseconds interval,
                                                        Task task) override;

    // Time since the clock was created.
    [[nodiscard]] std::chrono::nanoseconds now() const;
    // Runs all tasks that are due now, also those queued meanwhile. Throws std::logic_error after a
    // million tasks.
    void runPending() { advance(std::chrono::nanoseconds(0)); }
    // Advances the clock by the duration and runs each task that falls due at its time.
    void advance(std::chrono::nanoseconds duration);
    // The number of waiting tasks and running timers of this queue, due or not.
    [[nodiscard]] std::size_t waitingTasks() const;

    // For a fake call that blocks the thread of this queue: advances the clock by at most the
    // timeout and runs the tasks of the other queues of the clock until `stop` returns true (called
    // first, and after each task). Tasks of this queue wait meanwhile, even when another queue
    // blocks on this one.
    void runOthers(std::chrono::nanoseconds timeout, const std::function<bool()>& stop);

private:
    class ManualTimer;
    struct TimerState {
        std::chrono::nanoseconds interval;
        std::shared_ptr<Task> task; // null once invalidated
    };
    struct Waiting {
        Task task;
        std::shared_ptr<TimerState> timer; // null for a single task
    };
    struct Due {
        std::chrono::nanoseconds time;
        std::uint64_t order;
        friend auto operator<=>(const Due&, const Due&) = default;
    };
    // The state that the queues of one clock share.
    struct Timeline {
        std::chrono::nanoseconds now{0};
        std::uint64_t queued = 0;
        std::vector<ManualMainQueue*> queues;

        bool runFirst(std::chrono::nanoseconds deadline);
    };

    void queueAt(std::chrono::nanoseconds time, Waiting waiting);
    void runFirst();

    std::shared_ptr<Timeline> _timeline;
    std::map<Due, Waiting> _tasks;
    int _waits = 0; // calls of runOthers() under way
};

} // namespace orvane
