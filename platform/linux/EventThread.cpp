#include "platform/linux/EventThread.h"

#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/FileDescriptor.h"
#include "platform/linux/QtMainQueue.h"

#include <QCoreApplication>
#include <QEventLoop>

#include <cerrno>
#include <condition_variable>
#include <cstdint>
#include <exception>
#include <mutex>
#include <sys/eventfd.h>
#include <system_error>
#include <thread>

namespace orvane
{

// All that the two threads share. They share no Qt object: a descriptor stops the thread.
struct EventThread::State {
    FileDescriptor stopRequest;
    std::mutex mutex;
    std::condition_variable changed;
    bool isSetUp = false;
    std::exception_ptr failure;
    std::thread thread;

    void finishSetUp(std::exception_ptr theFailure)
    {
        const std::lock_guard lock(mutex);
        failure = std::move(theFailure);
        isSetUp = true;
        changed.notify_all();
    }

    void run(const SetUp& setUp)
    {
        QEventLoop loop; // first: timers and watchers need the dispatcher that it brings
        const DescriptorWatcher stopWatcher(stopRequest.get(), DescriptorWatcher::For::Reading,
                                            [&loop] { loop.quit(); });
        QtMainQueue queue;
        std::shared_ptr<void> inhabitant;
        try {
            inhabitant = setUp(queue);
        } catch (...) {
            finishSetUp(std::current_exception());
            return;
        }
        finishSetUp(nullptr);
        loop.exec();
        inhabitant.reset();
    }
};

EventThread::EventThread(SetUp setUp) : _state(std::make_unique<State>())
{
    _state->stopRequest = FileDescriptor(::eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK));
    if (!_state->stopRequest)
        throw std::system_error(errno, std::generic_category(), "eventfd");
    _state->thread =
        std::thread([state = _state.get(), setUp = std::move(setUp)] { state->run(setUp); });
    std::exception_ptr failure;
    {
        std::unique_lock lock(_state->mutex);
        _state->changed.wait(lock, [this] { return _state->isSetUp; });
        failure = std::move(_state->failure);
    }
    if (failure) {
        _state->thread.join();
        std::rethrow_exception(failure);
    }
}

EventThread::~EventThread() { stop(); }

void EventThread::stop()
{
    if (!_state->thread.joinable())
        return;
    const std::uint64_t one = 1;
    // Fails only where the counter is full, and then the thread is being woken already.
    [[maybe_unused]] const auto written = ::write(_state->stopRequest.get(), &one, sizeof one);
    _state->thread.join();
}

} // namespace orvane
