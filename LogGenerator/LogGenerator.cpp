#include "LogGenerator/LogGenerator.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/UnrecognisedOperation.h"
#include "platform/base/Calendar.h"
#include "platform/services/Services.h"

namespace orvane
{

namespace
{

constexpr std::size_t kHistoryLimit = 5;

// Deliberate: stops at the first value that the state lacks. A state without "DisplayState" gives
// an empty entry, one without "Display" only the "DisplayState".
PropertyValue historyEntry(const PropertyDictionary& state)
{
    PropertyValue entry = PropertyValue::newDictionary();
    for (const char* key : {kDisplayStateKey, kDisplayKey, kExtraInfoKey}) {
        if (!state.contains(key))
            return entry;
        entry.asDictionary()->set(key, state[key].deepCopy());
    }
    const std::string date = absoluteDateText(Services::current().clock().secondsSince1970());
    entry.asDictionary()->set(kDateKey, date);
    entry.asDictionary()->set(kDescriptionKey, "Snapshot (" + date + ")");
    return entry;
}

} // namespace

void LogGenerator::init() { logWarning("Creating Log object: %p", static_cast<void*>(this)); }

void LogGenerator::updateState(PropertyDictionary&, ByteView)
{
    throw UnrecognisedOperation("LogGenerator updateState");
}

PropertyValue LogGenerator::generateLogUsingState(PropertyDictionary&)
{
    throw UnrecognisedOperation("LogGenerator generateLogUsingState");
}

PropertyValue LogGenerator::getStartCommand() const
{
    throw UnrecognisedOperation("LogGenerator getStartCommand");
}

PropertyValue LogGenerator::getSaveContentsFromState(PropertyDictionary&)
{
    throw UnrecognisedOperation("LogGenerator getSaveContentsFromState");
}

PropertyValue LogGenerator::historyOf(const PropertyDictionary& state)
{
    PropertyValue snapshots = PropertyValue::newArray();
    if (const PropertyArray* history = state[kHistoryKey].asArray())
        for (const PropertyValue& snapshot : *history)
            snapshots.asArray()->append(snapshot);
    return snapshots;
}

void LogGenerator::updateHistoryInState(PropertyDictionary& state)
{
    if (!state[kHistoryKey].asArray())
        state.set(kHistoryKey, PropertyValue::newArray());
    PropertyArray& history = *state[kHistoryKey].asArray();
    if (history.size() >= kHistoryLimit)
        history.removeFirst(history.size() - (kHistoryLimit - 1));
    history.append(historyEntry(state));
}

} // namespace orvane
