#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/LogSurvey.h"
#include "recordings/OpenedRecording.h"
#include "recordings/RecordingSettings.h"
#include "recordings/RefreshPeriods.h"

#include <optional>
#include <string>

namespace orvane
{

// Goes through a recording once, from its start to its end, and stops at every display that it
// holds: in a log at the end of each refresh period, in a snapshot at each entry. Unless the
// technology of a log is given, that is found first.
class RecordingWalk
{
public:
    enum class Reached {
        Nothing, // the slice is over: call again
        Display, // see below
        End,     // no further display
    };

    // The recording is one without an error.
    RecordingWalk(OpenedRecording recording, RecordingSettings settings);

    // Goes on for some milliseconds, or to the next display.
    Reached takeSlice();

    // After Reached::Display, until the next slice:

    // Absent for an entry of a snapshot that has no display.
    [[nodiscard]] const PropertyValue& display() const;
    // "2026-11-21T10:00:00.000Z"; nullopt if it is not known.
    [[nodiscard]] std::optional<std::string> isoTime() const;
    // What a person calls it: the time of a log, the description of an entry.
    [[nodiscard]] std::string title() const;

    // How much of the recording has been read, 0 to 1.
    [[nodiscard]] double progress() const;
    // After Reached::End: one line that says why the recording cannot be read, and what to do.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _failure; }
    // Then: what the user should know about the file; empty if nothing is wrong.
    [[nodiscard]] std::string remark() const;

    // Null unless the recording is a snapshot.
    [[nodiscard]] const Snapshot* snapshot() const;
    // The technology constant as which a log is decoded; nullopt before that.
    [[nodiscard]] const std::optional<std::string>& technology() const { return _technology; }

private:
    Reached takeEntry();
    Reached takeSurvey();

    OpenedRecording _recording;
    RecordingSettings _settings;
    std::size_t _entriesTaken = 0;          // of a snapshot
    std::optional<LogSurvey> _survey;       // of a log
    std::optional<RefreshPeriods> _periods; // of a log whose technology is known
    std::optional<std::string> _technology;
    std::optional<std::string> _failure;
};

} // namespace orvane
