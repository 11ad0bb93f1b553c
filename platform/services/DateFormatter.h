#pragma once

#include "platform/services/Clock.h"

#include <string>
#include <utility>

namespace orvane
{

// Formats a time: yyyy, MM, dd, HH, mm and ss stand for year, month, day, hour, minute and second.
// Everything else, and every text between apostrophes, is copied. Uses the clock's local zone and
// drops fractions of a second.
class DateFormatter
{
public:
    explicit DateFormatter(std::string format) : _format(std::move(format)) {}

    [[nodiscard]] std::string stringFromDate(double secondsSince1970, const Clock& clock) const;

private:
    std::string _format;
};

} // namespace orvane
