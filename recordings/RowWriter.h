#pragma once

#include "recordings/RowTable.h"

#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// Writes the rows of a recording in some form, period by period.
class RowWriter
{
public:
    // Takes one or more whole lines. False if nobody reads on.
    using Output = std::function<bool(std::string_view lines)>;

    virtual ~RowWriter() = default;
    // The table has taken a period; `time` is the recording's, "2026-11-21T10:00:00.000Z", empty
    // where it is not known. False where nobody reads on.
    virtual bool takePeriod(const std::string& time, const RowTable& table) = 0;
    // The last period has been taken.
    virtual void finish(const RowTable&) {}
    // One line for the user if something other than the output failed.
    [[nodiscard]] virtual std::optional<std::string> problem() const { return std::nullopt; }
};

} // namespace orvane
