#include "platform/linux/SignalWatcher.h"

#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/FileDescriptor.h"

#include <array>
#include <atomic>
#include <cerrno>
#include <fcntl.h>
#include <stdexcept>
#include <string>
#include <system_error>
#include <utility>

namespace orvane
{

namespace
{

// Where the handler writes each signal's number: one more than the descriptor, 0 for none.
std::array<std::atomic<int>, 65> pipes{};
static_assert(std::atomic<int>::is_always_lock_free, "the handler may not take a lock");

// What to do with SIGINT and SIGTERM once a signal of an ending watcher has come. Written before
// handleEndSignal() is installed.
struct sigaction actionOfSecond[2];
constexpr std::array<int, 2> kEndSignals = {SIGINT, SIGTERM};

void handleSignal(int signal)
{
    const int savedErrno = errno;
    const auto number = static_cast<unsigned char>(signal);
    // A full pipe has enough in it to wake the loop.
    [[maybe_unused]] const auto written =
        ::write(pipes[static_cast<std::size_t>(signal)].load() - 1, &number, 1);
    errno = savedErrno;
}

void handleEndSignal(int signal)
{
    for (std::size_t i = 0; i < kEndSignals.size(); ++i)
        ::sigaction(kEndSignals[i], &actionOfSecond[i], nullptr);
    handleSignal(signal);
}

} // namespace

struct SignalWatcher::State {
    struct Earlier {
        int signal;
        struct sigaction action;
        int pipe;
    };

    State() = default;
    State(const State&) = delete;
    State& operator=(const State&) = delete;
    ~State() { restore(); }

    void take(int signal, void (*handler)(int))
    {
        if (signal < 1 || static_cast<std::size_t>(signal) >= pipes.size())
            throw std::invalid_argument("No such signal: " + std::to_string(signal));
        auto& pipe = pipes[static_cast<std::size_t>(signal)];
        Earlier entry{signal, {}, pipe.exchange(writeEnd.get() + 1)};
        struct sigaction action {
        };
        action.sa_handler = handler;
        action.sa_flags = SA_RESTART;
        ::sigfillset(&action.sa_mask);
        if (::sigaction(signal, &action, &entry.action) != 0) {
            pipe = entry.pipe;
            throw std::invalid_argument("A signal that cannot be caught: " +
                                        std::to_string(signal));
        }
        earlier.push_back(entry);
    }

    void restore()
    {
        while (!earlier.empty()) {
            const Earlier& entry = earlier.back();
            ::sigaction(entry.signal, &entry.action, nullptr);
            pipes[static_cast<std::size_t>(entry.signal)] = entry.pipe;
            earlier.pop_back();
        }
    }

    FileDescriptor readEnd;
    FileDescriptor writeEnd;
    std::vector<Earlier> earlier;
    std::unique_ptr<DescriptorWatcher> watcher;
    Callback callback;
    bool isStopped = false;
};

SignalWatcher::SignalWatcher(Callback callback, std::vector<int> signals, Second second)
    : _state(std::make_shared<State>())
{
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0)
        throw std::system_error(errno, std::generic_category(), "pipe");
    _state->readEnd = FileDescriptor(ends[0]);
    _state->writeEnd = FileDescriptor(ends[1]);
    _state->callback = std::move(callback);
    if (second == Second::EndsProgram)
        for (std::size_t i = 0; i < kEndSignals.size(); ++i)
            ::sigaction(kEndSignals[i], nullptr, &actionOfSecond[i]);
    for (const int signal : signals)
        _state->take(signal, second == Second::EndsProgram ? handleEndSignal : handleSignal);
    _state->watcher = std::make_unique<DescriptorWatcher>(
        _state->readEnd.get(), DescriptorWatcher::For::Reading, [weak = std::weak_ptr(_state)] {
            const auto state = weak.lock(); // lives until the callback has returned
            if (!state)
                return;
            std::array<unsigned char, 64> numbers{};
            const auto count = ::read(state->readEnd.get(), numbers.data(), numbers.size());
            for (std::ptrdiff_t i = 0; i < count && !state->isStopped; ++i)
                if (state->callback)
                    state->callback(numbers[static_cast<std::size_t>(i)]);
        });
}

SignalWatcher::~SignalWatcher()
{
    _state->isStopped = true;
    _state->restore();
    _state->watcher.reset();
}

} // namespace orvane
