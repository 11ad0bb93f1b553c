#include "app/RecordingPlayer.h"

#include "recordings/TypedTime.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <utility>

namespace orvane
{

namespace
{

using std::chrono::nanoseconds;

constexpr int kSpeeds[] = {1, 2, 5, 10, 20, 50, 100, 200, 500, 1000};

// What a person sees of a display that changes more often.
constexpr nanoseconds kShortestTurn = std::chrono::milliseconds(50);

double secondsOf(LogTime time) { return std::chrono::duration<double>(time).count(); }

LogTime timeOf(double seconds)
{
    const double farthest = secondsOf(LogTime::max()) / 2;
    if (!(seconds > 0))
        return LogTime(0);
    return LogTime(std::llround(std::min(seconds, farthest) * 1e9));
}

} // namespace

RecordingPlayer::RecordingPlayer(MainQueue& queue, Now now, std::shared_ptr<ByteSource> log,
                                 RecordingSettings settings, OnChange onChange)
    : _queue(queue), _now(std::move(now)), _settings(std::move(settings)),
      _onChange(std::move(onChange)), _reading(std::move(log), _settings.name, _settings.technology)
{
    readLater();
}

void RecordingPlayer::readLater()
{
    _queue.async(_lifetime.whileAlive([this] { read(); }));
}

void RecordingPlayer::read()
{
    if (failure() || isReady())
        return;
    if (_reading.readSlice())
        readLater();
    tellOrBegin();
}

void RecordingPlayer::stopReading()
{
    if (failure() || isReady())
        return;
    _reading.stop();
    tellOrBegin();
}

// Once the log has been read, it stands at the end of its first period.
void RecordingPlayer::tellOrBegin()
{
    if (isReady())
        moveTo(_settings.refreshPeriod);
    else
        tell();
}

NodePointer RecordingPlayer::topLevelNodes()
{
    if (!_nodes && isReady())
        _nodes = OrvaneModelNode::makeTreeFromObject(timeline()->display(), _nodesByPath);
    return _nodes;
}

NodePointer RecordingPlayer::nodeAtPath(const std::string& path)
{
    topLevelNodes();
    const auto found = _nodesByPath.find(path);
    return found == _nodesByPath.end() ? nullptr : found->second;
}

double RecordingPlayer::position() const
{
    return timeline() ? secondsOf(timeline()->position()) : 0;
}

double RecordingPlayer::duration() const
{
    return timeline() ? secondsOf(timeline()->duration()) : 0;
}

std::string RecordingPlayer::positionText() const
{
    return isReady() ? timeline()->clock().text(timeline()->position()) : "";
}

std::string RecordingPlayer::remark() const { return timeline() ? timeline()->remark() : ""; }

double RecordingPlayer::speed() const { return kSpeeds[_speed]; }

void RecordingPlayer::play()
{
    if (!isReady() || isPlaying())
        return;
    if (timeline()->position() == timeline()->duration())
        timeline()->moveTo(LogTime(0));
    _playedTo = _now();
    startTimer();
    moved();
}

void RecordingPlayer::startTimer()
{
    const nanoseconds turn = std::max(_settings.refreshPeriod / kSpeeds[_speed], kShortestTurn);
    _timer = _queue.repeatingTimer(turn, [this] { goOn(); });
}

// As many whole refresh periods as have passed at this speed since the last time.
void RecordingPlayer::goOn()
{
    const nanoseconds perPeriod = _settings.refreshPeriod / kSpeeds[_speed];
    const auto periods = (_now() - _playedTo) / std::max(perPeriod, nanoseconds(1));
    if (periods <= 0)
        return;
    _playedTo += periods * perPeriod;
    const LogTime left = timeline()->duration() - timeline()->position();
    const bool isEnd = periods >= left / _settings.refreshPeriod + 1;
    moveTo(isEnd ? timeline()->duration()
                 : timeline()->position() + periods * _settings.refreshPeriod);
    if (timeline()->position() == timeline()->duration())
        pause();
}

void RecordingPlayer::pause()
{
    if (!isPlaying())
        return;
    _timer.reset();
    tell();
}

void RecordingPlayer::faster()
{
    if (!isReady() || _speed + 1 >= std::size(kSpeeds))
        return;
    ++_speed;
    if (isPlaying())
        startTimer();
    tell();
}

void RecordingPlayer::slower()
{
    if (!isReady() || _speed == 0)
        return;
    --_speed;
    if (isPlaying())
        startTimer();
    tell();
}

void RecordingPlayer::step()
{
    if (!isReady())
        return;
    _timer.reset();
    const LogTime left = timeline()->duration() - timeline()->position();
    moveTo(timeline()->position() + std::min(left, LogTime(_settings.refreshPeriod)));
}

void RecordingPlayer::stepBack()
{
    if (!isReady())
        return;
    _timer.reset();
    moveTo(timeline()->position() - _settings.refreshPeriod);
}

void RecordingPlayer::jumpTo(double position) { moveTo(timeOf(position)); }

void RecordingPlayer::jumpToEnd()
{
    if (timeline())
        moveTo(timeline()->duration());
}

void RecordingPlayer::jumpToNextServingCell()
{
    if (!isReady())
        return;
    timeline()->moveToNextServingCell();
    moved();
}

bool RecordingPlayer::jumpToText(const std::string& text)
{
    if (!isReady())
        return false;
    const auto time =
        typedTime(text, timeline()->clock(), timeline()->position(), timeline()->duration());
    if (time)
        moveTo(*time);
    return time.has_value();
}

void RecordingPlayer::moveTo(LogTime position)
{
    if (!isReady())
        return;
    timeline()->moveTo(position);
    moved();
}

void RecordingPlayer::moved()
{
    _nodes = nullptr;
    _nodesByPath.clear();
    tell();
}

void RecordingPlayer::tell() const
{
    if (_onChange)
        _onChange();
}

} // namespace orvane
