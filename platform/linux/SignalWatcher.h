#pragma once

#include <csignal>
#include <functional>
#include <memory>
#include <vector>

namespace orvane
{

// Turns signals of the process into calls from the event loop of the thread that makes it. While it
// lives the signals do nothing else; its destructor restores what was set before. Watchers of the
// same signal must be destroyed in the reverse order of their construction.
class SignalWatcher
{
public:
    // Called for each signal that arrives. A signal that arrives twice before the loop handles it
    // may give one call. The callback may destroy the watcher.
    using Callback = std::function<void(int signal)>;

    // What a second signal does. `EndsProgram`: after the first signal, SIGINT and SIGTERM do what
    // they did before the watcher was made, even if the loop has not run since.
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
