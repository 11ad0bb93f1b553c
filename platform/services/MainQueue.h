#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace orvane
{

// A repeating timer. Destroying it stops it.
class Timer
{
public:
    virtual ~Timer() = default;
    // No call comes after this. A second call does nothing.
    virtual void invalidate() = 0;
};

// The queue of the thread that runs an event loop: tasks run there one after the other, never
// inside the call that queued them.
//
// All operations belong to that thread. Tasks still waiting when the queue is destroyed are
// dropped.
class MainQueue
{
public:
    using Task = std::function<void()>;

    virtual ~MainQueue() = default;
    // Runs the task as soon as what is under way has returned.
    virtual void async(Task task) = 0;
    // Runs the task once, after the delay.
    virtual void after(std::chrono::nanoseconds delay, Task task) = 0;
    // Runs the task every `interval`, first after one interval.
    [[nodiscard]] virtual std::unique_ptr<Timer> repeatingTimer(std::chrono::nanoseconds interval,
                                                                Task task) = 0;
};

} // namespace orvane
