#include "LogGenerator/KeptMessages.h"

#include "LogGenerator/StateKeys.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PacketView.h"

#include <algorithm>
#include <string>

namespace orvane
{

namespace
{

constexpr const char* kIncomplete = " (oldest raw messages left out)";

// The whole length where the header does not tell.
std::size_t lengthOfMessage(ByteView messages)
{
    const std::size_t wrapper = messages[0] == kLogWrapper ? kLogWrapperBytes : 0;
    const auto item = PacketView(messages).unsignedAt(wrapper + 1, 2).value_or(0);
    if (item < kLogHeaderBytes - 1 || item >= messages.size() - wrapper)
        return messages.size();
    return wrapper + 1 + static_cast<std::size_t>(item);
}

std::size_t keptBytes(const PropertyValue& entry)
{
    const Bytes* bytes = entry[kDisplayStateKey].asData();
    return bytes ? bytes->size() : 0;
}

PropertyValue shallowCopy(const PropertyValue& entry)
{
    PropertyValue copy = PropertyValue::newDictionary();
    for (const auto& [key, value] : *entry.asDictionary())
        copy.asDictionary()->set(key, value);
    return copy;
}

} // namespace

std::size_t lengthOfFirstMessages(ByteView messages, std::size_t count)
{
    std::size_t length = 0;
    while (length < count && length < messages.size())
        length += lengthOfMessage(messages.subspan(length));
    return length;
}

PropertyValue incompleteEntry(const PropertyValue& entry)
{
    if (!entry.asDictionary() || isIncompleteEntry(entry))
        return entry;
    PropertyValue marked = shallowCopy(entry);
    const std::string* description = entry[kDescriptionKey].asString();
    marked.asDictionary()->set(kDescriptionKey,
                               (description ? *description : std::string()) + kIncomplete);
    return marked;
}

bool isIncompleteEntry(const PropertyValue& entry)
{
    const std::string* description = entry[kDescriptionKey].asString();
    return description && description->ends_with(kIncomplete);
}

PropertyValue boundedHistory(const PropertyValue& history, std::size_t limit)
{
    const PropertyArray* entries = history.asArray();
    if (!entries)
        return history;
    std::size_t total = 0;
    for (const PropertyValue& entry : *entries)
        total += keptBytes(entry);
    if (total <= limit)
        return history;
    PropertyValue bounded = PropertyValue::newArray();
    for (const PropertyValue& entry : *entries) {
        const Bytes* bytes = entry[kDisplayStateKey].asData();
        if (!bytes || bytes->empty() || total <= limit) {
            bounded.asArray()->append(entry);
            continue;
        }
        const std::size_t dropped = lengthOfFirstMessages(*bytes, total - limit);
        total -= dropped;
        PropertyValue shorter = shallowCopy(entry);
        shorter.asDictionary()->set(
            kDisplayStateKey,
            PropertyValue::data(
                Bytes(bytes->begin() + static_cast<std::ptrdiff_t>(dropped), bytes->end())));
        bounded.asArray()->append(incompleteEntry(shorter));
    }
    return bounded;
}

} // namespace orvane
