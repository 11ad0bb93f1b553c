#include "telephonyd/phone/UMTSScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "telephonyd/phone/ServerItems.h"
#include "telephonyd/phone/UMTSTown.h"
#include "telephonyd/support/PhoneTour.h"

#include <gmock/gmock.h>

#include <cmath>
#include <map>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using std::chrono::milliseconds;
using testing::ElementsAre;
using testing::IsSupersetOf;
using Kind = PhoneMessage::Kind;

Tour drive(std::uint64_t seed, std::chrono::seconds duration, milliseconds step = 40ms)
{
    UMTSScenario scenario(seed);
    return tourOf(scenario, duration, step);
}

// Some rounds through the town, for all tests.
const Tour& tour()
{
    static const Tour messages = drive(1, 720s);
    return messages;
}

constexpr unsigned kModemCodes[] = {0x7130, 0x7131, 0x7132, 0x7135, 0x7150, 0x417A, 0x4005,
                                    0x4125, 0x4127, 0x4157, 0x4031, 0x4116, 0x4221, 0x5134,
                                    0x5137, 0x51FF, 0x5076, 0x5072, 0x512C, 0x51F8, 0x51F4,
                                    0x51F5, 0x51F6, 0x51FB, 0x51FD};

std::set<std::pair<Kind, unsigned>> everything()
{
    std::set<std::pair<Kind, unsigned>> codes = {
        {Kind::Server, 0},
        {Kind::Server, 1},
        {Kind::Server, 2},
    };
    for (const unsigned code : kModemCodes)
        codes.insert({Kind::Modem, code});
    return codes;
}

bool isOfTown(bool isUmts, unsigned channel, unsigned code)
{
    return std::any_of(kUMTSTown.begin(), kUMTSTown.end(), [&](const UMTSTownCell& cell) {
        return cell.isUmts == isUmts && cell.channel == channel && cell.code == code;
    });
}

// The values of a byte over the tour. Equal ones in a row count once.
std::vector<unsigned> courseOf(std::uint16_t code, std::size_t offset)
{
    std::vector<unsigned> course;
    for (const TimedMessage& each : ofCode(tour(), code)) {
        const unsigned value = byteAt(each.message, offset);
        if (course.empty() || course.back() != value)
            course.push_back(value);
    }
    return course;
}

std::set<unsigned> valuesOf(std::uint16_t code, std::size_t offset)
{
    const auto course = courseOf(code, offset);
    return {course.begin(), course.end()};
}

TEST(UMTSScenarioTest, TheFirstStepHasOneOfEverything)
{
    for (const unsigned seed : {1U, 2U, 3U, 4U, 5U, 6U, 7U, 8U})
        EXPECT_EQ(codesBetween(drive(seed, 0s), 0ms, 0ms), everything()) << "seed " << seed;
    EXPECT_EQ(UMTSScenario(1).technology(), kTSLogChannelTechnology_Varnel_GSM);
}

TEST(UMTSScenarioTest, EverythingButTheCardComesAgainWithinFourMinutes)
{
    auto expected = everything();
    expected.erase({Kind::Server, 0});
    EXPECT_EQ(codesBetween(tour(), 40ms, 240s), expected);
    EXPECT_EQ(ofCode(tour(), kSimFilesItem, Kind::Server).size(), 1U);
}

