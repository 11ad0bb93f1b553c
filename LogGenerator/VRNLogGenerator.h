#pragma once

#include "LogGenerator/LogGenerator.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

#include <optional>

namespace orvane
{

// The base of the diagnostic-log generators: keeps the raw messages, and offers them for saving as
// a DLF file beside the history's snapshots.
class VRNLogGenerator : public LogGenerator
{
public:
    void init();

    void keepNoMessages() override { _keepsMessages = false; }
    // The history's snapshots, oldest first, then an entry with the DLF file unless that failed.
    PropertyValue getSaveContentsFromState(PropertyDictionary& state) override;
    // The version report, then the raw messages of every snapshot. Nothing (with an error line)
    // when a snapshot holds something else than bytes.
    static std::optional<Bytes> generateDlfFromState(const PropertyDictionary& state);

protected:
    // Whether init() has run.
    [[nodiscard]] bool isInitialised() const { return _binData.has_value(); }
    void appendToBinData(ByteView message);
    // Stores what was gathered as the state's "DisplayState" and starts anew.
    void moveBinDataToState(PropertyDictionary& state);
    // Does that, then appends a snapshot of the state to the history. All snapshots together keep
    // at most kMostKeptBytes of raw messages.
    void recordSnapshot(PropertyDictionary& state);

private:
    // The messages since the last display. Absent in an object that was never initialised.
    std::optional<Bytes> _binData;
    bool _keepsMessages = true;
    bool _hasDroppedMessages = false; // since the last display
};

} // namespace orvane
