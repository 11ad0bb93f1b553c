#pragma once

#include "telephonyd/phone/CDMATown.h"

namespace orvane
{

// What a phone hears on the carrier of its serving cell. The cells of a carrier all send at once
// and are told apart by their pilots, so that each is noise to the others.
class CDMAAir
{
public:
    // Of the cells of kCDMATown.
    explicit CDMAAir(const Drive& drive);

    // All that comes in, in dBm.
    [[nodiscard]] double received() const { return _received; }
    [[nodiscard]] bool isOnCarrier(std::size_t cell) const { return _shares[cell] > 0; }
    // The cell's pilot over all that comes in, in dB. On 1x it is sent beside the traffic, on EV-DO
    // by turns with it and at full power. Of a cell on the carrier.
    [[nodiscard]] double oneXPilot(std::size_t cell) const;
    [[nodiscard]] double evdoPilot(std::size_t cell) const;
    // The cell over everything else, in dB.
    [[nodiscard]] double carrierToInterference(std::size_t cell) const;

private:
    double _received = 0;
    std::array<double, kCDMATownCells> _shares{}; // of what comes in, 0 on other carriers
};

} // namespace orvane
