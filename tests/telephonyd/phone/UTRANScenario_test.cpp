#include "telephonyd/phone/UTRANScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "telephonyd/phone/ServerItems.h"
#include "telephonyd/phone/UTRANTown.h"
#include "telephonyd/support/PhoneTour.h"

#include <gmock/gmock.h>

#include <map>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using std::chrono::milliseconds;
using testing::ElementsAre;
using Kind = PhoneMessage::Kind;

Tour drive(std::uint64_t seed, std::chrono::seconds duration, milliseconds step = 40ms)
{
    UTRANScenario scenario(seed);
    return tourOf(scenario, duration, step);
}

// One tour through the town, for all tests.
const Tour& tour()
{
    static const Tour messages = drive(1, 720s);
    return messages;
}

std::set<std::pair<Kind, unsigned>> everything()
{
    return {
        {Kind::Modem,  0xD0E0},
        {Kind::Modem,  0xD0E2},
        {Kind::Modem,  0xD00A},
        {Kind::Modem,  0xD00C},
        {Kind::Modem,  0xD00E},
        {Kind::Server, 0     },
        {Kind::Server, 1     },
        {Kind::Server, 2     },
    };
}

const UTRANCell* cellOfIdentity(unsigned identity)
{
    const auto* found =
        std::find_if(kUTRANTown.begin(), kUTRANTown.end(),
                     [&](const UTRANCell& cell) { return cell.cellIdentity == identity; });
    return found == kUTRANTown.end() ? nullptr : found;
}

TEST(UTRANScenarioTest, TheFirstStepHasOneOfEverything)
{
    for (const unsigned seed : {1U, 2U, 3U, 4U, 5U})
        EXPECT_EQ(codesBetween(drive(seed, 0s), 0ms, 0ms), everything()) << "seed " << seed;
    EXPECT_EQ(UTRANScenario(1).technology(), kTSLogChannelTechnology_Varnel_UTRAN2);
}

TEST(UTRANScenarioTest, TheFirstListsAreNotEmpty)
{
    EXPECT_GE(byteAt(ofCode(tour(), 0xD00A).front().message, 16) >> 1, 1U);
    const PhoneMessage quality = ofCode(tour(), 0xD00C).front().message;
    EXPECT_GE(bitsAt(quality, 14, 6, 6), 1U);
    EXPECT_GE(bitsAt(quality, 14, 12, 4), 1U);
}

TEST(UTRANScenarioTest, EverythingButTheCardComesAgainWithinTwoMinutes)
{
    auto expected = everything();
    expected.erase({Kind::Server, 0});
    EXPECT_EQ(codesBetween(tour(), 40ms, 120s), expected);
    EXPECT_EQ(ofCode(tour(), kSimFilesItem, Kind::Server).size(), 1U);
}

TEST(UTRANScenarioTest, MessagesHaveTheirLengths)
{
    for (const TimedMessage& each : tour()) {
        const PhoneMessage& message = each.message;
        if (message.kind != Kind::Modem)
            continue;
        std::size_t expected = 0;
        switch (message.code) {
        case 0xD0E0:
            expected = 15;
            break;
        case 0xD0E2:
            expected = 26;
            break;
        case 0xD00A:
            expected = 168 + 16 * (byteAt(message, 16) >> 1);
            break;
        case 0xD00E:
            expected = 17 + 8 * byteAt(message, 16);
            break;
        case 0xD00C:
            expected = 289 + 34 * bitsAt(message, 14, 6, 6) + 8 * bitsAt(message, 14, 12, 4);
            break;
        default:
            FAIL() << "code " << message.code;
        }
        EXPECT_EQ(sizeOf(message), expected) << "code " << message.code;
    }
}

TEST(UTRANScenarioTest, TheServingCellIsOneOfTheTownAndChanges)
{
    std::set<unsigned> cells;
    std::set<unsigned> areas;
    for (const TimedMessage& each : ofCode(tour(), 0xD0E2)) {
        const UTRANCell* cell = cellOfIdentity(longAt(each.message, 21));
        ASSERT_TRUE(cell);
        EXPECT_EQ(byteAt(each.message, 14), cell->restrictedClasses);
        EXPECT_EQ(byteAt(each.message, 15), cell->registrationArea);
        EXPECT_EQ(wordAt(each.message, 17), cell->channel);
        EXPECT_EQ(wordAt(each.message, 19), cell->channel);
        cells.insert(cell->cellIdentity);
        areas.insert(cell->registrationArea);
    }
    EXPECT_GE(cells.size(), 10U);
    EXPECT_THAT(areas, ElementsAre(1, 2, 3));
}

