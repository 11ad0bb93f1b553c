#include "screens/print/RecordingPrinter.h"

#include "platform/base/PropertyValue.h"

#include <utility>

namespace orvane
{

RecordingPrinter::RecordingPrinter(MainQueue& queue, OpenedRecording recording,
                                   RecordingSettings settings, OutputPane& output,
                                   OnChange onChange)
    : _queue(queue), _recording(std::move(recording)), _settings(std::move(settings)),
      _output(output), _onChange(std::move(onChange))
{
    if (_recording.log && _settings.technology)
        begin(*_settings.technology);
    else if (_recording.log)
        _survey.emplace(_recording.log);
    goOnLater();
}

void RecordingPrinter::goOnLater()
{
    _queue.async(_lifetime.whileAlive([this] { goOn(); }));
}

void RecordingPrinter::goOn()
{
    if (_survey)
        goOnWithSurvey();
    else if (_periods)
        goOnWithLog();
    else if (_recording.snapshot)
        goOnWithSnapshot(*_recording.snapshot);
    else
        _hasEnded = true;
    if (!_hasEnded)
        goOnLater();
    if (_onChange)
        _onChange();
}

void RecordingPrinter::goOnWithSurvey()
{
    if (_survey->takeSlice())
        return;
    if (const auto technology = _survey->technology()) {
        begin(*technology);
    } else {
        _failure = _survey->complaint(_settings.name);
        _hasEnded = true;
    }
    _survey.reset();
}

void RecordingPrinter::begin(const std::string& technology)
{
    _periods.emplace(_recording.log, technology, _settings.refreshPeriod);
}

void RecordingPrinter::goOnWithLog()
{
    const RefreshPeriods::Reached reached = _periods->takeSlice();
    const LogPlay& play = _periods->play();
    if (reached == RefreshPeriods::Reached::Period)
        print(play.clock().isoText(play.time()), play.clock().text(play.time()), play.display());
    _hasEnded = reached == RefreshPeriods::Reached::End;
}

void RecordingPrinter::goOnWithSnapshot(const Snapshot& snapshot)
{
    if (_entriesPrinted == 0)
        _output.showNote("Snapshot of " + snapshot.timestamp + ": " + snapshot.description);
    if (_entriesPrinted < snapshot.entries.size()) {
        const Snapshot::Entry& entry = snapshot.entries[_entriesPrinted++];
        print(entry.isoDate(), entry.description, entry.display);
    }
    _hasEnded = _entriesPrinted == snapshot.entries.size();
}

void RecordingPrinter::print(std::optional<std::string> time, const std::string& status,
                             const PropertyValue& display)
{
    PathDictionary paths;
    _output.setTime(std::move(time));
    _output.reloadWithNode(display ? OrvaneModelNode::makeTreeFromObject(display, paths) : nullptr);
    _output.setStatus(status, false);
}

double RecordingPrinter::progress() const
{
    if (_survey)
        return _survey->progress() * LogSurvey::kShareOfTime;
    if (_periods && !_hasEnded)
        return LogSurvey::kShareOfTime + (1 - LogSurvey::kShareOfTime) * _periods->progress();
    return _hasEnded ? 1 : 0;
}

std::string RecordingPrinter::remark() const { return _periods ? _periods->remark() : ""; }

} // namespace orvane
