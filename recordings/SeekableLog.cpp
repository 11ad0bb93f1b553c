#include "recordings/SeekableLog.h"

#include "recordings/LogSlice.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

// The resolution of timestamps.
constexpr LogTime kStep = std::chrono::microseconds(1250);

} // namespace

SeekableLog::SeekableLog(std::shared_ptr<ByteSource> log, std::string name,
                         const std::optional<std::string>& technology)
    : _log(std::move(log)), _name(std::move(name)), _bytesAtFirst(_log->size()),
      _survey(_log, technology)
{
    if (technology)
        endSurvey();
}

bool SeekableLog::readSlice()
{
    if (_failure || isRead())
        return false;
    if (!_decoder) {
        if (!_survey.takeSlice())
            endSurvey();
        return !_failure;
    }
    for (LogSlice slice(_decoder->reader()); slice.goesOn();) {
        _decoder->lookAhead();
        if (_decoder->isAtEnd() || _decoder->reader().position() > _bytesToRead) {
            stopReading();
            return false;
        }
        if (!_decoder->hasNext())
            break;
        if (_decoder->itemsTaken() == 0)
            _checkpoints.pass(*_decoder);
        _decoder->takeNext();
        _checkpoints.pass(*_decoder);
    }
    return true;
}

void SeekableLog::endSurvey()
{
    if (const auto technology = _survey.technology()) {
        _decoder = std::make_unique<LogDecoder>(_log, *technology);
        _decoder->setTellsErrors(true);
    } else {
        _failure = _survey.complaint(_name);
    }
}

void SeekableLog::stopReading()
{
    if (_failure || isRead())
        return;
    if (!_decoder) {
        _bytesToRead = _survey.bytesRead();
        endSurvey();
        return;
    }
    _decoder->setTellsErrors(false);
    _failure = _decoder->problem();
    if (_failure)
        return;
    _end = _decoder->checkpoint();
    _position = duration();
}

double SeekableLog::progress() const
{
    if (_failure || isRead() || _bytesAtFirst == 0)
        return 1;
    if (!_decoder)
        return _survey.progressWith(0);
    const auto most = static_cast<double>(std::min(_bytesAtFirst, _bytesToRead));
    return _survey.progressWith(
        std::min(1.0, static_cast<double>(_decoder->reader().position()) / most));
}

LogTime SeekableLog::duration() const { return _end ? _end->place.time : LogTime(0); }

const LogClock& SeekableLog::clock() const
{
    static const LogClock kUnknown;
    return _end ? _end->place.clock : kUnknown;
}

const PropertyValue& SeekableLog::display() const
{
    static const PropertyValue kAbsent;
    return _decoder ? _decoder->display() : kAbsent;
}

bool SeekableLog::canTakeNext() const
{
    return _end && _decoder->hasNext() && _decoder->itemsTaken() < _end->place.itemsTaken;
}

// Unless the checkpoint lies behind the decoder.
void SeekableLog::skipTo(const LogDecoder::Checkpoint* checkpoint)
{
    if (checkpoint && checkpoint->place.itemsTaken > _decoder->itemsTaken())
        _decoder->restore(*checkpoint);
}

void SeekableLog::moveTo(LogTime position)
{
    if (!isRead())
        return;
    _position = std::clamp(position, LogTime(0), duration());
    if (_position == duration()) {
        skipTo(&*_end);
        return;
    }
    // Position 0 shows the items of the first moment.
    const LogTime end = std::max(_position, kStep);
    const LogDecoder::Checkpoint* before = _checkpoints.before(end);
    const bool isTooFar = _decoder->itemsTaken() > 0 && _decoder->time() >= end;
    if (isTooFar && before)
        _decoder->restore(*before);
    skipTo(before);
    while (canTakeNext() && _decoder->nextTime() < end)
        _decoder->takeNext();
}

void SeekableLog::moveToNextServingCell()
{
    if (!isRead())
        return;
    const std::uint64_t changes = _decoder->servingCellChanges();
    if (_end->place.servingCellChanges == changes) {
        moveTo(duration());
        return;
    }
    skipTo(_checkpoints.withCellChanges(changes));
    while (canTakeNext() && _decoder->servingCellChanges() == changes)
        _decoder->takeNext();
    // After all items of that moment.
    moveTo(_decoder->time() + kStep);
}

std::string SeekableLog::remark() const
{
    return _end ? remarkOn(_end->place.reader, _end->place.impossibleTimes, _bytesAtFirst) : "";
}

} // namespace orvane
