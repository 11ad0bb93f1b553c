#pragma once

#include "platform/services/MainQueue.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <vector>

namespace orvane
{

// A main queue whose time stands still until a test turns it.
//
// Tasks run in the order of their times, those of one time in the order in which they were queued.
// Several queues may share one clock, as processes of one machine do: turning any of them runs the
// tasks of all, merged in that order. Tasks still waiting at destruction are dropped.
class ManualMainQueue final : public MainQueue
{
public:
    ManualMainQueue();
    // A further queue on the clock of `sameClock`.
    explicit ManualMainQueue(ManualMainQueue& sameClock);
    ~ManualMainQueue() override;
    ManualMainQueue(const ManualMainQueue&) = delete;
    ManualMainQueue& operator=(const ManualMainQueue&) = delete;

    void async(Task task) override;
    void after(std::chrono::nanoseconds delay, Task task) override;
    // Ticks that a wait has run past come as one, as with a real event loop. Intervals below a
    // millisecond are taken as one.
    [[nodiscard]] std::unique_ptr<Timer> repeatingTimer(std::chrono::nanoseconds interval,
                                                        Task task) override;

    // Since the clock was made.
    [[nodiscard]] std::chrono::nanoseconds now() const;
    // Runs everything that is due now, and what that queues for now. A million tasks without an end
    // throw std::logic_error.
    void runPending() { advance(std::chrono::nanoseconds(0)); }
    // Turns the clock on by the duration and runs what falls due on the way, each at its time.
    void advance(std::chrono::nanoseconds duration);
    // How many tasks and running timers wait in this queue, due or not.
    [[nodiscard]] std::size_t waitingTasks() const;

    // For a fake call that waits on the thread of this queue: turns the clock on by at most the
    // timeout, running the tasks of the other queues of the clock, until `stop` is true (asked
    // first and after each task). Tasks of this queue wait meanwhile, also when another queue in
    // turn waits for it.
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
    // What the queues of one clock share.
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
