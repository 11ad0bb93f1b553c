#include "LogGenerator/C2K/TrafficErrors.h"

#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/C2K/Subpackets.h"
#include "LogGenerator/Formats.h"
#include "platform/services/SystemLog.h"

// The 1x traffic frame errors packet.

namespace orvane
{

namespace
{

constexpr std::uint8_t kTrafficDemodulation = 11;

constexpr Format kErrorsFormat = realFormat(2, "%");
constexpr RowDescription kTrafficErrors = {"k1xTrafficFER", &kErrorsFormat};

// A frame counts for 1/64 of the average. Every product and the sum are rounded to single
// precision.
float movingAverage(bool isError, std::optional<float> before)
{
    const float fresh = (isError ? 1.0F : 0.0F) * 0.015625F;
    const float old = before ? 0.984375F * *before : 0.0F;
    return fresh + old;
}

} // namespace

std::optional<float> trafficErrors(const PropertyDictionary& state)
{
    const PropertyValue& value = state[kTrafficErrorsKey];
    if (const auto real = value.asReal())
        return static_cast<float>(*real);
    if (const auto integer = value.asInteger())
        return static_cast<float>(*integer);
    return std::nullopt;
}

double percentOf(float rate)
{
    const float percent = rate * 100.0F;
    return static_cast<double>(percent);
}

void decodeTrafficErrors(PacketView packet, PropertyDictionary& state,
                         const C2KPublisher& publisher)
{
    if (packet.size() < kFirstSubpacket) {
        logError("Log code 0x119d is %d bytes long but must be at least %ld bytes.",
                 static_cast<int>(packet.size()), static_cast<long>(kFirstSubpacket));
        return;
    }
    const auto demodulation = findSubpacket(packet, kTrafficDemodulation);
    if (!demodulation) {
        logWarning("Log code 0x119d: missing traffic demod subpacket.");
        return;
    }
    const auto flag = demodulation->unsignedAt(24, 1);
    if (!flag)
        return;
    const float rate = movingAverage(*flag != 0, trafficErrors(state));
    state.set(kTrafficErrorsKey, PropertyValue::real(static_cast<double>(rate)));
    publisher.publishReading(kTrafficErrors, bitsOfValue(percentOf(rate)));
}

} // namespace orvane
