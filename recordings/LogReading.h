#pragma once

#include "recordings/LogSurvey.h"
#include "recordings/LogTimeline.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Reads a log, in slices, until it can be shown as it was at any of its times: first, unless the
// technology is given, to find that, then to make the timeline.
class LogReading
{
public:
    // `name` is what the person calls the file; `technology` is a technology constant.
    LogReading(std::shared_ptr<ByteSource> log, std::string name,
               const std::optional<std::string>& technology);

    // Reads on for some milliseconds; false once the log has been read or cannot be.
    bool readSlice();
    // What was read by now is the log. Where that has no timeline yet, reading goes on up to there.
    void stop();
    // How much has been done, 0 to 1.
    [[nodiscard]] double progress() const;

    // One line that says why the log cannot be shown, and what to do.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _failure; }
    [[nodiscard]] bool isRead() const { return _timeline && _timeline->isRead(); }
    // Null until the technology is known.
    [[nodiscard]] LogTimeline* timeline() const { return _timeline.get(); }

private:
    void endSurvey();
    void begin(const std::string& technology);

    std::shared_ptr<ByteSource> _log;
    std::string _name;
    std::optional<std::string> _failure;
    std::optional<LogSurvey> _survey;       // while the technology is sought
    std::unique_ptr<LogTimeline> _timeline; // from then on
    std::uint64_t _bytesToRead = UINT64_MAX;
};

} // namespace orvane
