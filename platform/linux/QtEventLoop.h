#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace orvane
{

// The main thread's event loop. Makes Qt's application object unless the program has made one (a
// window needs a larger kind), and keeps printf's decimal point whatever the user's locale.
// One at a time, in the main thread.
class QtEventLoop
{
public:
    QtEventLoop();
    ~QtEventLoop();
    QtEventLoop(const QtEventLoop&) = delete;
    QtEventLoop& operator=(const QtEventLoop&) = delete;

    // Runs until quit() and returns its code; returns at once if quit() was called before.
    int run();
    // Ends run() as soon as what is under way has returned.
    void quit(int code = 0);
    // Runs until `done` is true or the time is over; returns what `done` then says. Calls `done`
    // after each event.
    bool runUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout);

private:
    struct Application;
    std::unique_ptr<Application> _application;
};

} // namespace orvane
