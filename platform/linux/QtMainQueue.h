#pragma once

#include "platform/services/MainQueue.h"

namespace orvane
{

// The queue of the thread that makes it, on that thread's Qt event loop. Make it after the thread's
// QtEventLoop (an EventThread makes its own); several queues in one thread share the loop.
//
// Times are kept to the millisecond and never early. A repeating timer keeps to its grid: a late
// call does not shift later ones, and calls that were missed altogether do not come. An interval
// below one millisecond gives a call a millisecond. Timers that outlive the queue are harmless.
class QtMainQueue final : public MainQueue
{
public:
    QtMainQueue();
    // May happen within one of its own tasks.
    ~QtMainQueue() override;
    QtMainQueue(const QtMainQueue&) = delete;
    QtMainQueue& operator=(const QtMainQueue&) = delete;

    void async(Task task) override;
    void after(std::chrono::nanoseconds delay, Task task) override;
    [[nodiscard]] std::unique_ptr<Timer> repeatingTimer(std::chrono::nanoseconds interval,
                                                        Task task) override;

private:
    class Receiver;
    class RepeatingTimer;
    std::unique_ptr<Receiver> _receiver;
};

} // namespace orvane
