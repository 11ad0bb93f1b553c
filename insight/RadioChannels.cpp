#include "insight/RadioChannels.h"

#include <algorithm>

// The channel numbers of the specifications of the radio systems: LTE 3GPP TS 36.101 table 5.7.3-1,
// UMTS 3GPP TS 25.101 tables 5.1 and 5.1A (with the additional channels), GSM 3GPP TS 45.005
// section 2, CDMA 3GPP2 C.S0057.

namespace orvane
{

namespace
{

constexpr std::int64_t kKilo = 1000;
constexpr std::int64_t kHundredKilo = 100 * kKilo;

// The band's lowest downlink frequency, in 100 kHz, is that of its first channel.
constexpr ChannelRange lte(const char* band, std::int64_t lowest, std::uint32_t first,
                           std::uint32_t last)
{
    return {band, first, last, 1, lowest * kHundredKilo, kHundredKilo};
}

// The frequency is the channel number times 200 kHz and the offset, in 100 kHz. Additional channels
// are every fifth or every twenty-fifth.
constexpr ChannelRange umts(const char* band, std::int64_t offset, std::uint32_t first,
                            std::uint32_t last, std::uint32_t stride = 1)
{
    return {band,
            first,
            last,
            stride,
            (offset + 2 * std::int64_t{first}) * kHundredKilo,
            2 * kHundredKilo};
}

// The first downlink frequency in 100 kHz.
constexpr ChannelRange gsm(const char* band, std::int64_t lowest, std::uint32_t first,
                           std::uint32_t last)
{
    return {band, first, last, 1, lowest * kHundredKilo, 2 * kHundredKilo};
}

// The first downlink frequency and the distance of channels, in hertz.
constexpr ChannelRange cdma(const char* band, std::uint32_t first, std::uint32_t last,
                            std::int64_t lowestHertz, std::int64_t channelHertz)
{
    return {band, first, last, 1, lowestHertz, channelHertz};
}

// clang-format off
constexpr ChannelRange kLte[] = {
    lte("1", 21100, 0, 599),
    lte("2", 19300, 600, 1199),
    lte("3", 18050, 1200, 1949),
    lte("4", 21100, 1950, 2399),
    lte("5", 8690, 2400, 2649),
    lte("6", 8750, 2650, 2749),
    lte("7", 26200, 2750, 3449),
    lte("8", 9250, 3450, 3799),
    lte("9", 18449, 3800, 4149),
    lte("10", 21100, 4150, 4749),
    lte("11", 14759, 4750, 4949),
    lte("12", 7290, 5010, 5179),
    lte("13", 7460, 5180, 5279),
    lte("14", 7580, 5280, 5379),
    lte("17", 7340, 5730, 5849),
    lte("18", 8600, 5850, 5999),
    lte("19", 8750, 6000, 6149),
    lte("20", 7910, 6150, 6449),
    lte("21", 14959, 6450, 6599),
    lte("22", 35100, 6600, 7399),
    lte("23", 21800, 7500, 7699),
    lte("24", 15250, 7700, 8039),
    lte("25", 19300, 8040, 8689),
    lte("26", 8590, 8690, 9039),
    lte("27", 8520, 9040, 9209),
    lte("28", 7580, 9210, 9659),
    lte("29", 7170, 9660, 9769),
    lte("30", 23500, 9770, 9869),
    lte("31", 4625, 9870, 9919),
    lte("32", 14520, 9920, 10359),
    lte("33", 19000, 36000, 36199),
    lte("34", 20100, 36200, 36349),
    lte("35", 18500, 36350, 36949),
    lte("36", 19300, 36950, 37549),
    lte("37", 19100, 37550, 37749),
    lte("38", 25700, 37750, 38249),
    lte("39", 18800, 38250, 38649),
    lte("40", 23000, 38650, 39649),
    lte("41", 24960, 39650, 41589),
    lte("42", 34000, 41590, 43589),
    lte("43", 36000, 43590, 45589),
    lte("44", 7030, 45590, 46589),
    lte("45", 14470, 46590, 46789),
    lte("46", 51500, 46790, 54539),
    lte("47", 58550, 54540, 55239),
    lte("48", 35500, 55240, 56739),
    lte("49", 35500, 56740, 58239),
    lte("50", 14320, 58240, 59089),
    lte("51", 14270, 59090, 59139),
    lte("52", 33000, 59140, 60139),
    lte("53", 24835, 60140, 60254),
    lte("65", 21100, 65536, 66435),
    lte("66", 21100, 66436, 67335),
    lte("67", 7380, 67336, 67535),
    lte("68", 7530, 67536, 67835),
    lte("69", 25700, 67836, 68335),
    lte("70", 19950, 68336, 68585),
    lte("71", 6170, 68586, 68935),
    lte("72", 4610, 68936, 68985),
    lte("73", 4600, 68986, 69035),
    lte("74", 14750, 69036, 69465),
    lte("75", 14320, 69466, 70315),
    lte("76", 14270, 70316, 70365),
    lte("85", 7280, 70366, 70545),
    lte("87", 4200, 70546, 70595),
    lte("88", 4220, 70596, 70645),
    lte("103", 7570, 70646, 70655),
    lte("106", 9350, 70656, 70705),
};

constexpr ChannelRange kUmts[] = {
    umts("I", 0, 10562, 10838),
    umts("II", 0, 9662, 9938),
    umts("II", 18501, 412, 687, 25),
    umts("III", 15750, 1162, 1513),
    umts("IV", 18050, 1537, 1738),
    umts("IV", 17351, 1887, 2087, 25),
    umts("V", 0, 4357, 4458),
    umts("V", 6701, 1007, 1012, 5),
    umts("V", 6701, 1032, 1037, 5),
    umts("V", 6701, 1062, 1087, 25),
    umts("VI", 0, 4387, 4413),
    umts("VI", 6701, 1037, 1062, 25),
    umts("VII", 21750, 2237, 2563),
    umts("VII", 21051, 2587, 2912, 25),
    umts("VIII", 3400, 2937, 3088),
    umts("IX", 0, 9237, 9387),
    umts("X", 14900, 3112, 3388),
    umts("X", 14301, 3412, 3687, 25),
    umts("XI", 7360, 3712, 3787),
    umts("XII", -370, 3842, 3903),
    umts("XII", -549, 3927, 3932, 5),
    umts("XII", -549, 3957, 3962, 5),
    umts("XII", -549, 3987, 3992, 5),
    umts("XIII", -550, 4017, 4043),
    umts("XIII", -649, 4067, 4092, 25),
    umts("XIV", -630, 4117, 4143),
    umts("XIV", -729, 4167, 4192, 25),
    umts("XIX", 7350, 712, 763),
    umts("XIX", 7201, 787, 837, 25),
    umts("XX", -1090, 4512, 4638),
    umts("XXI", 13260, 862, 912),
    umts("XXII", 25800, 4662, 5038),
    umts("XXV", 9100, 5112, 5413),
    umts("XXV", 6741, 6292, 6592, 25),
    umts("XXVI", -2910, 5762, 5913),
    umts("XXVI", -3259, 5937, 5987, 25),
    umts("XXVI", -3259, 5992, 6067, 25),
    umts("XXVI", -3259, 6012, 6087, 25),
    umts("XXXII", 1310, 6617, 6813),
};

constexpr ChannelRange kGsm[] = {
    gsm("GSM 450", 4606, 259, 293),
    gsm("GSM 480", 4890, 306, 340),
    gsm("GSM 750", 7472, 438, 511),
    gsm("GSM 850", 8692, 128, 251),
    gsm("GSM 900", 9350, 0, 124),
    gsm("GSM 900", 9182, 940, 1023),
    gsm("DCS 1800", 18052, 512, 885),
    gsm("PCS 1900", 19302, 512, 810),
};

// By band class. The third block of band class 11 (channels 1536 to 1715) is not listed.
constexpr ChannelRange kCdma[] = {
    cdma("0", 1, 799, 870'030'000, 30'000),
    cdma("0", 991, 1023, 869'040'000, 30'000),
    cdma("0", 1024, 1323, 860'040'000, 30'000),
    cdma("1", 0, 1199, 1'930'000'000, 50'000),
    cdma("2", 0, 1000, 934'987'500, 25'000),
    cdma("2", 1329, 2047, 917'012'500, 25'000),
    cdma("3", 1, 799, 860'012'500, 12'500),
    cdma("3", 801, 1039, 843'012'500, 12'500),
    cdma("3", 1041, 1199, 832'012'500, 12'500),
    cdma("3", 1201, 1600, 838'012'500, 12'500),
    cdma("4", 0, 599, 1'840'000'000, 50'000),
    cdma("5", 1, 300, 460'000'000, 25'000),
    cdma("5", 539, 871, 421'675'000, 25'000),
    cdma("5", 1039, 1473, 461'310'000, 20'000),
    cdma("5", 1792, 2016, 489'000'000, 20'000),
    cdma("6", 0, 1199, 2'110'000'000, 50'000),
    cdma("7", 0, 240, 746'000'000, 50'000),
    cdma("8", 0, 1499, 1'805'000'000, 50'000),
    cdma("9", 0, 699, 925'000'000, 50'000),
    cdma("10", 0, 719, 851'000'000, 25'000),
    cdma("10", 720, 919, 935'000'000, 25'000),
    cdma("11", 1, 400, 460'000'000, 25'000),
    cdma("11", 1001, 1400, 420'000'000, 25'000),
    cdma("12", 0, 239, 915'012'500, 25'000),
    cdma("13", 0, 1399, 2'620'000'000, 50'000),
    cdma("14", 0, 1299, 1'930'000'000, 50'000),
    cdma("15", 0, 899, 2'110'000'000, 50'000),
    cdma("16", 140, 1459, 2'624'000'000, 50'000),
    cdma("17", 140, 1459, 2'624'000'000, 50'000),
    cdma("18", 0, 240, 757'000'000, 50'000),
    cdma("19", 0, 360, 728'000'000, 50'000),
    cdma("20", 0, 680, 1'525'000'000, 50'000),
    cdma("21", 0, 399, 2'180'000'000, 50'000),
};
// clang-format on

} // namespace

std::span<const ChannelRange> channelRanges(RadioSystem system)
{
    switch (system) {
    case RadioSystem::Lte:
        return kLte;
    case RadioSystem::Umts:
        return kUmts;
    case RadioSystem::Gsm:
        return kGsm;
    case RadioSystem::Cdma:
        return kCdma;
    }
    return {};
}

std::vector<ChannelBand> bandsOfChannel(RadioSystem system, std::uint32_t channel)
{
    std::vector<ChannelBand> bands;
    for (const ChannelRange& range : channelRanges(system))
        if (range.holds(channel))
            bands.push_back({range.band, range.hertzOf(channel)});
    return bands;
}

std::optional<std::int64_t> commonDownlinkHertz(std::span<const ChannelBand> bands)
{
    if (bands.empty() || std::any_of(bands.begin(), bands.end(), [&](const ChannelBand& each) {
            return each.downlinkHertz != bands.front().downlinkHertz;
        }))
        return std::nullopt;
    return bands.front().downlinkHertz;
}

} // namespace orvane
