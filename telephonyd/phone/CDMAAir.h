#pragma once

#include "telephonyd/phone/CDMATown.h"

namespace orvane
{

// What a phone hears on the carrier of its serving cell. All cells of a carrier send at once. Their
// pilots tell them apart, and each is noise to the others.
class CDMAAir
{
public:
    // Of the cells of kCDMATown.
    explicit CDMAAir(const Drive& drive);

    // The total power received, in dBm.
    [[nodiscard]] double received() const { return _received; }
    [[nodiscard]] bool isOnCarrier(std::size_t cell) const { return _shares[cell] > 0; }
    // The ratio of the cell's pilot to the total power received, in dB. On 1x the pilot is sent
    // beside the traffic, on EV-DO in turn with it and at full power. The cell must be on the
    // carrier.
    [[nodiscard]] double oneXPilot(std::size_t cell) const;
    [[nodiscard]] double evdoPilot(std::size_t cell) const;
    // The ratio of the cell to everything else, in dB.
    [[nodiscard]] double carrierToInterference(std::size_t cell) const;

private:
    double _received = 0;
    std::array<double, kCDMATownCells> _shares{}; // of what comes in, 0 on other carriers
};

} // namespace orvane
