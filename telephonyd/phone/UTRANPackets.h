#pragma once

#include "telephonyd/phone/RadioConnection.h"
#include "telephonyd/phone/Scenario.h"
#include "telephonyd/phone/UTRANTown.h"

#include <array>
#include <span>

namespace orvane
{

// The UTRAN modem's log packets, put together field by field.

constexpr std::uint16_t kUTRANRadioStateCode = 0xD0E0;
constexpr std::uint16_t kUTRANServingCellCode = 0xD0E2;
constexpr std::uint16_t kUTRANNeighboursCode = 0xD00A;
constexpr std::uint16_t kUTRANGSMNeighboursCode = 0xD00E;
constexpr std::uint16_t kUTRANChannelQualityCode = 0xD00C;

// What the modem does with a cell that it hears.
enum class UTRANSet : std::uint8_t { Active = 0, Monitored = 1, Detected = 2 };

struct UTRANNeighbour {
    std::uint16_t channel;
    std::uint8_t cellParameter;
    double power; // filtered RSCP, dBm
    UTRANSet set;
    bool isDetectedJointly; // with the serving cell, to take its interference out
};

struct UTRANGSMNeighbour {
    std::uint16_t cellIdentity; // 14 bits
    std::uint16_t channel;      // ARFCN
    std::uint8_t colours;       // base station identity code, 0 to 63
    double power;               // dBm
};

// A transport channel and the share of its blocks that arrive damaged.
struct TransportChannel {
    std::uint8_t number;
    double percentDamaged;
};
// Transport channels that are sent coded together in a time slot.
struct CodedChannel {
    std::uint8_t number;
    std::uint8_t timeSlot;                       // 0 to 6
    std::array<double, 6> signalsToInterference; // of measurements in a row, dB
};

PhoneMessage utranRadioState(RadioState state);
PhoneMessage utranServingCell(const UTRANCell& cell, bool emergencyCallsOnly);
// At most 127 cells.
PhoneMessage utranNeighbours(std::span<const UTRANNeighbour> cells);
// At most 255 cells.
PhoneMessage utranGSMNeighbours(std::span<const UTRANGSMNeighbour> cells);
// At most 63 transport channels and 15 coded ones.
PhoneMessage utranChannelQuality(std::span<const TransportChannel> transport,
                                 std::span<const CodedChannel> coded);

} // namespace orvane
