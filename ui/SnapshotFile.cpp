#include "ui/SnapshotFile.h"

#include "platform/PropertyList.h"
#include "platform/Services.h"

#include <cstdint>

namespace orvane
{

namespace
{

bool write(const std::string& path, const PropertyValue& snapshot)
{
    const std::optional<std::string> xml = writeXmlPropertyList(snapshot);
    return xml &&
           writeFile(path, {reinterpret_cast<const std::uint8_t*>(xml->data()), xml->size()});
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
    // The time of saving, not `timeStamp`: they differ by as long as the screen was open. This is
    // meant.
    const auto now = static_cast<long>(Services::current().clock().secondsSince1970());
    const std::string path = files.located(std::string(kLogFolder) + "/OrvaneSnapshot-" +
                                           std::to_string(now) + ".orvane");
    const bool isWritten = write(path, snapshot);
    if (!isWritten)
        logError("Unable to write snapshot to %s", path.c_str());
    return {isWritten, path};
}

} // namespace orvane
