#include "platform/linux/BoundedCall.h"

#include <atomic>
#include <condition_variable>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <memory>
#include <mutex>
#include <system_error>
#include <thread>

namespace orvane
{

namespace
{

std::atomic<int> abandonedTasks = 0;

// Shared, since either side may be the last to use it.
struct Call {
    std::mutex mutex;
    std::condition_variable changed;
    bool hasEnded = false;
};

// No signals for threads that begin while it lives: they are the main thread's.
class SignalsBlocked
{
public:
    SignalsBlocked()
    {
        sigset_t all;
        ::sigfillset(&all);
        ::pthread_sigmask(SIG_SETMASK, &all, &_before);
    }
    ~SignalsBlocked() { ::pthread_sigmask(SIG_SETMASK, &_before, nullptr); }
    SignalsBlocked(const SignalsBlocked&) = delete;
    SignalsBlocked& operator=(const SignalsBlocked&) = delete;

private:
    sigset_t _before{};
};

} // namespace

bool runWithin(std::chrono::milliseconds time, std::function<void()> task)
{
    const auto call = std::make_shared<Call>();
    std::thread thread;
    try {
        const SignalsBlocked blocked;
        thread = std::thread([call, task = std::move(task)] {
            try {
                task();
            } catch (const std::exception&) {
                // The caller finds out by what the task has not done.
            }
            const std::lock_guard lock(call->mutex);
            call->hasEnded = true;
            call->changed.notify_all();
        });
    } catch (const std::system_error&) {
        return false;
    }
    std::unique_lock lock(call->mutex);
    const bool hasEnded = call->changed.wait_for(lock, time, [&] { return call->hasEnded; });
    lock.unlock();
    if (hasEnded) {
        thread.join();
    } else {
        thread.detach();
        ++abandonedTasks;
    }
    return hasEnded;
}

int exitStatusAfterTasks(int status)
{
    if (abandonedTasks == 0)
        return status;
    std::fflush(nullptr);
    std::_Exit(status);
}

} // namespace orvane
