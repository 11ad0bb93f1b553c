#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/C2K/C2KFormats.h"
#include "LogGenerator/C2K/Subpackets.h"
#include "LogGenerator/C2K/TrafficErrors.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <cmath>

// The 1x status packet: device state, radio, active set.

namespace orvane
{

namespace
{

enum Subpacket : std::uint8_t { kSystemState = 1, kRadio = 2, kActiveSet = 3, kFingers = 4 };

constexpr std::uint64_t kTrafficState = 8;
constexpr double kWeakest = 0.00001;

// "%+.2f dBm".
constexpr Format kReceivedPower =
    fixedFormat({.factor = 334, .divisor = 1000, .offset = -63.248}, 2, " dBm").withPlus();
constexpr Format kTransmittedPower = fixedFormat({.divisor = 10}, 2, " dBm").withPlus();

// "%+.2f dB".
constexpr Format kPilotFormat = realFormat(2, " dB").withPlus();
constexpr Format kReferenceFormat = kPilotFormat.withPrefix("(ref pilot) ");
constexpr RowDescription kPilotLevel = {"", &kPilotFormat};
constexpr RowDescription kReferenceLevel = {"", &kReferenceFormat};

constexpr Field kStateFields[] = {
    bytesField("k1xDeviceState", 4, 1, oneXDeviceState),
};

constexpr Field kRadioFields[] = {
    bytesField("k1xRx0BandClass", 4, 1, bandClass),
    bytesField("k1xRx0ChanNum", 6, 2, decimal),
    bytesField("k1xRxAGC0", 10, 1, kReceivedPower, Coding::Signed),
};

// Shown in traffic only.
constexpr Field kTrafficFields[] = {
    bytesField("k1xRx1BandClass", 5, 1, bandClass),
    bytesField("k1xRx1ChanNum", 8, 2, decimal),
    bytesField("k1xRxAGC1", 11, 1, kReceivedPower, Coding::Signed),
    bytesField("k1xTxAGC", 12, 2, kTransmittedPower, Coding::Signed),
};

constexpr Format kOldErrorsFormat = realFormat(2, "% (old)").withUnit("%");
constexpr RowDescription kOldTrafficErrors = {"k1xTrafficFER", &kOldErrorsFormat};

// Once after traffic, the last error rate shows as old.
void publishOldErrors(PropertyDictionary& state, const C2KPublisher& publisher)
{
    const std::optional<float> rate = trafficErrors(state);
    if (!rate)
        return;
    publisher.publishReading(kOldTrafficErrors, bitsOfValue(percentOf(*rate)));
    state.remove(kTrafficErrorsKey);
}

// The header of the active set: what scales the energies of its pilots.
struct Scale {
    double shift;    // k
    double divisor;  // a
    double chips;    // N
    std::size_t pad; // m

    // Zero divisors and the like come out as floating-point arithmetic gives them.
    [[nodiscard]] double strength(std::uint64_t energy) const
    {
        const double value =
            std::exp2(2 * shift - 3) * static_cast<double>(energy) / (9 * divisor * chips * chips) -
            1 / chips;
        return value < kWeakest ? kWeakest : value;
    }
};

// Nothing where any byte to be read is missing.
std::optional<PropertyValue> pilotsOf(PacketView activeSet)
{
    const auto chips = activeSet.unsignedAt(4, 2);
    const auto divisor = activeSet.unsignedAt(6, 1);
    const auto shift = activeSet.unsignedAt(7, 1);
    const auto count = activeSet.unsignedAt(8, 1);
    const auto pad = activeSet.unsignedAt(9, 1);
    const auto reference = activeSet.unsignedAt(10, 2);
    if (!chips || !divisor || !shift || !count || !pad || !reference)
        return std::nullopt;
    const Scale scale{static_cast<double>(*shift), static_cast<double>(*divisor),
                      static_cast<double>(*chips), static_cast<std::size_t>(*pad)};
    const std::size_t stride = (6 * scale.pad + 12 + 3) / 4 * 4;

    PropertyValue pilots = newSortedRows();
    for (std::size_t i = 0; i < *count; ++i) {
        const PacketView pilot = activeSet.from(i * stride);
        const auto offset = pilot.unsignedAt(12, 2);
        const auto energy = pilot.unsignedAt(24 + 4 * scale.pad, 2);
        if (!offset || !energy)
            return std::nullopt;
        const std::int64_t level = bitsOfValue(10 * std::log10(scale.strength(*energy)));
        const RowDescription& description = offset == reference ? kReferenceLevel : kPilotLevel;
        pilots.asDictionary()->set(printed("%d;%d", static_cast<int>(i), static_cast<int>(*offset)),
                                   PropertyValue::reading(readingOf(description, level)));
    }
    return pilots;
}

} // namespace

void decodeOneXStatus(PacketView packet, PropertyDictionary& state, const C2KPublisher& publisher)
{
    if (packet.size() < kFirstSubpacket) {
        logError("Log code 0x119c is %u bytes long but must be at least %lu bytes.",
                 static_cast<unsigned>(packet.size()), static_cast<unsigned long>(kFirstSubpacket));
        return;
    }
    const auto system = findSubpacket(packet, kSystemState);
    const auto radio = findSubpacket(packet, kRadio);
    const auto activeSet = findSubpacket(packet, kActiveSet);
    const auto fingers = findSubpacket(packet, kFingers);
    if (!system || !radio || !activeSet || !fingers) {
        logWarning("Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).", system ? 1 : 0,
                   radio ? 1 : 0, activeSet ? 1 : 0, fingers ? 1 : 0);
        return;
    }
    publisher.publish(*system, kStateFields);
    publisher.publish(*radio, kRadioFields);
    // Where the packet ends before the device state, what depends on it is left as it was.
    if (const auto deviceState = system->unsignedAt(4, 1)) {
        if (*deviceState == kTrafficState) {
            publisher.publish(*radio, kTrafficFields);
        } else {
            publisher.publishText("N/A", kTrafficFields);
            publishOldErrors(state, publisher);
        }
    }
    if (const auto pilots = pilotsOf(*activeSet))
        publisher.publish("k1xActiveSetInfo", *pilots);
}

} // namespace orvane
