#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/DictionaryResource.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/Services.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr const char* kTemplateName = "C2KTemplate";
constexpr const char* kLookupKey = "Lookup";
constexpr const char* kSorted = "_sorted";

PropertyValue loadTemplate(PropertyDictionary& state)
{
    const PropertyValue cached = state[kTemplateKey];
    if (cached)
        return cached;
    const PropertyValue loaded =
        loadDictionaryResource(Services::current().resources(), kTemplateName);
    if (loaded)
        state.set(kTemplateKey, loaded);
    else
        logError("Cannot load C2K template for display");
    return loaded;
}

// Lets the row of the display dictionary show the state key's value.
void addToLookup(PropertyDictionary& lookup, const std::string& stateKey, const std::string& row,
                 const PropertyValue& display)
{
    if (!lookup[stateKey].asArray())
        lookup.set(stateKey, PropertyValue::newArray());
    lookup[stateKey].asArray()->append(PropertyValue::dictionaryOf({
        {kLookupRowKey,  row    },
        {kLookupDictKey, display}
    }));
}

} // namespace

std::unique_ptr<LogGenerator> C2KLogGenerator::generator()
{
    auto generator = std::make_unique<C2KLogGenerator>();
    generator->init();
    return generator;
}

void C2KLogGenerator::updateState(PropertyDictionary& state, ByteView data)
{
    getDisplayFromState(state);
    updateFromLog(data, PropertyValue(state[kLookupKey]), state);
}

void C2KLogGenerator::updateFromLog(ByteView packet, const PropertyValue& usingLookup,
                                    PropertyDictionary& usingState)
{
    if (packet.size() < kLogHeaderBytes)
        return;
    const ByteView message = unwrappedMessage(packet);
    // Deliberate: the message is decoded all the same, whatever the line says.
    if (message[0] != kModemItem)
        logError("Invalid log type: %x. Dropping.", message[0]);
    const std::span<const C2KDecoder> decoders = c2kDecoders();
    const auto decoder =
        std::find_if(decoders.begin(), decoders.end(),
                     [code = logCodeOf(message)](const auto& one) { return one.logCode == code; });
    if (decoder == decoders.end())
        return;
    decoder->decode(PacketView(message), usingState, C2KPublisher(usingLookup));
    appendToBinData(message);
}

void C2KLogGenerator::processTemplate(const PropertyDictionary& displayTemplate,
                                      const PropertyValue& storeDisplayIntoDict,
                                      PropertyDictionary& storeLookupIntoDict)
{
    PropertyDictionary* display = storeDisplayIntoDict.asDictionary();
    if (!display)
        return;
    for (const auto& [key, value] : displayTemplate) {
        if (const PropertyDictionary* group = value.asDictionary()) {
            const PropertyValue rows = PropertyValue::newDictionary();
            processTemplate(*group, rows, storeLookupIntoDict);
            display->set(key, rows);
        } else if (const std::string* text = value.asString()) {
            if (*text == kSorted) {
                display->set(key, kSorted);
            } else {
                display->set(key, "");
                addToLookup(storeLookupIntoDict, *text, key, storeDisplayIntoDict);
            }
        }
    }
    logWarning("Processing the template");
}

PropertyValue C2KLogGenerator::getDisplayFromState(PropertyDictionary& state)
{
    if (state.contains(kDisplayKey))
        return state[kDisplayKey];
    const PropertyValue displayTemplate = loadTemplate(state);
    const PropertyDictionary* groups = displayTemplate.asDictionary();
    if (!groups)
        return {};
    const PropertyValue lookup = PropertyValue::newDictionary();
    const PropertyValue display = PropertyValue::newDictionary();
    processTemplate(*groups, display, *lookup.asDictionary());
    state.set(kDisplayKey, display);
    state.set(kLookupKey, lookup);
    state.set(kExtraInfoKey, PropertyValue::newDictionary());
    return display;
}

PropertyValue C2KLogGenerator::generateLogUsingState(PropertyDictionary& state)
{
    PropertyValue display = getDisplayFromState(state);
    recordSnapshot(state);
    return display;
}

PropertyValue C2KLogGenerator::getStartCommand() const
{
    const PropertyValue codes = PropertyValue::newArray();
    for (const C2KDecoder& decoder : c2kDecoders())
        codes.asArray()->append(PropertyValue::integer(decoder.logCode));
    return PropertyValue::dictionaryOf({
        {kSetStateKey,         kStreaming},
        {kSetModemLogCodesKey, codes     }
    });
}

} // namespace orvane
