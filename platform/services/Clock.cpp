#include "platform/services/Clock.h"

#include "platform/base/Calendar.h"

#include <chrono>
#include <ctime>

namespace orvane
{

double RealClock::secondsSince1970() const
{
    using namespace std::chrono;
    return duration<double>(system_clock::now().time_since_epoch()).count();
}

TimeZone RealClock::timeZoneAt(double secondsSince1970) const
{
    const auto time = static_cast<std::time_t>(wholeSeconds(secondsSince1970));
    std::tm local{};
    if (localtime_r(&time, &local) == nullptr)
        return {};
    return {static_cast<int>(local.tm_gmtoff), local.tm_isdst > 0};
}

} // namespace orvane