TEST(UTRANScenarioTest, InANewLocationAreaThereAreEmergencyCallsOnlyUntilThePhoneIsRegistered)
{
    const Tour changes = ofCode(tour(), 0xD0E2);
    const auto area = [](const TimedMessage& each) {
        return cellOfIdentity(longAt(each.message, 21))->locationArea;
    };
    int registrations = 0;
    EXPECT_EQ(byteAt(changes.front().message, 25) & 1, 0U);
    for (std::size_t i = 1; i + 1 < changes.size(); ++i) {
        if (area(changes[i]) == area(changes[i - 1]))
            continue;
        EXPECT_EQ(byteAt(changes[i].message, 25) & 1, 1U);
        const auto allowed = std::find_if(
            changes.begin() + static_cast<std::ptrdiff_t>(i), changes.end(),
            [](const TimedMessage& each) { return (byteAt(each.message, 25) & 1) == 0; });
        ASSERT_NE(allowed, changes.end());
        EXPECT_LE(allowed->at - changes[i].at, 2s);
        ++registrations;
    }
    EXPECT_GE(registrations, 3);
}

TEST(UTRANScenarioTest, AllRadioStatesAreReportedAsValidOnes)
{
    std::set<unsigned> states;
    for (const TimedMessage& each : ofCode(tour(), 0xD0E0)) {
        EXPECT_EQ(byteAt(each.message, 13), 1U);
        states.insert(byteAt(each.message, 14));
    }
    EXPECT_THAT(states, ElementsAre(0, 1, 2, 3, 4, 5));
}

TEST(UTRANScenarioTest, NeighboursComeAndGoAndMove)
{
    std::set<unsigned> counts;
    std::set<unsigned> sets;
    std::set<unsigned> joint;
    std::set<unsigned> powers;
    for (const TimedMessage& each : ofCode(tour(), 0xD00A)) {
        const unsigned count = byteAt(each.message, 16) >> 1;
        counts.insert(count);
        for (unsigned i = 0; i < count; ++i) {
            const std::size_t record = 168 + 16 * i;
            const unsigned channel = bitsAt(each.message, record, 0, 14);
            const unsigned parameter = bitsAt(each.message, record, 14, 7);
            EXPECT_TRUE(
                std::any_of(kUTRANTown.begin(), kUTRANTown.end(), [&](const UTRANCell& cell) {
                    return cell.channel == channel && cell.cellParameter == parameter;
                }));
            const unsigned set = bitsAt(each.message, record, 29, 2);
            EXPECT_EQ(set == 0, i == 0 && set == 0) << "the active set is the first cell alone";
            powers.insert(bitsAt(each.message, record, 21, 8));
            sets.insert(set);
            joint.insert(bitsAt(each.message, record, 31, 1));
        }
    }
    EXPECT_GE(counts.size(), 4U);
    EXPECT_THAT(sets, ElementsAre(0, 1, 2));
    EXPECT_THAT(joint, ElementsAre(0, 1));
    EXPECT_GT(powers.size(), 60U);
    EXPECT_LT(*powers.rbegin(), 181U); // -75 dBm
}

TEST(UTRANScenarioTest, GSMNeighboursArePlausible)
{
    std::set<unsigned> counts;
    for (const TimedMessage& each : ofCode(tour(), 0xD00E)) {
        const unsigned count = byteAt(each.message, 16);
        counts.insert(count);
        for (unsigned i = 0; i < count; ++i) {
            const std::size_t record = 17 + 8 * i;
            EXPECT_EQ(bitsAt(each.message, record, 15, 1), 1U);
            EXPECT_LE(byteAt(each.message, record + 2), 7U);
            EXPECT_LE(byteAt(each.message, record + 3), 7U);
            EXPECT_LE(wordAt(each.message, record + 4), 124U);
            EXPECT_GE(signedWordAt(each.message, record + 6), -114);
            EXPECT_LE(signedWordAt(each.message, record + 6), -69);
        }
    }
    EXPECT_GE(counts.size(), 3U);
}

