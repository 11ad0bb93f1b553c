#pragma once

#include "LogGenerator/LogTechnology.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A first pass over a log, which decodes nothing: what technology it is of, and whether it is a log
// at all.
class LogSurvey
{
public:
    // Of the time that it takes to read a log and decode it, about what the survey takes.
    static constexpr double kShareOfTime = 0.05;

    explicit LogSurvey(std::shared_ptr<ByteSource> log);

    // Goes on for a slice of some milliseconds; false at the end of the log.
    bool takeSlice();
    [[nodiscard]] std::uint64_t bytesRead() const { return _reader.position(); }
    // How much has been read, 0 to 1.
    [[nodiscard]] double progress() const;

    // Once takeSlice() was false: the technology constant, or one line for the person who named the
    // file that says what is wrong and what to do.
    [[nodiscard]] std::optional<std::string> technology() const;
    [[nodiscard]] std::string complaint(const std::string& path) const;

private:
    void take(const DlfItem& item);
    [[nodiscard]] bool isLog() const;

    std::shared_ptr<ByteSource> _log;
    DlfReader _reader;
    TechnologyFinder _finder;
    bool _beginsWithReport = false;
    bool _hasItems = false; // beside that report
    // Of the items with a timestamp: those that agree with the one before, and the others.
    std::uint64_t _timelyItems = 0;
    std::uint64_t _untimelyItems = 0;
    std::uint64_t _lastTimestamp = 0;
};

// What a person should know about a log that has been read, which was `size` bytes long at first:
// how many bytes could not be placed or read, and where, and how many items have a time that cannot
// be. Empty where all is well.
std::string remarkOn(const DlfReader& reader, std::uint64_t impossibleTimes, std::uint64_t size);

} // namespace orvane
