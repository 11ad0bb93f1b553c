#include "telephonyd/phone/GSMPackets.h"

#include "telephonyd/phone/ModemItem.h"

#include <array>
#include <cmath>

namespace orvane
{

namespace
{

constexpr std::array kHopsTo = {2, 6, 11, 17}; // counted from the cell's own channel
constexpr double kLeastPower = -106;           // at which a cell may be used, dBm

std::uint32_t count(std::size_t records) { return static_cast<std::uint32_t>(records); }

// Powers are reported without their sign.
std::uint32_t magnitude(double power) { return rawValue(-power, 0, 1, 8); }

// The power above the least one at which a cell may be used. Negative values wrap.
std::uint32_t pathLossCriterion(double power)
{
    return static_cast<std::uint32_t>(std::lround(power - kLeastPower));
}

std::uint32_t hopChannel(const UMTSTownCell& cell, std::size_t index)
{
    return static_cast<std::uint32_t>(cell.channel + kHopsTo.at(index));
}

PhoneMessage broadcastPosition()
{
    PacketWriter writer;
    writer.skip(1).put8(0); // on the ordinary broadcast channel
    return modemItem(kGPRSPositionCode, writer);
}

PhoneMessage networkControl(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer
        .put8(cell.routingArea == 2 ? 1 : 0) // packet flow contexts
        .put8(cell.code % 2 ? 7 : 6)         // from which priority on access is allowed
        .put8(cell.code % 3 ? 0 : 1)         // network control order
        .skip(2);
    return modemItem(kGPRSNetworkControlCode, writer);
}

PhoneMessage cellOptions(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.skip(2)
        .put8(cell.code % 4U) // T3192
        .put8(1 + cell.code % 3U)
        .put8(1) // access bursts of 11 bits
        .skip(6);
    return modemItem(kGPRSCellOptionsCode, writer);
}

PhoneMessage packetBroadcast()
{
    PacketWriter writer;
    writer.put8(0).skip(20); // none of its own
    return modemItem(kGPRSBroadcastCode, writer);
}

PhoneMessage measurementOrder(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.put8(0)
        .put8(1 + cell.code % 2U) // counts of the packet system information
        .put8(2 + cell.code % 4U)
        .put8(cell.code % 3 ? 0 : 1) // extended measurement
        .skip(16)
        .put8(1) // packet SI status is supported
        .skip(1);
    return modemItem(kGPRSMeasurementOrderCode, writer);
}

} // namespace

PhoneMessage gsmServingCell(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.put16(cell.channel).put16(cell.code).put16(cell.cellIdentity).skip(7);
    return modemItem(kGSMServingCellCode, writer);
}

PhoneMessage gsmMeasurement(const GSMLevel& serving, std::span<const GSMLevel> neighbours)
{
    constexpr std::uint32_t kReselectOffset = 4; // dB
    const std::uint32_t criterion = pathLossCriterion(serving.power);
    PacketWriter writer;
    writer.skip(2)
        .put8(magnitude(serving.power))
        .put32(criterion)
        .put32(criterion + kReselectOffset)
        .skip(2)
        .put8(serving.cell.routingArea == 2 ? 1 : 0) // hysteresis is applied
        .skip(1)
        .put8(count(neighbours.size()));
    for (const GSMLevel& each : neighbours)
        writer.put16(each.cell.channel)
            .put8(magnitude(each.power))
            .put32(pathLossCriterion(each.power))
            .skip(7);
    return modemItem(kGSMMeasurementCode, writer);
}

PhoneMessage gsmColours(std::span<const GSMLevel> neighbours)
{
    PacketWriter writer;
    writer.skip(1).put8(count(neighbours.size()));
    for (const GSMLevel& each : neighbours)
        writer.put16(each.cell.channel).put8(each.cell.code).skip(1);
    return modemItem(kGSMColoursCode, writer);
}

PhoneMessage gsmRadioState(GSMRadioState state, bool isData)
{
    PacketWriter writer;
    writer.put8(static_cast<std::uint32_t>(state))
        .put8(state == GSMRadioState::DataTransfer ? 2 : 0)
        .put8(state == GSMRadioState::Inactive ? 0 : 1)
        .put8(isData ? 1 : 0);
    return modemItem(kGSMRadioStateCode, writer);
}

PhoneMessage gsmMobileAllocation(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.put8(cell.code).put8(count(kHopsTo.size()));
    for (std::size_t i = 0; i < kHopsTo.size(); ++i)
        writer.put16(hopChannel(cell, i));
    return modemItem(kGSMMobileAllocationCode, writer);
}

PhoneMessage gsmDedicatedChannel(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.put16(hopChannel(cell, cell.code % kHopsTo.size())).skip(2);
    return modemItem(kGSMDedicatedChannelCode, writer);
}

PhoneMessage gsmDiscontinuousTransmission(bool isUsed)
{
    PacketWriter writer;
    writer.skip(6).put8(isUsed ? 1 : 0);
    return modemItem(kGSMDiscontinuousCode, writer);
}

std::vector<PhoneMessage> gprsInformation(const UMTSTownCell& cell)
{
    return {broadcastPosition(), networkControl(cell), cellOptions(cell), packetBroadcast(),
            measurementOrder(cell)};
}

} // namespace orvane
