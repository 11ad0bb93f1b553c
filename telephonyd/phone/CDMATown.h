#pragma once

#include "telephonyd/phone/Drive.h"

#include <array>

namespace orvane
{

// What the cells of one part of the town have in common: both carriers and the networks' numbers.
struct CDMAArea {
    std::uint8_t oneXBand;
    std::uint16_t oneXChannel;
    std::uint8_t evdoBand;
    std::uint16_t evdoChannel;
    std::uint16_t systemId;
    std::uint16_t networkId;
    std::uint8_t packetZone;
    std::uint8_t colourCode;       // of the EV-DO subnet
    std::uint8_t roamingIndicator; // 0 at home
};

// What a cell tells about itself. 1x and EV-DO share its mast and its pilot.
struct CDMACell {
    CDMAArea area;
    std::uint16_t pilotOffset; // in 64 chips, 0 to 511
    std::uint16_t baseId;
};

constexpr std::size_t kCDMATownCells = 15;

// The CDMA cells of the town (LTETown.h has its road) and where they stand, in the same order.
extern const std::array<CDMACell, kCDMATownCells> kCDMATown;
extern const std::array<DriveCell, kCDMATownCells> kCDMATownMasts;

} // namespace orvane
