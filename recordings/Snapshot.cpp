#include "recordings/Snapshot.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/TextReadings.h"
#include "platform/base/Calendar.h"

#include <cstdio>

namespace orvane
{

namespace
{

constexpr const char* kTimestampKey = "Timestamp";
constexpr const char* kDataKey = "Data";
constexpr const char* kLogKey = "DLF";

std::string textOf(const PropertyValue& value) { return value ? value.description() : ""; }

std::optional<std::int64_t> secondsOf(const std::string& date)
{
    CalendarTime time;
    int year = 0;
    int end = 0;
    const int fields =
        std::sscanf(date.c_str(), "%4d-%2d-%2d %2d:%2d:%2d +0000%n", &year, &time.month, &time.day,
                    &time.hour, &time.minute, &time.second, &end);
    time.year = year;
    if (fields != 6 || static_cast<std::size_t>(end) != date.size())
        return std::nullopt;
    const std::int64_t seconds = secondsSince1970(time);
    // An impossible date, such as February 30, comes back as another one.
    if (absoluteDateText(static_cast<double>(seconds)) != date)
        return std::nullopt;
    return seconds;
}

// The bytes live as long as the source.
std::shared_ptr<ByteSource> logIn(const PropertyValue& data)
{
    struct Log {
        explicit Log(const PropertyValue& value) : data(value), source(*data.asData()) {}
        PropertyValue data;
        MemorySource source;
    };
    if (!data.asData())
        return nullptr;
    const auto log = std::make_shared<Log>(data);
    return {log, &log->source};
}

Snapshot::Entry entryOf(const PropertyValue& value)
{
    Snapshot::Entry entry;
    entry.description = textOf(value[kDescriptionKey]);
    entry.date = textOf(value[kDateKey]);
    entry.secondsOfDate = secondsOf(entry.date);
    entry.display = withTextReadings(value[kDisplayKey]);
    entry.log = logIn(value[kLogKey]);
    return entry;
}

} // namespace

std::optional<std::string> Snapshot::Entry::isoDate() const
{
    // "2026-11-21 10:00:00 +0000", or it would have no seconds.
    if (!secondsOfDate)
        return std::nullopt;
    std::string text = date.substr(0, date.rfind(' '));
    text[text.find(' ')] = 'T';
    return text + ".000Z";
}

std::optional<Snapshot> snapshotFrom(const PropertyValue& value)
{
    const PropertyArray* data = value[kDataKey].asArray();
    if (!data && !value[kTimestampKey] && !value[kDescriptionKey])
        return std::nullopt;
    Snapshot snapshot;
    snapshot.timestamp = textOf(value[kTimestampKey]);
    snapshot.description = textOf(value[kDescriptionKey]);
    if (data)
        for (const PropertyValue& entry : *data)
            snapshot.entries.push_back(entryOf(entry));
    return snapshot;
}

} // namespace orvane
