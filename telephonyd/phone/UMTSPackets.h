#pragma once

#include "telephonyd/phone/GSMPackets.h"
#include "telephonyd/phone/RadioConnection.h"

namespace orvane
{

// Log packets of a UMTS modem about its radio.

constexpr std::uint16_t kUMTSActiveSetCode = 0x417A;
constexpr std::uint16_t kUMTSRankingCode = 0x4005;
constexpr std::uint16_t kUMTSRadioStateCode = 0x4125;
constexpr std::uint16_t kUMTSServingCellCode = 0x4127;
constexpr std::uint16_t kUMTSCipheringCode = 0x4157;
constexpr std::uint16_t kUMTSTransmitPowerCode = 0x4031;
constexpr std::uint16_t kUMTSBlockErrorsCode = 0x4116;
constexpr std::uint16_t kUMTSFastDownlinkCode = 0x4221;

struct UMTSLevel {
    UMTSTownCell cell;
    double power;   // RSCP, dBm
    double quality; // Ec/Io, dB
    double rank;    // in reselection, dBm
    enum class Set : std::uint8_t { Active = 0, Monitored = 1, Detected = 2 } set;
};

struct TransportBlocks {
    std::uint8_t channel;
    std::uint32_t received;
    std::uint32_t damaged; // of those
};

// What a process of the fast downlink (HSDPA) has received in a report's sub-frames.
struct DownlinkProcess {
    std::uint8_t number;
    std::uint32_t bits;
    std::uint16_t transmissions;
    std::uint16_t blockErrors;
};

// At most 255 cells, with the power of all that comes in on the channel, in dBm.
PhoneMessage umtsActiveSet(double totalPower, std::span<const UMTSLevel> cells);
// How cells rank in reselection, at most 255. GSM and UMTS records begin at the same place, so that
// a report is of GSM cells alone, or of UMTS cells and the GSM cell at the first one's mast.
PhoneMessage gsmRanking(std::span<const GSMLevel> cells);
PhoneMessage umtsRanking(std::span<const UMTSLevel> cells);
PhoneMessage umtsRadioState(RadioState state);
PhoneMessage umtsServingCell(const UMTSTownCell& cell);
PhoneMessage umtsCiphering(bool isOn);
// Powers in dBm, at most 255.
PhoneMessage umtsTransmitPower(std::span<const double> powers);
PhoneMessage umtsBlockErrors(std::span<const TransportBlocks> channels);
// Of one carrier, or where there are secondary processes of two.
PhoneMessage umtsFastDownlink(std::uint16_t subFrames, std::span<const DownlinkProcess> primary,
                              std::span<const DownlinkProcess> secondary);

} // namespace orvane
