#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/OpenedRecording.h"
#include "recordings/RefreshPeriods.h"
#include "recordings/RowWriter.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

struct ExportRequest {
    std::string file;
    std::optional<std::string> technology; // the constant; nothing: found by the log's codes
    LogTime period = std::chrono::seconds(2);
    std::vector<std::string> paths; // none: every row
};

// Hands the rows of a recording to a writer: of a log what is shown at the end of each refresh
// period, of a snapshot what each of its entries shows. Memory does not grow with the file.
class RecordingExport
{
public:
    // Takes how much of the file has been read, 0 to 1. False gives up on the rest.
    using Progress = std::function<bool(double)>;

    // The writer is referred to.
    RecordingExport(ExportRequest request, RowWriter& writer, Progress progress);

    // One line that says what is wrong and what to do where it fails.
    std::optional<std::string> run();
    // Then: lines that tell what a person should know, as bytes that could not be placed, and paths
    // that do not occur.
    [[nodiscard]] const std::vector<std::string>& remarks() const { return _remarks; }

private:
    std::optional<std::string> takeLog(const std::shared_ptr<ByteSource>& log);
    bool takeSlice(RefreshPeriods& periods);
    void takeEntries(const Snapshot& snapshot);
    void take(const std::string& time, const PropertyValue& display);
    void goOnIf(bool isReadOn) { _isReadOn = _isReadOn && isReadOn; }
    std::optional<std::string> finish();
    [[nodiscard]] std::string emptyText() const;
    [[nodiscard]] std::string missingText(const std::string& path) const;

    const ExportRequest _request;
    RowWriter& _writer;
    Progress _progress;
    RowTable _table;
    std::optional<std::string> _technology; // that a log is read as
    bool _isReadOn = true;
    std::vector<std::string> _remarks;
};

} // namespace orvane
