#pragma once

#include "platform/services/MainQueue.h"

namespace orvane
{

// The queue of the thread that makes it, on that thread's Qt event loop. Make it after the thread's
// QtEventLoop (an EventThread makes its own); several queues in one thread share the loop.
//
// Calls come with the precision of a millisecond and never early. A late call of a repeating timer
// does not delay the next ones, and a call that was missed altogether does not come. An interval
// below one millisecond counts as one. A timer may outlive the queue and then does nothing.
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
