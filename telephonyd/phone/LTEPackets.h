#pragma once

#include "platform/base/Bytes.h"
#include "telephonyd/phone/LTETown.h"
#include "telephonyd/phone/Scenario.h"

#include <span>

namespace orvane
{

// The LTE modem's log packets, put together field by field.

constexpr std::uint16_t kLTEServingCellCode = 0xB0C2;
constexpr std::uint16_t kLTEMasterInformationCode = 0xB0C1;
constexpr std::uint16_t kLTEConnectedMeasurementCode = 0xB179;
constexpr std::uint16_t kLTEServingMeasurementCode = 0xB17F;
constexpr std::uint16_t kLTENeighbourMeasurementCode = 0xB180;
constexpr std::uint16_t kLTEReselectionCode = 0xB186;

// How a cell is heard.
struct LTELevels {
    LTECell cell;
    double power;          // RSRP of the moment, dBm
    double averagePower;   // dBm
    double quality;        // RSRQ of the moment, dB
    double averageQuality; // dB
    double totalPower;     // RSSI over the whole bandwidth, dBm
};

// The least power at which the cell may be camped on, in dBm, and how far above it a power is.
int leastPower(const LTECell& cell);
int selectionLevel(const LTECell& cell, double averagePower);

// A cell of any technology that is a candidate for reselection.
struct LTEReselectionCandidate {
    std::uint16_t priority;
    std::uint16_t technology; // 0 LTE, 1 UTRAN, 2 GERAN, 3 CDMA 1x, 4 CDMA HRPD
    Bytes body;
};
LTEReselectionCandidate lteCandidate(const LTECell& cell);
// The candidates of other technologies, by turns.
LTEReselectionCandidate otherCandidate(unsigned turn);

PhoneMessage lteServingCell(const LTECell& cell);
PhoneMessage lteMasterInformation(const LTECell& cell, std::uint16_t systemFrame);
PhoneMessage lteServingMeasurement(const LTELevels& serving, bool rulesUpdated);
// While connected: the strongest cells on the serving channel are measured, the others only
// detected.
PhoneMessage lteConnectedMeasurement(const LTELevels& serving, std::span<const LTELevels> others,
                                     std::uint16_t subframe);
// At rest: the cells, at least 1 and at most 32, that are heard on a channel.
PhoneMessage lteNeighbourMeasurement(std::span<const LTELevels> cells, std::uint32_t frameOffset);
// A body takes the place of the records after its own, so that a report names one candidate.
PhoneMessage lteReselection(const LTECell& serving, const LTEReselectionCandidate& candidate);

} // namespace orvane
