#pragma once

#include "telephonyd/phone/Drive.h"

#include <array>

namespace orvane
{

// What a UTRAN cell tells about itself. Both directions share its channel, by turns in time.
struct UTRANCell {
    std::uint16_t channel;      // UARFCN
    std::uint8_t band;          // 34 or 39
    std::uint8_t cellParameter; // 0 to 127, says which codes the cell uses
    std::uint32_t
        cellIdentity; // with the radio network controller's number in the upper 12 of 28 bits
    std::uint16_t locationArea;
    std::uint8_t registrationArea;  // URA
    std::uint8_t restrictedClasses; // how many access classes are kept out
};

constexpr std::size_t kUTRANTownCells = 17;

// The UTRAN cells of the town (LTETown.h has its road) and where they stand, in the same order.
extern const std::array<UTRANCell, kUTRANTownCells> kUTRANTown;
extern const std::array<DriveCell, kUTRANTownCells> kUTRANTownMasts;

} // namespace orvane
