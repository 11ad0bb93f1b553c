#include "telephonyd/phone/CDMAAir.h"

#include <cmath>

namespace orvane
{

namespace
{

constexpr double kNoise = -104;              // dBm on a carrier
constexpr double kCellAbovePilot = 5;        // dB that a cell sends in all over its 1x pilot
constexpr double kBestRatio = 25;            // that receivers reach, however clean the signal
constexpr double kOneXPilotOfCell = 0.31623; // -5 dB

double milliwatts(double decibelMilliwatts) { return std::pow(10, decibelMilliwatts / 10); }
double decibels(double ratio) { return 10 * std::log10(ratio); }

} // namespace

CDMAAir::CDMAAir(const Drive& drive)
{
    const std::uint16_t carrier = kCDMATown[drive.serving()].area.oneXChannel;
    double all = milliwatts(kNoise);
    for (std::size_t i = 0; i < kCDMATown.size(); ++i) {
        if (kCDMATown[i].area.oneXChannel != carrier)
            continue;
        _shares[i] = milliwatts(drive.level(i) + kCellAbovePilot);
        all += _shares[i];
    }
    for (double& share : _shares)
        share /= all;
    _received = decibels(all);
}

double CDMAAir::oneXPilot(std::size_t cell) const
{
    return decibels(_shares[cell] * kOneXPilotOfCell);
}

double CDMAAir::evdoPilot(std::size_t cell) const { return decibels(_shares[cell]); }

double CDMAAir::carrierToInterference(std::size_t cell) const
{
    const double ratio = _shares[cell] / (1 - _shares[cell]);
    return decibels(1 / (1 / ratio + 1 / kBestRatio));
}

} // namespace orvane
