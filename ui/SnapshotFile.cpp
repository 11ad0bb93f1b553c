#include "ui/SnapshotFile.h"

#include "platform/base/Calendar.h"
#include "platform/base/Utf8.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/Services.h"

#include <cerrno>
#include <cstdint>
#include <system_error>

namespace orvane
{

namespace
{

// Far below what a property list may be nested, the snapshot's own levels included.
constexpr std::size_t kDeepest = 500;

bool isStorable(const PropertyValue& value) { return writeXmlPropertyList(value).has_value(); }

// The value with what XML cannot hold put into words that it can: control characters and broken
// UTF-8 of texts, dates of no year, trees without a bottom.
PropertyValue storable(const PropertyValue& value, std::size_t depth = 0)
{
    if (depth >= kDeepest)
        return "(" + std::string(value.typeName()) + ")";
    if (const PropertyDictionary* dictionary = value.asDictionary()) {
        PropertyValue copy = PropertyValue::newDictionary();
        for (const auto& [key, entry] : *dictionary)
            copy.asDictionary()->set(isStorable(key) ? key : shownText(key),
                                     storable(entry, depth + 1));
        return copy;
    }
    if (const PropertyArray* array = value.asArray()) {
        PropertyValue copy = PropertyValue::newArray();
        for (const PropertyValue& element : *array)
            copy.asArray()->append(storable(element, depth + 1));
        return copy;
    }
    return isStorable(value) ? value : PropertyValue(shownText(value.description()));
}

// Unchanged wherever that can be: a text that the network sent must not keep the rest from being
// saved.
std::optional<Bytes> xmlOf(const PropertyValue& snapshot)
{
    const std::optional<Bytes> xml = xmlPropertyListBytes(snapshot);
    return xml ? xml : xmlPropertyListBytes(storable(snapshot));
}

// Returns why it cannot.
std::error_code write(const std::string& path, const PropertyValue& snapshot)
{
    const std::optional<Bytes> xml = xmlOf(snapshot);
    if (!xml)
        return std::make_error_code(std::errc::value_too_large);
    // Deliberate: directly, not through a temporary file.
    if (!writeFile(path, *xml))
        return {errno, std::generic_category()};
    return {};
}

} // namespace

SnapshotResult writeSnapshotFile(const FileSystem& files, const PropertyValue& saveHistory,
                                 double timeStamp, const std::string& description)
{
    const PropertyValue snapshot = PropertyValue::dictionaryOf({
        {"Timestamp",   absoluteDateText(timeStamp)},
        {"Data",        saveHistory                },
        {"Description", description                }
    });
    // Deliberate: the time of saving, not `timeStamp`. They differ by as long as the screen was
    // open.
    const auto now = wholeSeconds(Services::current().clock().secondsSince1970());
    const std::string path = files.located(std::string(kLogFolder) + "/OrvaneSnapshot-" +
                                           std::to_string(now) + ".orvane");
    std::error_code problem = files.makeOwnFolder(kLogFolder);
    if (!problem)
        problem = write(path, snapshot);
    if (problem) {
        logError("Unable to write snapshot to %s", path.c_str());
        logError("The snapshot was not saved: %s", problem.message().c_str());
    }
    return {!problem, path};
}

} // namespace orvane
