#include "recordings/RecordingExport.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/Technology.h"
#include "recordings/LogSurvey.h"

#include <utility>

namespace orvane
{

RecordingExport::RecordingExport(ExportRequest request, RowWriter& writer, Progress progress)
    : _request(std::move(request)), _writer(writer), _progress(std::move(progress)),
      _table(_request.paths)
{
}

std::optional<std::string> RecordingExport::run()
{
    const OpenedRecording recording = openRecording(_request.file);
    if (recording.error)
        return recording.error;
    if (recording.snapshot)
        takeEntries(*recording.snapshot);
    else if (auto problem = takeLog(recording.log))
        return problem;
    return finish();
}

std::optional<std::string> RecordingExport::takeLog(const std::shared_ptr<ByteSource>& log)
{
    _technology = _request.technology;
    if (!_technology) {
        LogSurvey survey(log);
        while (_isReadOn && survey.takeSlice())
            goOnIf(_progress(LogSurvey::kShareOfTime * survey.progress()));
        if (!_isReadOn)
            return std::nullopt;
        _technology = survey.technology();
        if (!_technology)
            return survey.complaint(_request.file);
    }
    RefreshPeriods periods(log, *_technology, _request.period);
    while (takeSlice(periods))
        goOnIf(_progress(LogSurvey::kShareOfTime +
                         (1 - LogSurvey::kShareOfTime) * periods.progress()));
    goOnIf(_progress(1));
    if (const std::string remark = periods.remark(); _isReadOn && !remark.empty())
        _remarks.push_back(_request.file + ": " + remark);
    return std::nullopt;
}

// False at the end.
bool RecordingExport::takeSlice(RefreshPeriods& periods)
{
    if (!_isReadOn)
        return false;
    const auto reached = periods.takeSlice();
    if (reached == RefreshPeriods::Reached::Period)
        take(periods.play().clock().isoText(periods.time()), periods.play().display());
    return reached != RefreshPeriods::Reached::End;
}

void RecordingExport::takeEntries(const Snapshot& snapshot)
{
    for (const Snapshot::Entry& entry : snapshot.entries)
        if (entry.display && _isReadOn)
            take(entry.isoDate().value_or(""), entry.display);
}

void RecordingExport::take(const std::string& time, const PropertyValue& display)
{
    _table.take(display);
    goOnIf(_writer.takePeriod(time, _table));
}

std::optional<std::string> RecordingExport::finish()
{
    if (_isReadOn) {
        const std::vector<std::string> missing = _table.missingPaths();
        if (!missing.empty() && missing.size() == _request.paths.size())
            return missingText(missing.front());
        for (const std::string& path : missing)
            _remarks.push_back(_request.paths.empty() ? emptyText() : missingText(path));
        _writer.finish(_table);
    }
    return _writer.problem();
}

std::string RecordingExport::emptyText() const
{
    if (!_technology)
        return _request.file + ": no row occurs";
    return _request.file + ": no row occurs in it as a log of \"" + nameOfTechnology(*_technology) +
           "\": for another technology name it with --technology, one of " + technologyNames();
}

std::string RecordingExport::missingText(const std::string& path) const
{
    return _request.file + ": nothing has the path \"" + path +
           "\": see orvane export --list for those that occur";
}

} // namespace orvane
