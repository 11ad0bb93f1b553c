#include "recordings/TimesAhead.h"

#include "dlf/DlfTime.h"
#include "recordings/LogSlice.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::size_t kTimestamps = 3;
constexpr int kItems = 16;

} // namespace

TimesAhead::TimesAhead(DlfReader reader)
{
    for (int i = 0; i < kItems && _timestamps.size() < kTimestamps; ++i) {
        const auto item = reader.next(LogSlice::kBytes);
        if (!item)
            return;
        if (item->timestamp != 0)
            _timestamps.push_back(item->timestamp);
    }
}

bool TimesAhead::allowStart(std::uint64_t timestamp) const
{
    const auto isSameDay = [](std::uint64_t one, std::uint64_t other) {
        return areTimestampsWithin(kDlfStepsPerDay, one, other);
    };
    const bool isBorneOut =
        std::any_of(_timestamps.begin(), _timestamps.end(),
                    [&](std::uint64_t each) { return isSameDay(timestamp, each); });
    const bool theyAgree =
        std::adjacent_find(_timestamps.begin(), _timestamps.end(), isSameDay) != _timestamps.end();
    return isBorneOut || !theyAgree;
}

bool TimesAhead::allowLeap(std::uint64_t timestamp, const LogClock& clock, LogTime reached) const
{
    // The last item has no other to agree with.
    if (_timestamps.empty())
        return timestamp < kFirstFutureTimestamp;
    const auto back =
        std::count_if(_timestamps.begin(), _timestamps.end(), [&](std::uint64_t each) {
            return clock.timeOf(each) <= reached + kLongestStep;
        });
    return 2 * static_cast<std::size_t>(back) < _timestamps.size();
}

} // namespace orvane
