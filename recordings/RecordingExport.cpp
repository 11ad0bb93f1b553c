#include "recordings/RecordingExport.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/Technology.h"

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
    OpenedRecording recording = openRecording(_request.file);
    if (recording.error)
        return recording.error;
    RecordingWalk walk(std::move(recording), {_request.file, _request.technology, _request.period});
    while (takeSlice(walk))
        _progress(walk.progress());
    if (walk.failure())
        return walk.failure();
    _progress(1);
    if (const std::string remark = walk.remark(); _isReadOn && !remark.empty())
        _remarks.push_back(_request.file + ": " + remark);
    return finish(walk);
}

// False at the end, or if nobody reads on.
bool RecordingExport::takeSlice(RecordingWalk& walk)
{
    const auto reached = walk.takeSlice();
    // An entry of a snapshot without a display gives no line.
    if (reached == RecordingWalk::Reached::Display && (walk.display() || !walk.snapshot())) {
        _table.take(walk.display());
        _isReadOn = _writer.takePeriod(walk.isoTime().value_or(""), _table);
    }
    return _isReadOn && reached != RecordingWalk::Reached::End;
}

std::optional<std::string> RecordingExport::finish(const RecordingWalk& walk)
{
    if (_isReadOn) {
        const std::vector<std::string> missing = _table.missingPaths();
        if (!missing.empty() && missing.size() == _request.paths.size())
            return missingText(missing.front());
        for (const std::string& path : missing)
            _remarks.push_back(_request.paths.empty() ? emptyText(walk.technology())
                                                      : missingText(path));
        _writer.finish(_table);
    }
    return _writer.problem();
}

std::string RecordingExport::emptyText(const std::optional<std::string>& technology) const
{
    if (!technology)
        return _request.file + ": no row occurs";
    return _request.file + ": no row occurs in it as a log of \"" + nameOfTechnology(*technology) +
           "\": for another technology name it with --technology, one of " + technologyNames();
}

std::string RecordingExport::missingText(const std::string& path) const
{
    return _request.file + ": nothing has the path \"" + path +
           "\": see orvane export --list for those that occur";
}

} // namespace orvane
