#include "platform/linux/QtMainQueue.h"

#include <QCoreApplication>
#include <QEvent>
#include <QObject>
#include <QPointer>
#include <QTimerEvent>

#include <algorithm>
#include <map>

namespace orvane
{

namespace
{

using SteadyClock = std::chrono::steady_clock;
using std::chrono::milliseconds;
using std::chrono::nanoseconds;

// Qt counts a timer's interval in an int of milliseconds; longer waits go in several steps.
constexpr milliseconds kLongestStep = std::chrono::hours(24);

const QEvent::Type kTaskEvent = static_cast<QEvent::Type>(QEvent::registerEventType());

struct TaskEvent final : QEvent {
    explicit TaskEvent(MainQueue::Task theTask) : QEvent(kTaskEvent), task(std::move(theTask)) {}
    MainQueue::Task task;
};

SteadyClock::time_point deadlineAfter(nanoseconds delay)
{
    const auto now = SteadyClock::now();
    return delay > SteadyClock::time_point::max() - now ? SteadyClock::time_point::max()
                                                        : now + std::max(delay, nanoseconds{0});
}

} // namespace

// The QObject of a queue. Its destructor drops the events posted to it and stops its timers.
class QtMainQueue::Receiver final : public QObject
{
public:
    struct Alarm {
        Task task;
        SteadyClock::time_point deadline;
        nanoseconds interval{0};
        bool repeats = false;
        int timerId = 0; // 0 while it runs and once it has been stopped
        bool isStopped = false;
    };

    void start(const std::shared_ptr<Alarm>& alarm)
    {
        const auto remaining = alarm->deadline - SteadyClock::now();
        const auto step = std::clamp<nanoseconds>(remaining, nanoseconds{0}, kLongestStep);
        alarm->timerId = startTimer(std::chrono::ceil<milliseconds>(step), Qt::PreciseTimer);
        if (alarm->timerId != 0)
            _alarms[alarm->timerId] = alarm;
    }

    void stop(Alarm& alarm)
    {
        alarm.isStopped = true;
        release(alarm);
    }

    bool event(QEvent* event) override
    {
        if (event->type() != kTaskEvent)
            return QObject::event(event);
        const Task task = std::move(static_cast<TaskEvent*>(event)->task);
        task(); // may have destroyed this object
        return true;
    }

protected:
    void timerEvent(QTimerEvent* event) override
    {
        const auto found = _alarms.find(event->timerId());
        if (found == _alarms.end())
            return;
        const std::shared_ptr<Alarm> alarm = found->second;
        release(*alarm);
        if (SteadyClock::now() < alarm->deadline) {
            start(alarm);
            return;
        }
        const QPointer<Receiver> alive(this);
        alarm->task();
        if (!alive || !alarm->repeats || alarm->isStopped)
            return;
        moveToNextDeadline(*alarm);
        start(alarm);
    }

private:
    void release(Alarm& alarm)
    {
        if (alarm.timerId == 0)
            return;
        killTimer(alarm.timerId);
        _alarms.erase(alarm.timerId);
        alarm.timerId = 0;
    }

    static void moveToNextDeadline(Alarm& alarm)
    {
        const auto now = SteadyClock::now();
        if (alarm.interval <= nanoseconds{0}) {
            alarm.deadline = now;
            return;
        }
        const auto late = now - alarm.deadline;
        alarm.deadline += late / alarm.interval * alarm.interval; // calls that were missed
        alarm.deadline = alarm.deadline > SteadyClock::time_point::max() - alarm.interval
                             ? SteadyClock::time_point::max()
                             : alarm.deadline + alarm.interval;
    }

    std::map<int, std::shared_ptr<Alarm>> _alarms;
};

class QtMainQueue::RepeatingTimer final : public Timer
{
public:
    RepeatingTimer(Receiver* receiver, std::shared_ptr<Receiver::Alarm> alarm)
        : _receiver(receiver), _alarm(std::move(alarm))
    {
    }
    ~RepeatingTimer() override { stop(); }
    RepeatingTimer(const RepeatingTimer&) = delete;
    RepeatingTimer& operator=(const RepeatingTimer&) = delete;

    void invalidate() override { stop(); }

private:
    void stop()
    {
        if (_receiver)
            _receiver->stop(*_alarm);
    }

    QPointer<Receiver> _receiver;
    std::shared_ptr<Receiver::Alarm> _alarm;
};

QtMainQueue::QtMainQueue() : _receiver(std::make_unique<Receiver>()) {}

QtMainQueue::~QtMainQueue() = default;

void QtMainQueue::async(Task task)
{
    if (task)
        QCoreApplication::postEvent(_receiver.get(), new TaskEvent(std::move(task)));
}

void QtMainQueue::after(nanoseconds delay, Task task)
{
    if (!task)
        return;
    auto alarm = std::make_shared<Receiver::Alarm>();
    alarm->task = std::move(task);
    alarm->deadline = deadlineAfter(delay);
    _receiver->start(alarm);
}

std::unique_ptr<Timer> QtMainQueue::repeatingTimer(nanoseconds interval, Task task)
{
    auto alarm = std::make_shared<Receiver::Alarm>();
    alarm->task = std::move(task);
    alarm->deadline = deadlineAfter(interval);
    alarm->interval = interval;
    alarm->repeats = true;
    if (alarm->task)
        _receiver->start(alarm);
    return std::make_unique<RepeatingTimer>(_receiver.get(), std::move(alarm));
}

} // namespace orvane
