#pragma once

#include "telephonyd/phone/Drive.h"

#include <array>

namespace orvane
{

// What an LTE cell tells about itself.
struct LTECell {
    std::uint16_t physicalCellId;
    std::uint16_t earfcn;
    std::uint16_t uplinkEarfcn;
    std::uint8_t band;
    std::uint8_t resourceBlocks; // 6, 15, 25, 50, 75 or 100
    std::uint32_t cellIdentity;
    std::uint16_t trackingAreaCode;
    std::uint8_t antennas;
    std::uint8_t priority; // of its layer for reselection, 0 to 7
};

constexpr std::size_t kLTETownCells = 19;

// The town that the simulated phone drives through: its cells, where they stand (same order), and
// the road through it.
extern const std::array<LTECell, kLTETownCells> kLTETown;
extern const std::array<DriveCell, kLTETownCells> kLTETownMasts;
extern const std::array<RoadPoint, 8> kLTETownRoad;

} // namespace orvane
