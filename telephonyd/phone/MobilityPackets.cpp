#include "telephonyd/phone/MobilityPackets.h"

#include "platform/base/Bytes.h"
#include "telephonyd/phone/ModemItem.h"

namespace orvane
{

namespace
{

template <typename Enumeration>
std::uint32_t number(Enumeration value)
{
    return static_cast<std::uint32_t>(value);
}

// Whether the network knows the location.
std::uint32_t updateStatus(bool isUpdated) { return isUpdated ? 0 : 1; }

} // namespace

PhoneMessage registration(RegistrationState state)
{
    constexpr std::uint32_t kAutomatic = 0;
    PacketWriter writer;
    writer.put8(number(state)).put8(kAutomatic).skip(1);
    return modemItem(kRegistrationCode, writer);
}

PhoneMessage circuitMobility(CircuitState state, CircuitSubState subState, bool isUpdated)
{
    PacketWriter writer;
    writer.put8(number(state)).put8(number(subState)).put8(updateStatus(isUpdated));
    return modemItem(kCircuitMobilityCode, writer);
}

PhoneMessage packetMobility(PacketState state, PacketSubState subState, bool isUpdated)
{
    PacketWriter writer;
    writer.put8(number(state)).put8(number(subState)).put8(updateStatus(isUpdated));
    return modemItem(kPacketMobilityCode, writer);
}

PhoneMessage systemInformation(const UMTSTownCell& cell, ServiceType service)
{
    PacketWriter writer;
    writer
        .put8(cell.isUmts ? 0 : 1) // operation mode I or II: paging is coordinated or not
        .put8(number(service))
        .append(Bytes{0x00, 0xF1, 0x10}) // network 001 01
        .put8(cell.locationArea >> 8U)   // as it is sent on air:
        .put8(cell.locationArea & 0xFFU) // the high byte first
        .put8(cell.routingArea)
        .skip(11);
    return modemItem(kSystemInformationCode, writer);
}

// Each network takes three bytes but is read from six, with country digits and network digits by
// turns, so that the bytes of the next network are also the rest of this one. The digits are chosen
// so that 001 100, 001 102 and the like are read.
PhoneMessage equivalentNetworks(std::uint16_t locationArea)
{
    PacketWriter writer;
    writer.skip(3);
    if (locationArea % 2 == 0)
        writer.put8(3).append(Bytes{0, 2, 0, 0, 1, 0, 0, 1, 0, 2, 1, 5});
    else
        writer.put8(2).append(Bytes{0, 1, 0, 0, 1, 0, 0, 1, 2});
    return modemItem(kEquivalentNetworksCode, writer);
}

} // namespace orvane
