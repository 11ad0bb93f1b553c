#include "telephonyd/phone/EvdoTraffic.h"

#include <algorithm>

namespace orvane
{

namespace
{

struct TransmissionFormat {
    double from;              // dB that it takes
    unsigned slots;           // of 1/600 s a packet
    std::size_t firstCounter; // of as many as there are packet sizes; the damaged ones' comes next
    std::uint32_t sizes;
};

// The fastest first: 3072 kbps down to 38.4 kbps.
constexpr TransmissionFormat kFormats[] = {
    {11.5, 1,  54, 1},
    {9.5,  1,  50, 1},
    {7.2,  1,  47, 2},
    {5.5,  2,  52, 1},
    {3.5,  2,  45, 1},
    {1.5,  2,  38, 2},
    {-0.5, 2,  34, 3},
    {-3,   4,  25, 3},
    {-6,   4,  15, 4},
    {-9,   8,  10, 4},
    {-99,  16, 5,  4},
};

constexpr double kSlotsAStep = 24;
constexpr double kDamaged = 0.015;
constexpr double kFull = 0.85; // the rest are ends of something

const TransmissionFormat& formatFor(double carrierToInterference)
{
    return *std::find_if(
        std::begin(kFormats), std::end(kFormats) - 1,
        [&](const TransmissionFormat& format) { return carrierToInterference >= format.from; });
}

} // namespace

void EvdoForwardTraffic::step(double carrierToInterference, double share)
{
    const TransmissionFormat& format = formatFor(carrierToInterference);
    _slots += kSlotsAStep * share;
    for (; _slots >= format.slots; _slots -= format.slots) {
        std::uint32_t counter = format.sizes - 1;
        if (_random.between(0, 1) < kDamaged)
            counter = format.sizes;
        else if (_random.between(0, 1) >= kFull)
            counter = _random.below(format.sizes);
        ++_counters[format.firstCounter + counter];
    }
}

void EvdoReverseTraffic::step(double headroom)
{
    constexpr int kPartsAStep = 2; // one in 20 ms on each interlace
    for (int i = 0; i < kPartsAStep; ++i)
        for (std::size_t interlace = 0; interlace < kInterlaces; ++interlace)
            sendPart(interlace, headroom);
}

void EvdoReverseTraffic::sendPart(std::size_t interlace, double headroom)
{
    constexpr double kDecibelsASize = 2.5;
    constexpr double kLowDelay = 0.2;
    Packet& packet = _packets[interlace];
    if (packet.parts == packet.sent) {
        const double affordable =
            std::clamp(headroom / kDecibelsASize, 1.0, static_cast<double>(kSizes));
        packet.size = _random.below(static_cast<std::uint32_t>(affordable));
        packet.mode = _random.between(0, 1) < kLowDelay ? 1 : 0;
        // Packets for low delay are sent with more power.
        packet.parts = 1 + _random.below(packet.mode == 1 ? 2 : kParts);
        packet.sent = 0;
    }
    if (++packet.sent == packet.parts)
        ++_counters[interlace][packet.mode][packet.size][packet.parts - 1];
}

} // namespace orvane
