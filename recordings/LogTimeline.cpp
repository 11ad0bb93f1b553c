#include "recordings/LogTimeline.h"

#include "recordings/LogSlice.h"
#include "recordings/LogSurvey.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

// The resolution of timestamps.
constexpr LogTime kStep = std::chrono::microseconds(1250);

} // namespace

LogTimeline::LogTimeline(std::shared_ptr<ByteSource> log, const std::string& technology)
    : _bytesAtFirst(log->size()), _play(std::move(log), technology)
{
    _play.setTellsErrors(true);
}

bool LogTimeline::readSlice()
{
    if (isRead())
        return false;
    for (LogSlice slice(_play.reader()); slice.goesOn();) {
        _play.lookAhead();
        if (_play.isAtEnd()) {
            stopReading();
            return false;
        }
        if (!_play.hasNext())
            break;
        if (_play.itemsTaken() == 0)
            _checkpoints.pass(_play);
        _play.takeNext();
        _checkpoints.pass(_play);
    }
    return true;
}

double LogTimeline::progress() const
{
    if (isRead() || _bytesAtFirst == 0)
        return 1;
    return static_cast<double>(_play.reader().position()) / static_cast<double>(_bytesAtFirst);
}

void LogTimeline::stopReading()
{
    if (isRead())
        return;
    _play.setTellsErrors(false);
    _end = _play.checkpoint();
    _position = duration();
}

LogTime LogTimeline::duration() const { return _end ? _end->place.time : LogTime(0); }

const LogClock& LogTimeline::clock() const { return _end ? _end->place.clock : _play.clock(); }

bool LogTimeline::canTakeNext() const
{
    return _end && _play.hasNext() && _play.itemsTaken() < _end->place.itemsTaken;
}

// Where that is nearer to what lies ahead of the play.
void LogTimeline::skipTo(const LogPlay::Checkpoint* checkpoint)
{
    if (checkpoint && checkpoint->place.itemsTaken > _play.itemsTaken())
        _play.restore(*checkpoint);
}

void LogTimeline::moveTo(LogTime position)
{
    if (!isRead())
        return;
    _position = std::clamp(position, LogTime(0), duration());
    if (_position == duration()) {
        skipTo(&*_end);
        return;
    }
    // At the start there is something to see, too: the items of the first moment.
    const LogTime end = std::max(_position, kStep);
    const LogPlay::Checkpoint* before = _checkpoints.before(end);
    const bool isTooFar = _play.itemsTaken() > 0 && _play.time() >= end;
    if (isTooFar && before)
        _play.restore(*before);
    skipTo(before);
    while (canTakeNext() && _play.nextTime() < end)
        _play.takeNext();
}

void LogTimeline::moveToNextServingCell()
{
    if (!isRead())
        return;
    const std::uint64_t changes = _play.servingCellChanges();
    if (_end->place.servingCellChanges == changes) {
        moveTo(duration());
        return;
    }
    skipTo(_checkpoints.withCellChanges(changes));
    while (canTakeNext() && _play.servingCellChanges() == changes)
        _play.takeNext();
    // Behind all items of the moment.
    moveTo(_play.time() + kStep);
}

std::string LogTimeline::remark() const
{
    return _end ? remarkOn(_end->place.reader, _end->place.impossibleTimes, _bytesAtFirst) : "";
}

} // namespace orvane
