#pragma once

#include <cstdint>

namespace orvane
{

// Log codes of the modem packets that the GSM/UMTS sections understand. Deliberate: several feed
// more than one section, each of which shows its own view of the packet.

constexpr std::uint32_t kUmtsRankingCode = 0x4005;
constexpr std::uint32_t kUmtsTransmitPowerCode = 0x4031;
constexpr std::uint32_t kUmtsBlerCode = 0x4116;
constexpr std::uint32_t kUmtsRrcStateCode = 0x4125;
constexpr std::uint32_t kUmtsCellIdentityCode = 0x4127;
constexpr std::uint32_t kUmtsCipheringCode = 0x4157;
constexpr std::uint32_t kUmtsActiveSetCode = 0x417A;
constexpr std::uint32_t kHsdpaCode = 0x4221;

constexpr std::uint32_t kGsmDtxCode = 0x5072;
constexpr std::uint32_t kGsmDedicatedChannelCode = 0x5076;
constexpr std::uint32_t kGsmRrStateCode = 0x512C;
constexpr std::uint32_t kGsmCellCode = 0x5134;
constexpr std::uint32_t kGsmMeasurementCode = 0x5137;
constexpr std::uint32_t kGprsSystemInformationCode = 0x51F4;
constexpr std::uint32_t kGprsAccessCode = 0x51F5;
constexpr std::uint32_t kGprsCellOptionsCode = 0x51F6;
constexpr std::uint32_t kGsmMobileAllocationCode = 0x51F8;
constexpr std::uint32_t kGprsBroadcastChannelCode = 0x51FB;
constexpr std::uint32_t kGprsPacketStatusCode = 0x51FD;
constexpr std::uint32_t kGsmBsicListCode = 0x51FF;

constexpr std::uint32_t kGmmStateCode = 0x7130;
constexpr std::uint32_t kMmStateCode = 0x7131;
constexpr std::uint32_t kRegistrationCode = 0x7132;
constexpr std::uint32_t kServingPlmnCode = 0x7135;
constexpr std::uint32_t kEquivalentPlmnCode = 0x7150;

} // namespace orvane
