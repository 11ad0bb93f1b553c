#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "recordings/LogSurvey.h"
#include "recordings/OpenedRecording.h"
#include "recordings/RecordingSettings.h"
#include "recordings/RefreshPeriods.h"
#include "screens/print/OutputPane.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Prints a recording once, as fast as it can: of a log what is shown at the end of each refresh
// period, of a snapshot each of its entries. Works a little a turn of the queue, and never ahead of
// what the output takes.
class RecordingPrinter
{
public:
    // There is news: more has been read, or all is done. Never called by the constructor.
    using OnChange = std::function<void()>;

    // Queue and output are referred to and must outlive it. The recording is one without an error.
    RecordingPrinter(MainQueue& queue, OpenedRecording recording, RecordingSettings settings,
                     OutputPane& output, OnChange onChange);

    // How much has been read, 0 to 1.
    [[nodiscard]] double progress() const;
    [[nodiscard]] bool hasEnded() const { return _hasEnded; }
    // Then: one line that says why it could not be printed, and what to do.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _failure; }
    // Then: what a person should know about the file; empty where all is well.
    [[nodiscard]] std::string remark() const;

private:
    void goOnLater();
    void goOn();
    void goOnWithSurvey();
    void goOnWithLog();
    void goOnWithSnapshot(const Snapshot& snapshot);
    void begin(const std::string& technology);
    void print(std::optional<std::string> time, const std::string& status,
               const PropertyValue& display);

    MainQueue& _queue;
    OpenedRecording _recording;
    RecordingSettings _settings;
    OutputPane& _output;
    OnChange _onChange;
    std::optional<LogSurvey> _survey;
    std::optional<RefreshPeriods> _periods;
    std::size_t _entriesPrinted = 0;
    bool _hasEnded = false;
    std::optional<std::string> _failure;
    Lifetime _lifetime;
};

} // namespace orvane
