#include "insight/RadioChannels.h"

#include <gtest/gtest.h>

#include <string>

namespace orvane
{
namespace
{

constexpr std::int64_t kMega = 1'000'000;

TEST(RadioChannelsTest, ChannelsHaveTheFrequenciesOfTheirBands)
{
    struct Case {
        RadioSystem system;
        std::uint32_t channel;
        const char* band;
        std::int64_t kiloHertz;
    };
    for (const auto& [system, channel, band, kiloHertz] : {
             Case{RadioSystem::Lte,  0,     "1",        2110000},
             Case{RadioSystem::Lte,  300,   "1",        2140000},
             Case{RadioSystem::Lte,  1575,  "3",        1842500},
             Case{RadioSystem::Lte,  3800,  "9",        1844900},
             Case{RadioSystem::Lte,  6300,  "20",       806000 },
             Case{RadioSystem::Lte,  9919,  "31",       467400 },
             Case{RadioSystem::Lte,  38000, "38",       2595000},
             Case{RadioSystem::Lte,  40620, "41",       2593000},
             Case{RadioSystem::Lte,  66786, "66",       2145000},
             Case{RadioSystem::Lte,  68761, "71",       634500 },
             Case{RadioSystem::Umts, 10562, "I",        2112400},
             Case{RadioSystem::Umts, 10838, "I",        2167600},
             Case{RadioSystem::Umts, 412,   "II",       1932500},
             Case{RadioSystem::Umts, 2937,  "VIII",     927400 },
             Case{RadioSystem::Umts, 3088,  "VIII",     957600 },
             Case{RadioSystem::Umts, 4512,  "XX",       793400 },
             Case{RadioSystem::Umts, 3992,  "XII",      743500 },
             Case{RadioSystem::Gsm,  0,     "GSM 900",  935000 },
             Case{RadioSystem::Gsm,  62,    "GSM 900",  947400 },
             Case{RadioSystem::Gsm,  975,   "GSM 900",  925200 },
             Case{RadioSystem::Gsm,  1023,  "GSM 900",  934800 },
             Case{RadioSystem::Gsm,  128,   "GSM 850",  869200 },
             Case{RadioSystem::Gsm,  885,   "DCS 1800", 1879800},
    }) {
        const auto bands = bandsOfChannel(system, channel);
        ASSERT_EQ(bands.size(), 1U) << channel;
        EXPECT_EQ(bands[0].band, band) << channel;
        EXPECT_EQ(bands[0].downlinkHertz, kiloHertz * 1000) << channel;
    }
}

TEST(RadioChannelsTest, CdmaFrequenciesByBandClass)
{
    struct Case {
        const char* band;
        std::uint32_t channel;
        std::int64_t hertz;
    };
    for (const auto& [band, channel, hertz] : {
             Case{"0",  283,  878'490'000  },
             Case{"0",  1013, 869'700'000  },
             Case{"0",  1023, 870'000'000  },
             Case{"1",  25,   1'931'250'000},
             Case{"1",  1199, 1'989'950'000},
             Case{"2",  2047, 934'962'500  },
             Case{"3",  799,  869'987'500  },
             Case{"5",  871,  429'975'000  },
             Case{"5",  1473, 469'990'000  },
             Case{"6",  100,  2'115'000'000},
             Case{"10", 919,  939'975'000  },
             Case{"15", 899,  2'154'950'000},
    }) {
        bool isFound = false;
        for (const ChannelBand& each : bandsOfChannel(RadioSystem::Cdma, channel))
            if (each.band == band) {
                EXPECT_EQ(each.downlinkHertz, hertz) << band << ' ' << channel;
                isFound = true;
            }
        EXPECT_TRUE(isFound) << band << ' ' << channel;
    }
}

TEST(RadioChannelsTest, AChannelOfSeveralBandsNamesAllAndHasAFrequencyOnlyWhereTheyAgree)
{
    const auto both = bandsOfChannel(RadioSystem::Gsm, 600);
    ASSERT_EQ(both.size(), 2U);
    EXPECT_EQ(both[0], (ChannelBand{"DCS 1800", 18228 * kMega / 10}));
    EXPECT_EQ(both[1], (ChannelBand{"PCS 1900", 19478 * kMega / 10}));
    EXPECT_EQ(commonDownlinkHertz(both), std::nullopt);

    const auto agreed = bandsOfChannel(RadioSystem::Umts, 4400); // V and VI
    ASSERT_EQ(agreed.size(), 2U);
    EXPECT_EQ(commonDownlinkHertz(agreed), 880 * kMega);
}

TEST(RadioChannelsTest, ChannelsOutsideEveryBandHaveNone)
{
    EXPECT_TRUE(bandsOfChannel(RadioSystem::Lte, 4950).empty());
    EXPECT_TRUE(bandsOfChannel(RadioSystem::Lte, 0xFFFFFFFF).empty());
    EXPECT_TRUE(bandsOfChannel(RadioSystem::Umts, 413).empty());
    EXPECT_TRUE(bandsOfChannel(RadioSystem::Gsm, 125).empty());
    EXPECT_TRUE(bandsOfChannel(RadioSystem::Cdma, 2100).empty());
    EXPECT_EQ(commonDownlinkHertz({}), std::nullopt);
}

// An E-ARFCN says its band: no two bands of LTE share one.
TEST(RadioChannelsTest, EveryLteChannelHasOneBand)
{
    const auto ranges = channelRanges(RadioSystem::Lte);
    for (std::size_t i = 1; i < ranges.size(); ++i)
        EXPECT_LT(ranges[i - 1].last, ranges[i].first) << ranges[i].band;
}

TEST(RadioChannelsTest, EveryRangeEndsOnAChannelOfItsOwn)
{
    for (const RadioSystem system :
         {RadioSystem::Lte, RadioSystem::Umts, RadioSystem::Gsm, RadioSystem::Cdma})
        for (const ChannelRange& range : channelRanges(system)) {
            EXPECT_TRUE(range.holds(range.first) && range.holds(range.last)) << range.band;
            EXPECT_GT(range.hertzOf(range.first), 400 * kMega) << range.band;
            EXPECT_LT(range.hertzOf(range.last), 6000 * kMega) << range.band;
        }
}

} // namespace
} // namespace orvane
