#include "telephonyd/phone/UTRANPackets.h"

#include "telephonyd/phone/ModemItem.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kVersion = 1;

std::uint32_t count(std::size_t records) { return static_cast<std::uint32_t>(records); }

} // namespace

PhoneMessage utranRadioState(RadioState state)
{
    PacketWriter writer;
    writer
        .put8(1) // the state is valid
        .put8(static_cast<std::uint32_t>(state));
    return modemItem(kUTRANRadioStateCode, writer);
}

PhoneMessage utranServingCell(const UTRANCell& cell, bool emergencyCallsOnly)
{
    PacketWriter writer;
    writer.put8(kVersion)
        .put8(cell.restrictedClasses)
        .put8(cell.registrationArea)
        .skip(1)
        .put16(cell.channel) // up
        .put16(cell.channel) // down
        .put32(cell.cellIdentity)
        .put8(emergencyCallsOnly ? 1 : 0);
    return modemItem(kUTRANServingCellCode, writer);
}

PhoneMessage utranNeighbours(std::span<const UTRANNeighbour> cells)
{
    constexpr std::size_t kBetweenCountAndRecords = 151;
    constexpr std::size_t kRestOfRecord = 12;
    PacketWriter writer;
    writer.put8(kVersion).skip(2).bits(0, 1).bits(count(cells.size()), 7);
    writer.skip(kBetweenCountAndRecords);
    for (const UTRANNeighbour& cell : cells)
        writer.bits(cell.channel, 14)
            .bits(cell.cellParameter, 7)
            .bits(rawValue(cell.power, -120, 0.25, 8), 8)
            .bits(static_cast<std::uint32_t>(cell.set), 2)
            .bits(cell.isDetectedJointly ? 1 : 0, 1)
            .skip(kRestOfRecord);
    return modemItem(kUTRANNeighboursCode, writer);
}

PhoneMessage utranGSMNeighbours(std::span<const UTRANGSMNeighbour> cells)
{
    PacketWriter writer;
    writer.put8(kVersion).skip(2).put8(count(cells.size()));
    for (const UTRANGSMNeighbour& cell : cells)
        writer.bits(cell.cellIdentity, 14)
            .bits(cell.channel >= 512 ? 1 : 0, 1) // the band above 1 GHz
            .bits(1, 1)                           // the colours are valid
            .put8(cell.colours / 8U)              // network
            .put8(cell.colours % 8U)              // base station
            .put16(cell.channel)
            .put16(static_cast<std::uint16_t>(static_cast<int>(cell.power)));
    return modemItem(kUTRANGSMNeighboursCode, writer);
}

PhoneMessage utranChannelQuality(std::span<const TransportChannel> transport,
                                 std::span<const CodedChannel> coded)
{
    // The coded channels stand where 17 blocks of the transport channels' size would end.
    const std::size_t gap = 16 * (17 + 2 * transport.size());
    PacketWriter writer;
    writer.put8(kVersion)
        .bits(0, 6)
        .bits(count(transport.size()), 6)
        .bits(count(coded.size()), 4)
        .skip(1);
    for (const TransportChannel& channel : transport)
        writer.put8(channel.number).put8(rawValue(channel.percentDamaged, 0, 1, 8));
    writer.skip(gap);
    for (const CodedChannel& channel : coded) {
        writer.put8(channel.number).put8(channel.timeSlot);
        for (const double ratio : channel.signalsToInterference)
            writer.put8(rawValue(ratio, 0, 1, 8));
    }
    return modemItem(kUTRANChannelQualityCode, writer);
}

} // namespace orvane
