#include "screens/print/RecordingPrinter.h"

#include <utility>

namespace orvane
{

RecordingPrinter::RecordingPrinter(MainQueue& queue, OpenedRecording recording,
                                   RecordingSettings settings, Printer& printer, OnChange onChange)
    : _queue(queue), _walk(std::move(recording), std::move(settings)), _printer(printer),
      _onChange(std::move(onChange))
{
    takeSliceLater();
}

void RecordingPrinter::takeSliceLater()
{
    _queue.async(_lifetime.whileAlive([this] { takeSlice(); }));
}

void RecordingPrinter::takeSlice()
{
    if (!std::exchange(_hasBegun, true))
        printNote();
    const auto reached = _walk.takeSlice();
    if (reached == RecordingWalk::Reached::Display)
        printDisplay();
    if (reached == RecordingWalk::Reached::End)
        _hasEnded = true;
    else
        takeSliceLater();
    if (_onChange)
        _onChange();
}

void RecordingPrinter::printNote()
{
    if (const Snapshot* snapshot = _walk.snapshot())
        _printer.showNote("Snapshot of " + snapshot->timestamp + ": " + snapshot->description);
}

void RecordingPrinter::printDisplay()
{
    PathDictionary paths;
    const PropertyValue& display = _walk.display();
    _printer.setTime(_walk.isoTime());
    _printer.reloadWithNode(display ? OrvaneModelNode::makeTreeFromObject(display, paths)
                                    : nullptr);
    _printer.setStatus(_walk.title(), false);
}

} // namespace orvane
