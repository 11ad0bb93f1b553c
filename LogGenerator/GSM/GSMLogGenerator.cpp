#include "LogGenerator/GSM/GSMLogGenerator.h"

#include "LogGenerator/InternalInconsistency.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/TextReadings.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"

#include <utility>

namespace orvane
{

namespace
{

// Source and lines that the failures name, whatever stands there.
constexpr const char* kSource = "LogGenerator/GSM/GSMLogGenerator";
constexpr int kUnknownTypeLine = 78;
constexpr int kUnreadableLine = 90;

PropertyValue simplified(const PropertyValue& value)
{
    PropertyValue simple = GSMLogGenerator::processObject(value);
    // Deliberate: one level only. What takes the dictionary's place is not tested again.
    PropertyValue only = GSMLogGenerator::canCollapse(simple);
    return only ? std::move(only) : std::move(simple);
}

} // namespace

std::unique_ptr<LogGenerator> GSMLogGenerator::generator()
{
    auto generator = std::make_unique<GSMLogGenerator>();
    generator->init();
    return generator;
}

void GSMLogGenerator::updateState(PropertyDictionary& state, ByteView data)
{
    const PropertyValue received = readPropertyList(data).value;
    if (!received)
        throw InternalInconsistency("Could not deserialize the object", kSource, kUnreadableLine);
    PropertyValue display = withTextReadings(processObject(received));
    state.set(kDisplayStateKey, received);
    state.set(kDisplayKey, std::move(display));
    state.set(kExtraInfoKey, PropertyValue::newDictionary());
}

PropertyValue GSMLogGenerator::generateLogUsingState(PropertyDictionary& state)
{
    updateHistoryInState(state);
    return state[kDisplayKey];
}

PropertyValue GSMLogGenerator::getStartCommand() const
{
    return PropertyValue::dictionaryOf({
        {kSetStateKey, kStreaming}
    });
}

PropertyValue GSMLogGenerator::getSaveContentsFromState(PropertyDictionary& state)
{
    return historyOf(state);
}

PropertyValue GSMLogGenerator::processObject(const PropertyValue& object)
{
    if (object.asString())
        return object;
    if (const PropertyDictionary* dictionary = object.asDictionary()) {
        PropertyValue simple = PropertyValue::newDictionary();
        for (const auto& [key, value] : *dictionary)
            simple.asDictionary()->set(key, simplified(value));
        return simple;
    }
    if (const PropertyArray* array = object.asArray()) {
        PropertyValue simple = PropertyValue::newArray();
        // Deliberate: the first element of every array is dropped.
        for (std::size_t i = 1; i < array->size(); ++i)
            simple.asArray()->append(simplified((*array)[i]));
        return simple;
    }
    throw InternalInconsistency("Unknown object of type " + std::string(object.typeName()) +
                                    " encountered",
                                kSource, kUnknownTypeLine);
}

PropertyValue GSMLogGenerator::canCollapse(const PropertyValue& value)
{
    const PropertyDictionary* dictionary = value.asDictionary();
    return dictionary && dictionary->size() == 1 ? dictionary->begin()->second : PropertyValue();
}

} // namespace orvane
