#pragma once

#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "recordings/RecordingWalk.h"
#include "screens/print/Printer.h"

#include <functional>
#include <optional>
#include <string>

namespace orvane
{

// Prints every display of a recording once, as fast as the printer takes them, a little in each
// turn of the queue.
class RecordingPrinter
{
public:
    // More has been read, or everything has been printed. Never called by the constructor.
    using OnChange = std::function<void()>;

    // Queue and printer are referred to and must outlive this. The recording is one without an
    // error.
    RecordingPrinter(MainQueue& queue, OpenedRecording recording, RecordingSettings settings,
                     Printer& printer, OnChange onChange);

    // How much has been read, 0 to 1.
    [[nodiscard]] double progress() const { return _hasEnded ? 1 : _walk.progress(); }
    [[nodiscard]] bool hasEnded() const { return _hasEnded; }
    // Then: one line that says why the recording could not be printed, and what to do.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _walk.failure(); }
    // Then: what the user should know about the file; empty if nothing is wrong.
    [[nodiscard]] std::string remark() const { return _walk.remark(); }

private:
    void takeSliceLater();
    void takeSlice();
    void printNote();
    void printDisplay();

    MainQueue& _queue;
    RecordingWalk _walk;
    Printer& _printer;
    OnChange _onChange;
    bool _hasBegun = false;
    bool _hasEnded = false;
    Lifetime _lifetime;
};

} // namespace orvane
