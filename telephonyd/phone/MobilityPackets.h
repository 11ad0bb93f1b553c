#pragma once

#include "telephonyd/phone/Scenario.h"
#include "telephonyd/phone/UMTSTown.h"

namespace orvane
{

// Log packets of a GSM or UMTS modem about its dealings with the core network.

constexpr std::uint16_t kPacketMobilityCode = 0x7130;
constexpr std::uint16_t kCircuitMobilityCode = 0x7131;
constexpr std::uint16_t kRegistrationCode = 0x7132;
constexpr std::uint16_t kSystemInformationCode = 0x7135;
constexpr std::uint16_t kEquivalentNetworksCode = 0x7150;

enum class RegistrationState : std::uint8_t { Idle = 1, Registering = 2, AutomaticSearch = 5 };

// Mobility management of the circuit-switched side, with the sub-states of being idle.
enum class CircuitState : std::uint8_t {
    LocationUpdateInitiated = 3,
    WaitForOutgoingConnection = 5,
    ConnectionActive = 6,
    WaitForNetworkCommand = 9,
    WaitForRadioToUpdate = 13,
    WaitForRadioToConnect = 14,
    Idle = 19,
};
enum class CircuitSubState : std::uint8_t {
    None = 0,
    NetworkSearch = 2,
    UpdateNeeded = 5,
    NormalService = 8,
};

// The same of the packet-switched side.
enum class PacketState : std::uint8_t {
    Deregistered = 1,
    AttachInitiated = 2,
    Registered = 3,
    AreaUpdateInitiated = 5,
    ServiceRequestInitiated = 6,
};
enum class PacketSubState : std::uint8_t {
    NormalService = 0,
    AttachNeeded = 2,
    Suspended = 7,
    UpdateNeeded = 8,
    None = 12,
};

enum class ServiceType : std::uint8_t { All = 3, Limited = 4 };

PhoneMessage registration(RegistrationState state);
PhoneMessage circuitMobility(CircuitState state, CircuitSubState subState, bool isUpdated);
PhoneMessage packetMobility(PacketState state, PacketSubState subState, bool isUpdated);
PhoneMessage systemInformation(const UMTSTownCell& cell, ServiceType service);
// The networks that count as the serving one in that location area.
PhoneMessage equivalentNetworks(std::uint16_t locationArea);

} // namespace orvane
