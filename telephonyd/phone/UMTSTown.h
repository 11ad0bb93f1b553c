#pragma once

#include "telephonyd/phone/Drive.h"

#include <array>

namespace orvane
{

// What a cell tells about itself, of GSM in the 850 MHz band or of UMTS in the 1900 MHz band.
struct UMTSTownCell {
    bool isUmts;
    std::uint16_t channel;      // ARFCN; UARFCN of the way down
    std::uint16_t code;         // base station identity code; scrambling code
    std::uint32_t cellIdentity; // 16 bits; 28 bits
    std::uint16_t locationArea;
    std::uint8_t routingArea;
};

constexpr std::size_t kUMTSTownCells = 14;

// A small town with GSM in the west and UMTS in the east, where the cells stand (same order), and a
// road from one into the other and back.
extern const std::array<UMTSTownCell, kUMTSTownCells> kUMTSTown;
extern const std::array<DriveCell, kUMTSTownCells> kUMTSTownMasts;
extern const std::array<RoadPoint, 6> kUMTSTownRoad;

} // namespace orvane
