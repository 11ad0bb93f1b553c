#include "recordings/LogReading.h"

#include <utility>

namespace orvane
{

LogReading::LogReading(std::shared_ptr<ByteSource> log, std::string name,
                       const std::optional<std::string>& technology)
    : _log(std::move(log)), _name(std::move(name))
{
    if (technology)
        begin(*technology);
    else
        _survey.emplace(_log);
}

bool LogReading::readSlice()
{
    if (_failure || isRead())
        return false;
    if (_survey) {
        if (!_survey->takeSlice())
            endSurvey();
    } else if (!_timeline->readSlice() || _timeline->bytesRead() >= _bytesToRead) {
        _timeline->stopReading();
    }
    return !_failure && !isRead();
}

void LogReading::stop()
{
    if (_survey) {
        _bytesToRead = _survey->bytesRead();
        endSurvey();
    } else if (_timeline) {
        _timeline->stopReading();
    }
}

void LogReading::endSurvey()
{
    if (const auto technology = _survey->technology())
        begin(*technology);
    else
        _failure = _survey->complaint(_name);
    _survey.reset();
}

void LogReading::begin(const std::string& technology)
{
    _timeline = std::make_unique<LogTimeline>(_log, technology);
}

double LogReading::progress() const
{
    if (_survey)
        return LogSurvey::kShareOfTime * _survey->progress();
    if (!_timeline || isRead())
        return 1;
    return LogSurvey::kShareOfTime + (1 - LogSurvey::kShareOfTime) * _timeline->progress();
}

} // namespace orvane
