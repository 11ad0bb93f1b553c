#include "telephonyd/phone/OneXPackets.h"

#include "platform/base/Bytes.h"
#include "telephonyd/phone/ModemItem.h"

namespace orvane
{

namespace
{

// The steps of the receivers' gain.
std::uint32_t receiverGain(double level) { return signedRawValue(level, -63.248, 0.334, 8); }

// Subpackets: identifier, version, size with this header.
enum SubpacketId : std::uint8_t {
    kSystemState = 1,
    kRadio = 2,
    kActiveSet = 3,
    kFingers = 4,
    kTrafficFrame = 11,
};
constexpr std::size_t kSubpacketHeaderBytes = 4;

void appendSubpacket(PacketWriter& writer, SubpacketId id, PacketWriter body)
{
    const Bytes bytes = body.take();
    writer.put8(id)
        .put8(1)
        .put16(static_cast<std::uint32_t>(kSubpacketHeaderBytes + bytes.size()))
        .append(bytes);
}

PacketWriter systemStateBody(OneXState state)
{
    PacketWriter body;
    body.put8(static_cast<std::uint8_t>(state)).skip(3);
    return body;
}

PacketWriter radioBody(const CDMARadio& radio)
{
    PacketWriter body;
    body.put8(radio.band)
        .put8(radio.band)
        .put16(radio.channel)
        .put16(radio.channel)
        .put8(receiverGain(radio.received))
        .put8(receiverGain(radio.receivedBySecond))
        .put16(signedRawValue(radio.sent, 0, 0.1, 16));
    return body;
}

// Energies are those of the searcher. They scale with the time over which it adds up, and include
// the noise.
PacketWriter activeSetBody(std::span<const CDMAPilot> pilots, std::uint16_t referencePilot)
{
    constexpr std::uint32_t kChips = 64;
    constexpr std::uint32_t kSums = 2;
    constexpr std::uint32_t kShift = 4;
    constexpr std::size_t kFingersAPilot = 3;
    constexpr std::size_t kBeforeEnergy = 4 * kFingersAPilot + 12;
    constexpr std::size_t kRecordBytes = (6 * kFingersAPilot + 12 + 3) / 4 * 4;
    constexpr double kScale = 9.0 * kSums * kChips * kChips / (1U << (2 * kShift - 3));
    PacketWriter body;
    body.put16(kChips)
        .put8(kSums)
        .put8(kShift)
        .put8(static_cast<std::uint32_t>(pilots.size()))
        .put8(kFingersAPilot)
        .put16(referencePilot);
    for (const CDMAPilot& pilot : pilots) {
        const double share = std::pow(10, pilot.strength / 10) + 1.0 / kChips;
        body.put16(pilot.pilotOffset)
            .skip(kBeforeEnergy - 2)
            .put16(rawValue(share * kScale, 0, 1, 16))
            .skip(kRecordBytes - kBeforeEnergy - 2);
    }
    return body;
}

PacketWriter fingersBody()
{
    PacketWriter body;
    body.skip(8);
    return body;
}

} // namespace

PhoneMessage oneXStatus(OneXState state, const CDMARadio& radio, std::span<const CDMAPilot> pilots,
                        std::uint16_t referencePilot)
{
    PacketWriter writer;
    writer.put8(1).put8(4).skip(2);
    appendSubpacket(writer, kSystemState, systemStateBody(state));
    appendSubpacket(writer, kRadio, radioBody(radio));
    appendSubpacket(writer, kActiveSet, activeSetBody(pilots, referencePilot));
    appendSubpacket(writer, kFingers, fingersBody());
    return modemItem(kOneXStatusCode, writer);
}

PhoneMessage oneXFrame(bool isDamaged)
{
    PacketWriter body;
    body.skip(20).put8(isDamaged ? 1 : 0).skip(3);
    PacketWriter writer;
    writer.put8(1).put8(1).skip(2);
    appendSubpacket(writer, kTrafficFrame, std::move(body));
    return modemItem(kOneXFrameCode, writer);
}

PhoneMessage oneXSystem(const CDMACell& cell)
{
    constexpr std::uint32_t kVersion = 2;
    constexpr std::uint32_t kCdmaSystem = 2;
    constexpr std::uint32_t kProtocolRevision = 6;
    PacketWriter writer;
    writer.put8(kVersion)
        .skip(28)
        .put32(cell.area.roamingIndicator)
        .put32(kCdmaSystem)
        .put16(cell.area.systemId)
        .put16(cell.area.networkId)
        .skip(77)
        .put8(cell.area.packetZone)
        .skip(1)
        .put8(kProtocolRevision)
        .skip(50)
        .put16(cell.baseId)
        .skip(14);
    return modemItem(kOneXSystemCode, writer);
}

} // namespace orvane
