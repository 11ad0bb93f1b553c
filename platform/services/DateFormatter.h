#pragma once

#include "platform/services/Clock.h"

#include <string>
#include <utility>

namespace orvane
{

// Puts a time into words by a format: yyyy, MM, dd, HH, mm and ss are year, month, day, hour,
// minute and second, what stands between apostrophes and everything else is itself. In the clock's
// local zone; fractions of a second are dropped.
class DateFormatter
{
public:
    explicit DateFormatter(std::string format) : _format(std::move(format)) {}

    [[nodiscard]] std::string stringFromDate(double secondsSince1970, const Clock& clock) const;

private:
    std::string _format;
};

} // namespace orvane
