#pragma once

#include "LogGenerator/LogTechnology.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// The first pass over a log. It decodes nothing; it finds out whether the file is a log at all, and
// the technology of its items. There is nothing to find where the technology is given.
class LogSurvey
{
public:
    // `technology` is a technology constant.
    explicit LogSurvey(std::shared_ptr<ByteSource> log,
                       std::optional<std::string> technology = std::nullopt);

    // Reads for some milliseconds. False at the end of the log, or once the technology is known.
    bool takeSlice();
    [[nodiscard]] std::uint64_t bytesRead() const { return _reader.position(); }
    // How much has been read, 0 to 1.
    [[nodiscard]] double progress() const;
    // How much of the survey and the decoding after it is done, 0 to 1, when `decoded` of the
    // decoding (0 to 1) is.
    [[nodiscard]] double progressWith(double decoded) const;

    // Once takeSlice() was false: the technology constant; if nullopt, complaint() is one line that
    // says what is wrong with the file and what to do. `path` is what the user calls the file.
    [[nodiscard]] std::optional<std::string> technology() const;
    [[nodiscard]] std::string complaint(const std::string& path) const;

private:
    void take(const DlfItem& item);
    [[nodiscard]] bool isLog() const;

    std::shared_ptr<ByteSource> _log;
    std::optional<std::string> _given;
    DlfReader _reader;
    TechnologyFinder _finder;
    bool _beginsWithReport = false;
    bool _hasItems = false; // after that report
    // Items with a timestamp: those near the timestamp before theirs, and the others.
    std::uint64_t _timelyItems = 0;
    std::uint64_t _untimelyItems = 0;
    std::uint64_t _lastTimestamp = 0;
};

// What the user should know about a log that has been read and was `size` bytes long at first: how
// many bytes could not be placed or read, and where; how many items have an impossible time. Empty
// if nothing is wrong.
std::string remarkOn(const DlfReader& reader, std::uint64_t impossibleTimes, std::uint64_t size);

} // namespace orvane
