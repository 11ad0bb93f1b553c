#pragma once

#include <cstdint>

namespace orvane
{

// Log codes of modem packets. Deliberate: each feeds more than one LTE section.

constexpr std::uint32_t kLteIntraFrequencyMeasurementCode = 0xB179;
constexpr std::uint32_t kLteNeighborMeasurementCode = 0xB180;
constexpr std::uint32_t kLteReselectionCandidatesCode = 0xB186;

} // namespace orvane
