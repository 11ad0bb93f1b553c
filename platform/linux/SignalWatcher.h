#pragma once

#include <csignal>
#include <functional>
#include <memory>
#include <vector>

namespace orvane
{

// Turns signals of the process into calls from the event loop of the thread that makes it. While it
// lives the signals do nothing else; its end restores what was set before. Watchers of the same
// signal end in the reverse order of their making.
class SignalWatcher
{
public:
    // One call for each signal that arrives; the same signal coming twice before the loop gets to
    // it may be one call. The callback may destroy the watcher.
    using Callback = std::function<void(int signal)>;

    // `EndsProgram`: once one of the signals has come, another SIGINT or SIGTERM does what it did
    // before the watcher, whether or not the loop has heard of the first one.
    enum class Second { IsCalledToo, EndsProgram };

    // Throws std::system_error when the process has run out of descriptors, and
    // std::invalid_argument for a number that is no signal or cannot be caught.
    explicit SignalWatcher(Callback callback, std::vector<int> signals = {SIGINT, SIGTERM, SIGHUP},
                           Second second = Second::IsCalledToo);
    ~SignalWatcher();
    SignalWatcher(const SignalWatcher&) = delete;
    SignalWatcher& operator=(const SignalWatcher&) = delete;

private:
    struct State;
    std::shared_ptr<State> _state;
};

} // namespace orvane