std::size_t expectedSize(const PhoneMessage& message)
{
    switch (message.code) {
    case 0x417A:
        return 16 + 59 * byteAt(message, 15);
    case 0x4005: // with UMTS records, the only GSM record shares bytes with the first of them
        return 15 + (byteAt(message, 13) ? 10 * byteAt(message, 13) : 7 * byteAt(message, 14));
    case 0x4031:
        return 16 + 14 * byteAt(message, 14);
    case 0x4116:
        return 16 + 9 * byteAt(message, 13);
    case 0x4221: {
        const unsigned primary = byteAt(message, 16);
        const unsigned secondary = byteAt(message, 17);
        return 18 + (secondary ? 162 * primary + 9 * secondary : 9 * primary);
    }
    case 0x5137:
        return 29 + 14 * byteAt(message, 28);
    case 0x51FF:
        return 15 + 4 * byteAt(message, 14);
    case 0x51F8:
        return 15 + 2 * byteAt(message, 14);
    case 0x7150: // the last record is read to its sixth byte
        return 17 + 3 * byteAt(message, 16) + 3;
    default: {
        static const std::map<unsigned, std::size_t> kSizes = {
            {0x7130, 16},
            {0x7131, 16},
            {0x7132, 16},
            {0x7135, 32},
            {0x4125, 14},
            {0x4127, 29},
            {0x4157, 19},
            {0x5134, 26},
            {0x5076, 17},
            {0x5072, 20},
            {0x512C, 17},
            {0x51F4, 15},
            {0x51F5, 18},
            {0x51F6, 24},
            {0x51FB, 34},
            {0x51FD, 35}
        };
        return kSizes.at(message.code);
    }
    }
}

TEST(UMTSScenarioTest, MessagesHaveTheirLengths)
{
    for (const TimedMessage& each : tour())
        if (each.message.kind == Kind::Modem) {
            EXPECT_EQ(sizeOf(each.message), expectedSize(each.message)) << each.message.code;
        }
}

TEST(UMTSScenarioTest, ThePhoneGoesFromGSMIntoUMTSAndBackAndAgain)
{
    std::vector<std::string> course;
    for (const TimedMessage& each : ofCode(tour(), kCellsItem, Kind::Server)) {
        const PropertyValue list = listOf(each);
        const auto* network =
            (*list.asArray())[0][kTSCellMonitorCellRadioAccessTechnology].asString();
        ASSERT_TRUE(network);
        if (course.empty() || course.back() != *network)
            course.push_back(*network);
    }
    ASSERT_GE(course.size(), 5U);
    EXPECT_EQ(course[0], kTSCellMonitorRadioAccessTechnologyGSM);
    EXPECT_EQ(course[1], kTSCellMonitorRadioAccessTechnologyUMTS);
    EXPECT_EQ(course[2], kTSCellMonitorRadioAccessTechnologyGSM);
}

TEST(UMTSScenarioTest, ThePhoneRegistersWhenItIsSwitchedOnAndInEachOtherNetwork)
{
    const auto states = courseOf(0x7132, 13);
    ASSERT_GE(states.size(), 7U);
    EXPECT_EQ(states[0], 5U); // searching
    for (std::size_t i = 1; i < states.size(); ++i)
        EXPECT_EQ(states[i], i % 2 == 1 ? 2U : 1U); // registering, registered
    const auto first = std::find_if(tour().begin(), tour().end(), [](const TimedMessage& each) {
        return each.message.kind == Kind::Modem && each.message.code == 0x7132 &&
               byteAt(each.message, 13) == 1;
    });
    ASSERT_NE(first, tour().end());
    EXPECT_LE(first->at, 5s);

    EXPECT_THAT(valuesOf(0x7135, 14), ElementsAre(3, 4)); // service: limited until registered
    std::set<unsigned> areas;
    for (const TimedMessage& each : ofCode(tour(), 0x7135)) {
        EXPECT_EQ(byteAt(each.message, 15), 0x00U); // network 001 01
        EXPECT_EQ(byteAt(each.message, 16), 0xF1U);
        EXPECT_EQ(byteAt(each.message, 17), 0x10U);
        areas.insert(byteAt(each.message, 18) << 8 | byteAt(each.message, 19));
    }
    EXPECT_THAT(areas, ElementsAre(1005, 1006));
}

