#include "recordings/RecordingWalk.h"

#include <utility>

namespace orvane
{

RecordingWalk::RecordingWalk(OpenedRecording recording, RecordingSettings settings)
    : _recording(std::move(recording)), _settings(std::move(settings))
{
    if (_recording.log)
        _survey.emplace(_recording.log, _settings.technology);
}

RecordingWalk::Reached RecordingWalk::takeSlice()
{
    if (_failure)
        return Reached::End;
    if (!_survey)
        return takeEntry();
    if (!_periods)
        return takeSurvey();
    switch (_periods->takeSlice()) {
    case RefreshPeriods::Reached::Nothing:
        return Reached::Nothing;
    case RefreshPeriods::Reached::Period:
        _failure = _periods->decoder().problem();
        return _failure ? Reached::End : Reached::Display;
    case RefreshPeriods::Reached::End:
        break;
    }
    return Reached::End;
}

RecordingWalk::Reached RecordingWalk::takeEntry()
{
    if (!snapshot() || _entriesTaken == snapshot()->entries.size())
        return Reached::End;
    ++_entriesTaken;
    return Reached::Display;
}

RecordingWalk::Reached RecordingWalk::takeSurvey()
{
    if (_survey->takeSlice())
        return Reached::Nothing;
    _technology = _survey->technology();
    if (_technology)
        _periods.emplace(_recording.log, *_technology, _settings.refreshPeriod);
    else
        _failure = _survey->complaint(_settings.name);
    return Reached::Nothing;
}

const Snapshot* RecordingWalk::snapshot() const
{
    return _recording.snapshot ? &*_recording.snapshot : nullptr;
}

const PropertyValue& RecordingWalk::display() const
{
    static const PropertyValue kAbsent;
    if (_periods)
        return _periods->decoder().display();
    return _entriesTaken > 0 ? snapshot()->entries[_entriesTaken - 1].display : kAbsent;
}

std::optional<std::string> RecordingWalk::isoTime() const
{
    if (_periods)
        return _periods->decoder().clock().isoText(_periods->time());
    return _entriesTaken > 0 ? snapshot()->entries[_entriesTaken - 1].isoDate() : std::nullopt;
}

std::string RecordingWalk::title() const
{
    if (_periods)
        return _periods->decoder().clock().text(_periods->time());
    return _entriesTaken > 0 ? snapshot()->entries[_entriesTaken - 1].description : "";
}

double RecordingWalk::progress() const
{
    if (_survey)
        return _survey->progressWith(_periods ? _periods->progress() : 0);
    if (!snapshot() || snapshot()->entries.empty())
        return 1;
    return static_cast<double>(_entriesTaken) / static_cast<double>(snapshot()->entries.size());
}

std::string RecordingWalk::remark() const { return _periods ? _periods->remark() : ""; }

} // namespace orvane
