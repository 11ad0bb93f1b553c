#include "LogGenerator/VRNLogGenerator.h"

#include "LogGenerator/StateKeys.h"
#include "dlf/VersionReport.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <cstdio>
#include <utility>

namespace orvane
{

void VRNLogGenerator::init()
{
    LogGenerator::init();
    _binData.emplace();
}

void VRNLogGenerator::appendToBinData(ByteView message)
{
    if (_binData && _keepsMessages)
        _binData->insert(_binData->end(), message.begin(), message.end());
}

void VRNLogGenerator::moveBinDataToState(PropertyDictionary& state)
{
    if (!_binData)
        return;
    state.set(kDisplayStateKey, PropertyValue::data(std::exchange(*_binData, Bytes())));
}

std::optional<Bytes> VRNLogGenerator::generateDlfFromState(const PropertyDictionary& state)
{
    std::optional<Bytes> dlf = makeVersionReport();
    const PropertyArray* history = state[kHistoryKey].asArray();
    if (!dlf || !history)
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
        // Only the first message of a snapshot loses its type byte; later ones keep theirs, and
        // wrapped ones their wrapper. This is meant.
        if (bytes->size() >= 2)
            dlf->insert(dlf->end(), bytes->begin() + 1, bytes->end());
    }
    return dlf;
}

PropertyValue VRNLogGenerator::getSaveContentsFromState(PropertyDictionary& state)
{
    PropertyValue contents = historyOf(state);
    if (std::optional<Bytes> dlf = generateDlfFromState(state)) {
        char description[64];
        std::snprintf(description, sizeof description, "DLF binary (%d bytes)",
                      static_cast<int>(dlf->size()));
        contents.asArray()->append(PropertyValue::dictionaryOf({
            {kDescriptionKey, description                         },
            {"DLF",           PropertyValue::data(std::move(*dlf))}
        }));
    }
    return contents;
}

} // namespace orvane
