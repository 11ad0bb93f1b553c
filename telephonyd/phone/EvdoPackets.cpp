#include "telephonyd/phone/EvdoPackets.h"

#include "telephonyd/phone/ModemItem.h"

namespace orvane
{

namespace
{

constexpr std::uint16_t kNoPilot = 0xFFFF;

// A strength as a ratio, of which 512 is 0 dB.
std::uint32_t linear(double decibels)
{
    return rawValue(std::pow(10, decibels / 10), 0, 1.0 / 512, 16);
}

std::uint32_t wholeLevel(double level) { return signedRawValue(level, 0, 1, 8); }

} // namespace

PhoneMessage evdoFingers(std::span<const std::optional<CDMAPilot>> fingers)
{
    PacketWriter writer;
    writer.put8(1).skip(8).put8(static_cast<std::uint32_t>(fingers.size()));
    for (const auto& finger : fingers)
        writer.put16(finger ? finger->pilotOffset : kNoPilot)
            .skip(4)
            .put16(finger ? linear(finger->strength) : 0)
            .skip(6);
    return modemItem(kEvdoFingersCode, writer);
}

PhoneMessage evdoSummary(const CDMAPhone& phone, const CDMARadio& radio,
                         std::optional<std::uint16_t> servingPilot)
{
    PacketWriter writer;
    writer.bits(radio.channel, 11)
        .bits(radio.band, 5)
        .put8(wholeLevel(radio.received))
        .put8(wholeLevel(radio.receivedBySecond))
        .put8(wholeLevel(radio.sent))
        .put16(servingPilot.value_or(kNoPilot))
        .skip(16)
        .put8(static_cast<std::uint8_t>(phone.evdo()))
        .put8(static_cast<std::uint8_t>(phone.session()))
        .bits(phone.terminalId(), 24)
        .put8(phone.colourCode())
        .skip(8);
    return modemItem(kEvdoSummaryCode, writer);
}

PhoneMessage evdoActiveSet(std::span<const CDMAPilot> pilots)
{
    PacketWriter writer;
    writer.put8(1).skip(1).put8(static_cast<std::uint32_t>(pilots.size())).skip(9);
    for (const CDMAPilot& pilot : pilots)
        writer.put16(pilot.pilotOffset).put16(linear(pilot.strength)).skip(8);
    return modemItem(kEvdoActiveSetCode, writer);
}

PhoneMessage evdoForwardTraffic(std::uint32_t seconds, const EvdoForwardTraffic& traffic)
{
    PacketWriter writer;
    writer.put32(seconds);
    for (const std::uint32_t counter : traffic.counters())
        writer.put32(counter);
    return modemItem(kEvdoForwardTrafficCode, writer);
}

PhoneMessage evdoReverseTraffic(std::uint32_t seconds, const EvdoReverseTraffic& traffic)
{
    constexpr std::size_t kOtherCounters = 8; // two of four bytes, which this phone leaves at 0
    using Traffic = EvdoReverseTraffic;
    PacketWriter writer;
    writer.put8(1).put32(seconds);
    for (std::size_t interlace = 0; interlace < Traffic::kInterlaces; ++interlace)
        for (std::size_t mode = 0; mode < Traffic::kModes; ++mode)
            for (std::size_t size = 0; size < Traffic::kSizes; ++size) {
                for (const std::uint32_t counter : traffic.counters(interlace, mode, size))
                    writer.put32(counter);
                writer.skip(kOtherCounters);
            }
    writer.skip(4);
    return modemItem(kEvdoReverseTrafficCode, writer);
}

} // namespace orvane
