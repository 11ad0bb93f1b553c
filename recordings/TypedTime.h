#pragma once

#include "recordings/LogTime.h"

#include <optional>
#include <string>

namespace orvane
{

// The time of a recording that a person typed: "+90" seconds since its start, or "10:04:30" (or
// "10:04") of its clock, on the day of `position` or else on a day on which the recording was going
// on. What lies outside of the recording is its nearer end. Nothing where the text is neither.
std::optional<LogTime> typedTime(const std::string& text, const LogClock& clock, LogTime position,
                                 LogTime duration);

} // namespace orvane