TEST(UMTSScenarioTest, LocationAndRoutingAreaUpdatesGoThroughTheirStates)
{
    const auto circuit = courseOf(0x7131, 13);
    const std::vector<unsigned> update = {19, 13, 3, 9, 19};
    EXPECT_NE(std::search(circuit.begin(), circuit.end(), update.begin(), update.end()),
              circuit.end());
    const std::vector<unsigned> call = {19, 14, 5, 6, 9, 19};
    EXPECT_NE(std::search(circuit.begin(), circuit.end(), call.begin(), call.end()), circuit.end());
    const auto packet = courseOf(0x7130, 13);
    EXPECT_THAT((std::vector<unsigned>(packet.begin(), packet.begin() + 3)),
                ElementsAre(1, 2, 3)); // attached
    const std::vector<unsigned> area = {3, 5, 3};
    EXPECT_NE(std::search(packet.begin(), packet.end(), area.begin(), area.end()), packet.end());
    EXPECT_THAT(valuesOf(0x7130, 13), ElementsAre(1, 2, 3, 5, 6));
    std::set<unsigned> routingAreas;
    for (const TimedMessage& each : ofCode(tour(), 0x7135))
        routingAreas.insert(byteAt(each.message, 20));
    EXPECT_THAT(routingAreas, ElementsAre(1, 2));
}

TEST(UMTSScenarioTest, EquivalentNetworksAreRealOnesAsTheyAreRead)
{
    std::set<unsigned> counts;
    for (const TimedMessage& each : ofCode(tour(), 0x7150)) {
        counts.insert(byteAt(each.message, 16));
        for (unsigned i = 0; i < byteAt(each.message, 16); ++i) {
            // Six bytes at a step of three.
            const auto digit = [&](std::size_t at) {
                return byteAt(each.message, 17 + 3 * i + at);
            };
            EXPECT_EQ(digit(0) * 100 + digit(2) * 10 + digit(4), 1U);
            const unsigned network = digit(1) * 100 + digit(3) * 10 + digit(5);
            EXPECT_GE(network, 100U);
            EXPECT_LE(network, 215U);
        }
    }
    EXPECT_THAT(counts, ElementsAre(2, 3));
}

TEST(UMTSScenarioTest, RadioStatesTakeTurnsInBothNetworks)
{
    EXPECT_THAT(valuesOf(0x4125, 13), IsSupersetOf({0U, 1U, 2U, 3U}));
    EXPECT_THAT(valuesOf(0x512C, 13), ElementsAre(0, 5, 6, 7, 9, 11, 14, 18));
    EXPECT_THAT(valuesOf(0x512C, 16), ElementsAre(0, 1)); // calls and data
    EXPECT_THAT(valuesOf(0x4157, 13), ElementsAre(0, 1));
    EXPECT_THAT(valuesOf(0x5072, 19), ElementsAre(0, 1));
}

TEST(UMTSScenarioTest, ActiveSetsGrowAndShrinkAndTheirLevelsAgree)
{
    std::set<unsigned> activeCounts;
    std::set<unsigned> sets;
    std::set<int> powers;
    for (const TimedMessage& each : ofCode(tour(), 0x417A)) {
        const PhoneMessage& message = each.message;
        const unsigned count = byteAt(message, 15);
        ASSERT_GE(count, 1U);
        unsigned active = 0;
        for (unsigned i = 0; i < count; ++i) {
            const unsigned set = byteAt(message, 16 + 15 * i + 8) >> 5;
            const unsigned code = wordAt(message, 16 + 15 * i + 7) & 0x1FFF;
            EXPECT_TRUE(isOfTown(true, 612, code) || isOfTown(true, 637, code)) << code;
            sets.insert(set);
            active += set == 0 ? 1 : 0;
            const double quality =
                10 * std::log10(longAt(message, 16 + 15 * count + 44 * i + 32) / 524288.0);
            EXPECT_GE(quality, -24.5);
            EXPECT_LE(quality, -3);
            const double power = (signedWordAt(message, 13) + 512) / 10.0 - 106 + quality;
            EXPECT_GE(power, -128);
            EXPECT_LE(power, -74);
            powers.insert(static_cast<int>(power));
        }
        activeCounts.insert(active);
    }
    EXPECT_THAT(activeCounts, ElementsAre(1, 2, 3));
    EXPECT_THAT(sets, ElementsAre(0, 1, 2));
    EXPECT_GE(powers.size(), 20U);
}

