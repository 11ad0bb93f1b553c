#include "platform/services/DateFormatter.h"

#include "platform/base/Calendar.h"

#include <cstdio>
#include <string_view>

namespace orvane
{

namespace
{

struct Field {
    std::string_view letters;
    std::int64_t value;
};

void appendPadded(std::string& to, std::int64_t value, std::size_t width)
{
    char digits[24];
    std::snprintf(digits, sizeof digits, "%0*lld", static_cast<int>(width),
                  static_cast<long long>(value));
    to += digits;
}

} // namespace

std::string DateFormatter::stringFromDate(double secondsSince1970, const Clock& clock) const
{
    const CalendarTime time = calendarTime(wholeSeconds(secondsSince1970),
                                           clock.timeZoneAt(secondsSince1970).secondsFromGmt);
    const Field fields[] = {
        {"yyyy", time.year  },
        {"MM",   time.month },
        {"dd",   time.day   },
        {"HH",   time.hour  },
        {"mm",   time.minute},
        {"ss",   time.second},
    };
    std::string text;
    bool isQuoted = false;
    for (std::string_view rest = _format; !rest.empty();) {
        std::size_t taken = 1;
        if (rest.front() == '\'') {
            isQuoted = !isQuoted;
        } else {
            const Field* field = nullptr;
            for (const Field& candidate : fields)
                if (!isQuoted && rest.starts_with(candidate.letters))
                    field = &candidate;
            if (field) {
                appendPadded(text, field->value, field->letters.size());
                taken = field->letters.size();
            } else {
                text += rest.front();
            }
        }
        rest.remove_prefix(taken);
    }
    return text;
}

} // namespace orvane
