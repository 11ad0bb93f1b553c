#pragma once

#include "dlf/ByteSource.h"
#include "recordings/Snapshot.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A file with a recording, recognised by its content.
struct OpenedRecording {
    // The one or the other, unless there is an error: a diagnostic log (or what may be one), read
    // as it is needed, or a snapshot, read whole.
    std::shared_ptr<ByteSource> log;
    std::optional<Snapshot> snapshot;

    // One line that says what is wrong and what to do.
    std::optional<std::string> error;
};

OpenedRecording openRecording(const std::string& path);

} // namespace orvane
