#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/RecordingWalk.h"
#include "recordings/RowWriter.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

struct ExportRequest {
    std::string file;
    std::optional<std::string> technology; // the constant; nullopt: found by the log's codes
    LogTime period = std::chrono::seconds(2);
    std::vector<std::string> paths; // none: every row
};

// Hands the rows of a recording to a writer, display by display (see RecordingWalk). Memory does
// not grow with the length of a log.
class RecordingExport
{
public:
    // Takes how much of the file has been read, 0 to 1.
    using Progress = std::function<void(double)>;

    // The writer is referred to.
    RecordingExport(ExportRequest request, RowWriter& writer, Progress progress);

    // On failure one line that says what is wrong and what to do.
    std::optional<std::string> run();
    // After that: lines that tell the user about bytes that could not be placed, and about paths
    // that do not occur.
    [[nodiscard]] const std::vector<std::string>& remarks() const { return _remarks; }

private:
    bool takeSlice(RecordingWalk& walk);
    std::optional<std::string> finish(const RecordingWalk& walk);
    [[nodiscard]] std::string emptyText(const std::optional<std::string>& technology) const;
    [[nodiscard]] std::string missingText(const std::string& path) const;

    const ExportRequest _request;
    RowWriter& _writer;
    Progress _progress;
    RowTable _table;
    bool _isReadOn = true; // somebody takes what the writer writes
    std::vector<std::string> _remarks;
};

} // namespace orvane