TEST(UMTSScenarioTest, BothKindsOfRankedCellsAreReadFromTheSamePlace)
{
    bool hasGSMAlone = false;
    bool hasBoth = false;
    std::set<int> ranks;
    for (const TimedMessage& each : ofCode(tour(), 0x4005)) {
        const PhoneMessage& message = each.message;
        const unsigned umts = byteAt(message, 13);
        const unsigned gsm = byteAt(message, 14);
        EXPECT_GE(gsm, 1U);
        hasGSMAlone |= umts == 0;
        hasBoth |= umts > 0;
        for (unsigned i = 0; i < umts; ++i) {
            const std::size_t record = 15 + 10 * i;
            EXPECT_TRUE(isOfTown(true, wordAt(message, record), wordAt(message, record + 2)));
            const int power = static_cast<std::int8_t>(byteAt(message, record + 4)) - 21;
            EXPECT_GE(power, -120);
            EXPECT_LE(power, -75);
            EXPECT_EQ(signedWordAt(message, record + 5), power);
            const int quality = static_cast<std::int8_t>(byteAt(message, record + 7));
            EXPECT_GE(quality, -48);
            EXPECT_LE(quality, -6);
            ranks.insert(signedWordAt(message, record + 8));
        }
        for (unsigned i = 0; i < gsm; ++i) {
            const std::size_t record = 15 + 7 * i;
            const unsigned channel = wordAt(message, record);
            const unsigned colours = wordAt(message, record + 2);
            if (umts == 0) {
                EXPECT_TRUE(isOfTown(false, channel, colours));
            }
            EXPECT_LE(channel, 810U); // of the 1900 MHz band at most
            EXPECT_LE(colours, 63U);
            const int power = static_cast<std::int8_t>(byteAt(message, record + 4));
            EXPECT_GE(power, -120);
            EXPECT_LE(power, -54);
            EXPECT_LT(signedWordAt(message, record + 5), power);
        }
    }
    EXPECT_TRUE(hasGSMAlone);
    EXPECT_TRUE(hasBoth);
    EXPECT_GE(ranks.size(), 15U);
}

TEST(UMTSScenarioTest, GSMNeighboursHaveTheColoursOfTheirChannels)
{
    std::map<unsigned, unsigned> colours;
    std::set<unsigned> counts;
    std::set<unsigned> powers;
    std::size_t unknown = 0;
    for (const TimedMessage& each : tour()) {
        const PhoneMessage& message = each.message;
        if (message.kind != Kind::Modem)
            continue;
        if (message.code == 0x51FF) {
            colours.clear();
            for (unsigned i = 0; i < byteAt(message, 14); ++i)
                colours[wordAt(message, 15 + 4 * i)] = byteAt(message, 17 + 4 * i);
        }
        if (message.code != 0x5137)
            continue;
        counts.insert(byteAt(message, 28));
        powers.insert(byteAt(message, 15));
        EXPECT_EQ(longAt(message, 20), longAt(message, 16) + 4);
        for (unsigned i = 0; i < byteAt(message, 28); ++i) {
            const unsigned channel = wordAt(message, 29 + 14 * i);
            unknown += colours.contains(channel) ? 0 : 1;
            if (colours.contains(channel)) {
                EXPECT_TRUE(isOfTown(false, channel, colours[channel]));
            }
            EXPECT_GE(byteAt(message, 31 + 14 * i), 75U); // without the sign
            EXPECT_LE(byteAt(message, 31 + 14 * i), 120U);
        }
    }
    EXPECT_GE(counts.size(), 2U);
    EXPECT_GE(powers.size(), 10U);
    EXPECT_LT(unknown, 100U); // cells that have just come into range
}

TEST(UMTSScenarioTest, CountersOfBlocksGrow)
{
    unsigned receivedBefore = 0;
    unsigned damagedBefore = 0;
    for (const TimedMessage& each : ofCode(tour(), 0x4116)) {
        EXPECT_EQ(wordAt(each.message, 14), 100U);
        const std::size_t signalling = 16 + 9 * (byteAt(each.message, 13) - 1);
        EXPECT_EQ(byteAt(each.message, signalling), 24U);
        EXPECT_GT(longAt(each.message, signalling + 1), receivedBefore);
        EXPECT_GE(longAt(each.message, signalling + 5), damagedBefore);
        receivedBefore = longAt(each.message, signalling + 1);
        damagedBefore = longAt(each.message, signalling + 5);
    }
    EXPECT_GT(receivedBefore, 500U);
    EXPECT_GT(damagedBefore, 0U);
    EXPECT_LT(damagedBefore, receivedBefore / 4);
}