TEST(UTRANScenarioTest, ChannelQualityFollowsTheRadioState)
{
    std::map<unsigned, std::set<unsigned>> channelsOfState;
    std::set<unsigned> damaged;
    std::set<unsigned> ratios;
    unsigned state = 0;
    for (const TimedMessage& each : tour()) {
        const PhoneMessage& message = each.message;
        if (message.kind != Kind::Modem)
            continue;
        if (message.code == 0xD0E0)
            state = byteAt(message, 14);
        if (message.code != 0xD00C)
            continue;
        const unsigned transport = bitsAt(message, 14, 6, 6);
        const unsigned coded = bitsAt(message, 14, 12, 4);
        channelsOfState[state].insert(transport);
        for (unsigned i = 0; i < transport; ++i) {
            EXPECT_LE(byteAt(message, 17 + 2 * i), 32U);
            EXPECT_LE(byteAt(message, 18 + 2 * i), 40U);
            damaged.insert(byteAt(message, 18 + 2 * i));
        }
        for (unsigned i = 0; i < coded; ++i) {
            const std::size_t record = 289 + 34 * transport + 8 * i;
            EXPECT_EQ(byteAt(message, record), i + 1);
            EXPECT_LE(byteAt(message, record + 1), 6U);
            for (std::size_t value = 0; value < 6; ++value) {
                EXPECT_LE(byteAt(message, record + 2 + value), 27U);
                ratios.insert(byteAt(message, record + 2 + value));
            }
        }
    }
    EXPECT_THAT(channelsOfState[0], ElementsAre(1)); // the paging channel
    EXPECT_THAT(channelsOfState[2], ElementsAre(2));
    EXPECT_THAT(channelsOfState[3], ElementsAre(2, 4)); // data and calls
    EXPECT_GE(damaged.size(), 5U);
    EXPECT_GE(ratios.size(), 10U);
}

TEST(UTRANScenarioTest, TheServerListsTheCellsOnceASecond)
{
    const Tour lists = ofCode(tour(), kCellsItem, Kind::Server);
    EXPECT_GE(lists.size(), 720U);
    for (std::size_t i = 1; i < lists.size(); ++i)
        EXPECT_LE(lists[i].at - lists[i - 1].at, 1s);
    for (const TimedMessage& each : lists) {
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asArray());
        for (std::size_t i = 0; i < list.asArray()->size(); ++i) {
            const PropertyValue& cell = (*list.asArray())[i];
            EXPECT_EQ(cell[kTSCellMonitorCellRadioAccessTechnology],
                      PropertyValue(kTSCellMonitorRadioAccessTechnologyUTRAN2));
            EXPECT_EQ(cell[kTSCellMonitorCellType],
                      PropertyValue(i == 0 ? kTSCellMonitorCellTypeServing
                                           : kTSCellMonitorCellTypeNeighbor));
            for (const char* key : {kTSCellMonitorLAC, kTSCellMonitorCellId, kTSCellMonitorBandInfo,
                                    kTSCellMonitorSCN, kTSCellMonitorUARFCN})
                EXPECT_TRUE(cell[key].asInteger()) << key;
        }
    }
}

TEST(UTRANScenarioTest, TheDataConnectionComesAndGoesWithAnotherAddressEachTime)
{
    std::set<std::string> addresses;
    std::set<std::size_t> counts;
    for (const TimedMessage& each : ofCode(tour(), kDataConnectionsItem, Kind::Server)) {
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asArray());
        counts.insert(list.asArray()->size());
        if (list.asArray()->size() == 2)
            addresses.insert(*(*list.asArray())[1]["IP Address"].asString());
    }
    EXPECT_THAT(counts, ElementsAre(1, 2));
    EXPECT_GE(addresses.size(), 5U);
}

TEST(UTRANScenarioTest, ASeedDecidesEverything)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s)));
    EXPECT_FALSE(sameMessages(drive(7, 60s), drive(8, 60s)));
}

TEST(UTRANScenarioTest, LongStepsMissNothing)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s, 1000ms)));
}

} // namespace
} // namespace orvane
