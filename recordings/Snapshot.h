#pragma once

#include "dlf/ByteSource.h"
#include "platform/base/PropertyValue.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

// A saved snapshot: the kept displays and messages of a live view, and the user's description. What
// is missing in the file, or of the wrong type, is empty here.
struct Snapshot {
    // One of the things that were saved: a display as it was, or the log.
    struct Entry {
        std::string description;
        std::string date;                          // as written: "2026-11-21 10:00:00 +0000"
        std::optional<std::int64_t> secondsOfDate; // since 1970, where the date can be read
        PropertyValue display;                     // absent where the entry has none
        std::shared_ptr<ByteSource> log;           // a diagnostic log; null where it has none

        // "2026-11-21T10:00:00.000Z"; nullopt if the date cannot be read.
        [[nodiscard]] std::optional<std::string> isoDate() const;
    };

    std::string timestamp;
    std::string description;
    std::vector<Entry> entries;
};

// nullopt unless the value is a dictionary with a snapshot key.
std::optional<Snapshot> snapshotFrom(const PropertyValue& value);

} // namespace orvane