TEST(UMTSScenarioTest, TheFastDownlinkUsesOneCarrierOrTwo)
{
    std::set<unsigned> carriers;
    std::set<unsigned> bits;
    for (const TimedMessage& each : ofCode(tour(), 0x4221)) {
        const PhoneMessage& message = each.message;
        EXPECT_EQ(bitsAt(message, 14, 0, 10), 240U);
        const unsigned carrier = bitsAt(message, 14, 10, 2);
        carriers.insert(carrier);
        const unsigned primary = byteAt(message, 16);
        const unsigned secondary = byteAt(message, 17);
        EXPECT_EQ(secondary > 0, carrier == 2);
        for (unsigned i = 0; i < primary + secondary; ++i) {
            const std::size_t record =
                i < primary ? 18 + 9 * i : 18 + 162 * primary + 9 * (i - primary);
            EXPECT_EQ(byteAt(message, record), i % primary);
            bits.insert(longAt(message, record + 1));
            EXPECT_GE(longAt(message, record + 1), 1000U);
            EXPECT_LE(longAt(message, record + 1), 800000U);
            EXPECT_LE(wordAt(message, record + 5), 40U);
            EXPECT_LE(wordAt(message, record + 7), wordAt(message, record + 5));
        }
    }
    EXPECT_THAT(carriers, ElementsAre(0, 2));
    EXPECT_GE(bits.size(), 50U);
}

TEST(UMTSScenarioTest, ThePhoneSendsWithinItsPower)
{
    std::set<int> powers;
    for (const TimedMessage& each : ofCode(tour(), 0x4031))
        for (unsigned i = 0; i < byteAt(each.message, 14); ++i) {
            const int gain = signedWordAt(each.message, 16 + 14 * i + 4);
            const int power = (gain + 512) / 10 - 70;
            EXPECT_GE(power, -50);
            EXPECT_LE(power, 24);
            powers.insert(power);
        }
    EXPECT_GE(powers.size(), 15U);
}

TEST(UMTSScenarioTest, TheServerListsCellsOfBothNetworks)
{
    std::set<std::string> networks;
    for (const TimedMessage& each : ofCode(tour(), kCellsItem, Kind::Server)) {
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asArray());
        for (std::size_t i = 0; i < list.asArray()->size(); ++i) {
            const PropertyValue& cell = (*list.asArray())[i];
            EXPECT_EQ(cell[kTSCellMonitorCellType],
                      PropertyValue(i == 0 ? kTSCellMonitorCellTypeServing
                                           : kTSCellMonitorCellTypeNeighbor));
            for (const char* key :
                 {kTSCellMonitorMCC, kTSCellMonitorMNC, kTSCellMonitorLAC, kTSCellMonitorCellId})
                EXPECT_TRUE(cell[key].asInteger()) << key;
            const auto* network = cell[kTSCellMonitorCellRadioAccessTechnology].asString();
            ASSERT_TRUE(network);
            networks.insert(*network);
            if (*network == kTSCellMonitorRadioAccessTechnologyUMTS)
                for (const char* key : {kTSCellMonitorUARFCN, kTSCellMonitorSCN, kTSCellMonitorRSCP,
                                        kTSCellMonitorECN0})
                    EXPECT_TRUE(cell[key].asInteger()) << key;
            else
                for (const char* key : {kTSCellMonitorARFCN, kTSCellMonitorRSSI})
                    EXPECT_TRUE(cell[key].asInteger()) << key;
        }
    }
    EXPECT_THAT(networks, ElementsAre(kTSCellMonitorRadioAccessTechnologyGSM,
                                      kTSCellMonitorRadioAccessTechnologyUMTS));
}

TEST(UMTSScenarioTest, ASeedDecidesEverything)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s)));
    EXPECT_FALSE(sameMessages(drive(7, 60s), drive(8, 60s)));
}

TEST(UMTSScenarioTest, LongStepsMissNothing)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s, 1000ms)));
}

} // namespace
} // namespace orvane
