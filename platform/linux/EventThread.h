#pragma once

#include "platform/services/MainQueue.h"

#include <functional>
#include <memory>

namespace orvane
{

// A second thread with an event loop and a main queue of its own, for a part of the program that
// shares nothing with the rest (the simulated phone). Needs a QtEventLoop in the main thread.
class EventThread
{
public:
    // Called inside the thread: makes the object that lives there. The queue outlives that object.
    using SetUp = std::function<std::shared_ptr<void>(MainQueue&)>;

    // Starts the thread and returns once `setUp` has returned. What `setUp` throws is thrown here.
    explicit EventThread(SetUp setUp);
    // stop().
    ~EventThread();
    EventThread(const EventThread&) = delete;
    EventThread& operator=(const EventThread&) = delete;

    // Ends the loop, destroys what `setUp` returned inside the thread, and waits for the thread's
    // end. Not to be called in the thread itself. A second call does nothing.
    void stop();

private:
    struct State;
    std::unique_ptr<State> _state;
};

} // namespace orvane
