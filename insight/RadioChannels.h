#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

namespace orvane
{

// The radio systems whose channel numbers have tables here.
enum class RadioSystem {
    Lte,  // E-ARFCN of the downlink
    Umts, // UARFCN of the downlink, FDD
    Gsm,  // ARFCN
    Cdma, // channel of a 1x or EV-DO carrier
};

// A run of channel numbers of one band whose frequencies are evenly spaced.
struct ChannelRange {
    const char* band; // as people name it: "20", "VIII", "DCS 1800", "0"
    std::uint32_t first;
    std::uint32_t last;
    std::uint32_t stride; // channels between one member and the next
    std::int64_t firstHertz;
    std::int64_t channelHertz; // between channel N and channel N + 1

    [[nodiscard]] constexpr bool holds(std::uint32_t channel) const
    {
        return channel >= first && channel <= last && (channel - first) % stride == 0;
    }
    [[nodiscard]] constexpr std::int64_t hertzOf(std::uint32_t channel) const
    {
        return firstHertz + std::int64_t{channel - first} * channelHertz;
    }
};

// A band that a channel number belongs to, with its frequency there.
struct ChannelBand {
    std::string_view band;
    std::int64_t downlinkHertz = 0;
    friend bool operator==(const ChannelBand&, const ChannelBand&) = default;
};

// All ranges of the system, band by band.
[[nodiscard]] std::span<const ChannelRange> channelRanges(RadioSystem system);

// Every band that has the channel, in the order of the table; empty where none has. A channel
// number alone may belong to several bands, at different frequencies.
[[nodiscard]] std::vector<ChannelBand> bandsOfChannel(RadioSystem system, std::uint32_t channel);

// The downlink frequency that all the bands agree on; nothing where they differ, or are none.
[[nodiscard]] std::optional<std::int64_t> commonDownlinkHertz(std::span<const ChannelBand> bands);

} // namespace orvane
