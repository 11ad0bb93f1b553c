#include "doubles/ManualMainQueue.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace orvane
{

namespace
{

using std::chrono::nanoseconds;

constexpr nanoseconds kShortestInterval = std::chrono::milliseconds(1);

// Counts the tasks of one moment: a task that queues itself without end fails a test instead of
// hanging it.
class RunawayGuard
{
public:
    void taskRan(nanoseconds now)
    {
        constexpr int kLimit = 1'000'000;
        _tasks = now == _moment ? _tasks + 1 : 1;
        _moment = now;
        if (_tasks > kLimit)
            throw std::logic_error("a million tasks ran at one moment: do they queue themselves?");
    }

private:
    nanoseconds _moment{-1};
    int _tasks = 0;
};

} // namespace

class ManualMainQueue::ManualTimer final : public Timer
{
public:
    explicit ManualTimer(std::shared_ptr<TimerState> state) : _state(std::move(state)) {}
    ~ManualTimer() override { ManualTimer::invalidate(); }
    void invalidate() override { _state->task.reset(); }

private:
    std::shared_ptr<TimerState> _state;
};

ManualMainQueue::ManualMainQueue() : _timeline(std::make_shared<Timeline>())
{
    _timeline->queues.push_back(this);
}

ManualMainQueue::ManualMainQueue(ManualMainQueue& sameClock) : _timeline(sameClock._timeline)
{
    _timeline->queues.push_back(this);
}

ManualMainQueue::~ManualMainQueue()
{
    std::erase(_timeline->queues, this);
    // Destroying what a dropped task owns may queue tasks.
    while (!_tasks.empty())
        std::exchange(_tasks, {}).clear();
}

void ManualMainQueue::async(Task task) { after(nanoseconds(0), std::move(task)); }

void ManualMainQueue::after(nanoseconds delay, Task task)
{
    queueAt(now() + std::max(delay, nanoseconds(0)), {std::move(task), nullptr});
}

std::unique_ptr<Timer> ManualMainQueue::repeatingTimer(nanoseconds interval, Task task)
{
    auto state = std::make_shared<TimerState>(
        TimerState{std::max(interval, kShortestInterval), std::make_shared<Task>(std::move(task))});
    queueAt(now() + state->interval, {nullptr, state});
    return std::make_unique<ManualTimer>(std::move(state));
}

nanoseconds ManualMainQueue::now() const { return _timeline->now; }

void ManualMainQueue::advance(nanoseconds duration)
{
    const auto timeline = _timeline; // a task may destroy this queue
    const nanoseconds deadline = timeline->now + duration;
    RunawayGuard guard;
    while (timeline->runFirst(deadline))
        guard.taskRan(timeline->now);
    // A task that blocked may have advanced the clock past the deadline.
    timeline->now = std::max(timeline->now, deadline);
}

std::size_t ManualMainQueue::waitingTasks() const
{
    return static_cast<std::size_t>(
        std::count_if(_tasks.begin(), _tasks.end(), [](const auto& entry) {
            const Waiting& waiting = entry.second;
            return !waiting.timer || waiting.timer->task;
        }));
}

void ManualMainQueue::runOthers(nanoseconds timeout, const std::function<bool()>& stop)
{
    struct Wait {
        explicit Wait(ManualMainQueue& queue) : _queue(queue) { ++_queue._waits; }
        ~Wait() { --_queue._waits; }
        ManualMainQueue& _queue;
    };
    const Wait wait(*this);
    const nanoseconds deadline = now() + timeout;
    RunawayGuard guard;
    while (!stop()) {
        if (!_timeline->runFirst(deadline)) {
            _timeline->now = std::max(_timeline->now, deadline);
            return;
        }
        guard.taskRan(_timeline->now);
    }
}

bool ManualMainQueue::Timeline::runFirst(nanoseconds deadline)
{
    ManualMainQueue* first = nullptr;
    for (ManualMainQueue* queue : queues)
        if (queue->_waits == 0 && !queue->_tasks.empty() &&
            (!first || queue->_tasks.begin()->first < first->_tasks.begin()->first))
            first = queue;
    if (!first || first->_tasks.begin()->first.time > deadline)
        return false;
    now = std::max(now, first->_tasks.begin()->first.time);
    first->runFirst();
    return true;
}

void ManualMainQueue::runFirst()
{
    const nanoseconds due = _tasks.begin()->first.time;
    const Waiting waiting = std::move(_tasks.extract(_tasks.begin()).mapped());
    if (!waiting.timer) {
        if (waiting.task)
            waiting.task();
        return;
    }
    const auto task = waiting.timer->task; // it may invalidate its own timer
    if (!task)
        return;
    const nanoseconds interval = waiting.timer->interval;
    const auto missed = (now() - due) / interval;
    queueAt(due + (missed + 1) * interval, {nullptr, waiting.timer});
    (*task)();
}

void ManualMainQueue::queueAt(nanoseconds time, Waiting waiting)
{
    _tasks.emplace(Due{time, _timeline->queued++}, std::move(waiting));
}

} // namespace orvane
