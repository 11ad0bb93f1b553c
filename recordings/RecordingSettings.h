#pragma once

#include <chrono>
#include <optional>
#include <string>

namespace orvane
{

// What a recording is opened with.
struct RecordingSettings {
    std::string name;                      // what the person calls the file: for messages
    std::optional<std::string> technology; // the constant; nullopt: found by the log's codes
    std::chrono::nanoseconds refreshPeriod = std::chrono::seconds(2); // more than 0
};

} // namespace orvane
