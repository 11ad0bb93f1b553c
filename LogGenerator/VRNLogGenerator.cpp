#include "LogGenerator/VRNLogGenerator.h"

#include "LogGenerator/KeptMessages.h"
#include "LogGenerator/StateKeys.h"
#include "dlf/VersionReport.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <cstdio>
#include <utility>

namespace orvane
{

namespace
{

// So much more than is kept may gather before the oldest is dropped, since dropping moves the rest.
constexpr std::size_t kSlackBytes = 4U << 20;

} // namespace

void VRNLogGenerator::init()
{
    LogGenerator::init();
    _binData.emplace();
}

void VRNLogGenerator::appendToBinData(ByteView message)
{
    if (!_binData || !_keepsMessages)
        return;
    _binData->insert(_binData->end(), message.begin(), message.end());
    if (_binData->size() <= kMostKeptBytes + kSlackBytes)
        return;
    const std::size_t dropped = lengthOfFirstMessages(*_binData, kSlackBytes);
    _binData->erase(_binData->begin(), _binData->begin() + static_cast<std::ptrdiff_t>(dropped));
    _hasDroppedMessages = true;
}

void VRNLogGenerator::moveBinDataToState(PropertyDictionary& state)
{
    if (!_binData)
        return;
    state.set(kDisplayStateKey, PropertyValue::data(std::exchange(*_binData, Bytes())));
}

void VRNLogGenerator::recordSnapshot(PropertyDictionary& state)
{
    moveBinDataToState(state);
    updateHistoryInState(state);
    if (std::exchange(_hasDroppedMessages, false)) {
        const PropertyArray& history = *state[kHistoryKey].asArray();
        PropertyValue marked = PropertyValue::newArray();
        for (std::size_t i = 0; i < history.size(); ++i)
            marked.asArray()->append(i + 1 < history.size() ? history[i]
                                                            : incompleteEntry(history[i]));
        state.set(kHistoryKey, marked);
    }
    state.set(kHistoryKey, boundedHistory(state[kHistoryKey], kMostKeptBytes));
}

std::optional<Bytes> VRNLogGenerator::generateDlfFromState(const PropertyDictionary& state)
{
    std::optional<Bytes> dlf(std::in_place, kDlfVersionReportBytes);
    if (!writeVersionReport(*dlf))
        return std::nullopt;
    const PropertyArray* history = state[kHistoryKey].asArray();
    if (!history)
        return dlf;
    for (const PropertyValue& snapshot : *history) {
        const PropertyValue& messages = snapshot[kDisplayStateKey];
        if (!messages)
            continue;
        const Bytes* bytes = messages.asData();
        if (!bytes) {
            logError("Got wrong class writing history to DLF; aborting writing the DLF file");
            return std::nullopt;
        }
        // Deliberate: only the first message of a snapshot loses its type byte. Later ones keep
        // theirs, and wrapped ones their wrapper.
        if (bytes->size() >= 2)
            dlf->insert(dlf->end(), bytes->begin() + 1, bytes->end());
    }
    return dlf;
}

PropertyValue VRNLogGenerator::getSaveContentsFromState(PropertyDictionary& state)
{
    PropertyValue contents = historyOf(state);
    if (std::optional<Bytes> dlf = generateDlfFromState(state)) {
        const PropertyArray& snapshots = *contents.asArray();
        const bool isIncomplete =
            std::any_of(snapshots.begin(), snapshots.end(), isIncompleteEntry);
        char description[64];
        std::snprintf(description, sizeof description,
                      isIncomplete ? "DLF binary (%d bytes, oldest messages left out)"
                                   : "DLF binary (%d bytes)",
                      static_cast<int>(dlf->size()));
        contents.asArray()->append(PropertyValue::dictionaryOf({
            {kDescriptionKey, description                         },
            {"DLF",           PropertyValue::data(std::move(*dlf))}
        }));
    }
    return contents;
}

} // namespace orvane
