#pragma once

#include "telephonyd/phone/PhoneRandom.h"

#include <array>
#include <cstdint>

namespace orvane
{

// The data packets that the network has sent to a phone over EV-DO, counted from its start. For
// each transmission format, the slowest first, there is a counter a packet size, the smallest
// first, and one of packets that came in damaged.
class EvdoForwardTraffic
{
public:
    static constexpr std::size_t kCounters = 56;

    explicit EvdoForwardTraffic(std::uint64_t seed) : _random(seed) {}

    // Advances by Drive::kStep. `carrierToInterference` is in dB; the phone gets `share` of the
    // sector's time.
    void step(double carrierToInterference, double share);
    [[nodiscard]] const std::array<std::uint32_t, kCounters>& counters() const { return _counters; }

private:
    PhoneRandom _random;
    std::array<std::uint32_t, kCounters> _counters{};
    double _slots = 0; // that are the phone's and not used yet
};

// The data packets that a phone has sent over EV-DO. They go out in turn on three interlaces, each
// in up to four parts: the remaining parts are not sent once the sector has understood the packet.
class EvdoReverseTraffic
{
public:
    static constexpr std::size_t kInterlaces = 3;
    static constexpr std::size_t kModes = 2; // for throughput, for low delay
    static constexpr std::size_t kSizes = 12;
    static constexpr std::size_t kParts = 4;
    // Packets understood after their first part, after their second and so on.
    using Counters = std::array<std::uint32_t, kParts>;

    explicit EvdoReverseTraffic(std::uint64_t seed) : _random(seed) {}

    // Advances by Drive::kStep. `headroom` is the transmit power to spare, in dB.
    void step(double headroom);
    [[nodiscard]] const Counters& counters(std::size_t interlace, std::size_t mode,
                                           std::size_t size) const
    {
        return _counters[interlace][mode][size];
    }

private:
    void sendPart(std::size_t interlace, double headroom);

    struct Packet {
        std::size_t mode = 0;
        std::size_t size = 0;
        std::size_t parts = 0; // that it takes
        std::size_t sent = 0;  // of them
    };

    PhoneRandom _random;
    std::array<Packet, kInterlaces> _packets{};
    std::array<std::array<std::array<Counters, kSizes>, kModes>, kInterlaces> _counters{};
};

} // namespace orvane
