#include "app/LogPlayer.h"

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

// The shortest time between two displays that a person can tell apart.
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

LogPlayer::LogPlayer(MainQueue& queue, Now now, std::shared_ptr<ByteSource> log,
                     RecordingSettings settings, OnChange onChange)
    : _queue(queue), _now(std::move(now)), _settings(std::move(settings)),
      _onChange(std::move(onChange)), _log(std::move(log), _settings.name, _settings.technology)
{
    readLater();
}

void LogPlayer::readLater()
{
    _queue.async(_lifetime.whileAlive([this] { read(); }));
}

void LogPlayer::read()
{
    if (failure() || isReady())
        return;
    if (_log.readSlice())
        readLater();
    tellOrBegin();
}

void LogPlayer::stopReading()
{
    if (failure() || isReady())
        return;
    _log.stopReading();
    tellOrBegin();
}

// Once the log has been read, it stands at the end of its first period.
void LogPlayer::tellOrBegin()
{
    if (isReady())
        moveTo(_settings.refreshPeriod);
    else
        tell();
}

NodePointer LogPlayer::topLevelNodes()
{
    if (!_nodes && isReady())
        _nodes = OrvaneModelNode::makeTreeFromObject(_log.display(), _nodesByPath);
    return _nodes;
}

NodePointer LogPlayer::nodeAtPath(const std::string& path)
{
    topLevelNodes();
    return _nodesByPath.at(path);
}

double LogPlayer::position() const { return secondsOf(_log.position()); }

double LogPlayer::duration() const { return secondsOf(_log.duration()); }

std::string LogPlayer::positionText() const
{
    return isReady() ? _log.clock().text(_log.position()) : "";
}

std::string LogPlayer::remark() const { return _log.remark(); }

double LogPlayer::speed() const { return kSpeeds[_speed]; }

void LogPlayer::play()
{
    if (!isReady() || isPlaying())
        return;
    if (_log.position() == _log.duration())
        _log.moveTo(LogTime(0));
    _playedTo = _now();
    startTimer();
    moved();
}

void LogPlayer::startTimer()
{
    const nanoseconds turn = std::max(_settings.refreshPeriod / kSpeeds[_speed], kShortestTurn);
    _timer = _queue.repeatingTimer(turn, [this] { goOn(); });
}

// Moves by the whole refresh periods that have passed at this speed since the last call.
void LogPlayer::goOn()
{
    const nanoseconds perPeriod = _settings.refreshPeriod / kSpeeds[_speed];
    const auto periods = (_now() - _playedTo) / std::max(perPeriod, nanoseconds(1));
    if (periods <= 0)
        return;
    _playedTo += periods * perPeriod;
    const LogTime left = _log.duration() - _log.position();
    const bool isEnd = periods >= left / _settings.refreshPeriod + 1;
    moveTo(isEnd ? _log.duration() : _log.position() + periods * _settings.refreshPeriod);
    if (_log.position() == _log.duration())
        pause();
}

void LogPlayer::pause()
{
    if (!isPlaying())
        return;
    _timer.reset();
    tell();
}

void LogPlayer::faster()
{
    if (!isReady() || _speed + 1 >= std::size(kSpeeds))
        return;
    ++_speed;
    if (isPlaying())
        startTimer();
    tell();
}

void LogPlayer::slower()
{
    if (!isReady() || _speed == 0)
        return;
    --_speed;
    if (isPlaying())
        startTimer();
    tell();
}

void LogPlayer::step()
{
    if (!isReady())
        return;
    _timer.reset();
    const LogTime left = _log.duration() - _log.position();
    moveTo(_log.position() + std::min(left, LogTime(_settings.refreshPeriod)));
}

void LogPlayer::stepBack()
{
    if (!isReady())
        return;
    _timer.reset();
    moveTo(_log.position() - _settings.refreshPeriod);
}

void LogPlayer::jumpTo(double position) { moveTo(timeOf(position)); }

void LogPlayer::jumpToEnd() { moveTo(_log.duration()); }

void LogPlayer::jumpToNextServingCell()
{
    if (!isReady())
        return;
    _log.moveToNextServingCell();
    moved();
}

bool LogPlayer::jumpToText(const std::string& text)
{
    if (!isReady())
        return false;
    const auto time = typedTime(text, _log.clock(), _log.position(), _log.duration());
    if (time)
        moveTo(*time);
    return time.has_value();
}

void LogPlayer::moveTo(LogTime position)
{
    if (!isReady())
        return;
    _log.moveTo(position);
    moved();
}

void LogPlayer::moved()
{
    _nodes = nullptr;
    _nodesByPath.clear();
    tell();
}

void LogPlayer::tell() const
{
    if (_onChange)
        _onChange();
}

} // namespace orvane
