#include "telephonyd/phone/CDMAScenario.h"

#include "platform/base/TelephonyConstants.h"

#include "telephonyd/phone/CDMATown.h"
#include "telephonyd/support/PhoneTour.h"

#include <gmock/gmock.h>

#include <cmath>
#include <map>
#include <optional>

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
    CDMAScenario scenario(seed);
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
        {Kind::Modem, 0x108A},
        {Kind::Modem, 0x1183},
        {Kind::Modem, 0x1192},
        {Kind::Modem, 0x12B6},
        {Kind::Modem, 0x119C},
        {Kind::Modem, 0x119D},
        {Kind::Modem, 0x127E},
        {Kind::Modem, 0x134F},
    };
}

int signedByteAt(const PhoneMessage& message, std::size_t offset)
{
    return static_cast<std::int8_t>(byteAt(message, offset));
}

// Offsets of a status report's subpackets, by their identifiers.
std::map<unsigned, std::size_t> subpacketsOf(const PhoneMessage& message)
{
    std::map<unsigned, std::size_t> found;
    std::size_t at = 17;
    for (unsigned i = 0; i < byteAt(message, 14); ++i) {
        found[byteAt(message, at)] = at;
        at += wordAt(message, at + 2);
    }
    EXPECT_EQ(at, sizeOf(message));
    return found;
}

unsigned oneXStateOf(const PhoneMessage& status)
{
    return byteAt(status, subpacketsOf(status).at(1) + 4);
}

// Pilots of a status report with their strength in dB, calculated as receivers do.
std::map<unsigned, double> pilotsOf(const PhoneMessage& status)
{
    const std::size_t at = subpacketsOf(status).at(3);
    const double chips = wordAt(status, at + 4);
    const double sums = byteAt(status, at + 6);
    const double scale = std::exp2(2.0 * byteAt(status, at + 7) - 3);
    const std::size_t fingers = byteAt(status, at + 9);
    const std::size_t stride = (6 * fingers + 15) / 4 * 4;
    std::map<unsigned, double> found;
    for (std::size_t i = 0; i < byteAt(status, at + 8); ++i) {
        const std::size_t record = at + i * stride;
        const double energy = wordAt(status, record + 24 + 4 * fingers);
        found[wordAt(status, record + 12)] =
            10 * std::log10(scale * energy / (9 * sums * chips * chips) - 1 / chips);
    }
    return found;
}

bool isPilotOfTown(unsigned offset)
{
    return std::any_of(kCDMATown.begin(), kCDMATown.end(),
                       [&](const CDMACell& cell) { return cell.pilotOffset == offset; });
}

TEST(CDMAScenarioTest, TheFirstStepHasOneOfEverything)
{
    for (const unsigned seed : {1U, 2U, 3U, 4U, 5U}) {
        const Tour first = drive(seed, 0s);
        EXPECT_EQ(codesBetween(first, 0ms, 0ms), everything()) << "seed " << seed;
        EXPECT_EQ(first.size(), everything().size());
    }
    EXPECT_EQ(CDMAScenario(1).technology(), kTSLogChannelTechnology_Varnel_CDMA);
}

TEST(CDMAScenarioTest, EverythingComesAgainWithinAMinute)
{
    EXPECT_EQ(codesBetween(tour(), 40ms, 60s), everything());
}

TEST(CDMAScenarioTest, MessagesHaveTheirLengths)
{
    for (const TimedMessage& each : tour()) {
        const PhoneMessage& message = each.message;
        ASSERT_EQ(message.kind, Kind::Modem);
        std::size_t expected = 0;
        switch (message.code) {
        case 0x108A:
            expected = 23 + 14 * byteAt(message, 22);
            break;
        case 0x1183:
            expected = 50;
            break;
        case 0x1192:
            expected = 241;
            break;
        case 0x127E:
            expected = 1750;
            break;
        case 0x12B6:
            expected = 25 + 12 * byteAt(message, 15);
            break;
        case 0x134F:
            expected = 200;
            break;
        case 0x119C:
        case 0x119D:
            subpacketsOf(message);
            continue;
        default:
            FAIL() << "code " << message.code;
        }
        EXPECT_EQ(sizeOf(message), expected) << "code " << message.code;
    }
}

TEST(CDMAScenarioTest, AStatusHasTheFourSubpacketsAndAFrameItsOwn)
{
    for (const TimedMessage& each : ofCode(tour(), 0x119C)) {
        const auto found = subpacketsOf(each.message);
        ASSERT_EQ(found.size(), 4U);
        for (const unsigned id : {1U, 2U, 3U, 4U})
            EXPECT_TRUE(found.contains(id));
        EXPECT_EQ(wordAt(each.message, found.at(2) + 2), 14U);
    }
    for (const TimedMessage& each : ofCode(tour(), 0x119D)) {
        const auto found = subpacketsOf(each.message);
        ASSERT_TRUE(found.contains(11));
        EXPECT_GT(wordAt(each.message, found.at(11) + 2), 24U);
    }
}

TEST(CDMAScenarioTest, CallsComeAndGoThroughEveryStateOfTheSearchAfterThem)
{
    std::vector<unsigned> states;
    for (const TimedMessage& each : ofCode(tour(), 0x119C))
        if (const unsigned state = oneXStateOf(each.message);
            states.empty() || states.back() != state)
            states.push_back(state);
    EXPECT_GE(std::count(states.begin(), states.end(), 8), 8);
    const auto traffic = std::find(states.begin(), states.end(), 8);
    ASSERT_GT(states.end() - traffic, 6);
    EXPECT_THAT(std::vector<unsigned>(traffic, traffic + 7), ElementsAre(8, 2, 3, 4, 5, 6, 7));
}

TEST(CDMAScenarioTest, FramesOfVoiceAreReportedInTrafficAloneAndFewAreDamaged)
{
    unsigned state = 0;
    int damaged = 0;
    int all = 0;
    for (const TimedMessage& each : tour()) {
        if (each.message.code == 0x119C)
            state = oneXStateOf(each.message);
        if (each.message.code != 0x119D || each.at == 0ms)
            continue;
        EXPECT_EQ(state, 8U);
        ++all;
        damaged += byteAt(each.message, 41) != 0 ? 1 : 0;
    }
    EXPECT_GT(all, 500);
    EXPECT_GT(damaged, all / 500);
    EXPECT_LT(damaged, all / 8);
}

TEST(CDMAScenarioTest, TheActiveSetGrowsAndShrinksInTrafficAndIsOneCellElse)
{
    std::set<std::size_t> inTraffic;
    std::set<unsigned> references;
    for (const TimedMessage& each : ofCode(tour(), 0x119C)) {
        const auto pilots = pilotsOf(each.message);
        const unsigned reference = wordAt(each.message, subpacketsOf(each.message).at(3) + 10);
        EXPECT_TRUE(pilots.contains(reference));
        references.insert(reference);
        for (const auto& [offset, strength] : pilots) {
            EXPECT_TRUE(isPilotOfTown(offset)) << offset;
            EXPECT_LT(strength, -4);
            EXPECT_GT(strength, -24);
        }
        if (oneXStateOf(each.message) == 8)
            inTraffic.insert(pilots.size());
        else
            EXPECT_EQ(pilots.size(), 1U);
    }
    EXPECT_THAT(inTraffic, IsSupersetOf({1U, 2U, 3U}));
    EXPECT_LE(*inTraffic.rbegin(), 6U);
    EXPECT_GE(references.size(), 10U);
}

TEST(CDMAScenarioTest, LevelsArePlausibleAndMove)
{
    std::set<int> received;
    std::set<int> sent;
    for (const TimedMessage& each : ofCode(tour(), 0x1183)) {
        received.insert(signedByteAt(each.message, 15));
        EXPECT_LT(signedByteAt(each.message, 16), signedByteAt(each.message, 15));
        sent.insert(signedByteAt(each.message, 17));
    }
    EXPECT_GT(received.size(), 15U);
    EXPECT_GE(*received.begin(), -104);
    EXPECT_LE(*received.rbegin(), -60);
    EXPECT_GT(sent.size(), 15U);
    EXPECT_LE(*sent.rbegin(), 25);
    std::set<int> gains;
    for (const TimedMessage& each : ofCode(tour(), 0x119C))
        gains.insert(signedByteAt(each.message, subpacketsOf(each.message).at(2) + 10));
    EXPECT_GT(gains.size(), 40U);
}

TEST(CDMAScenarioTest, WhileACallLastsEvdoIsNotFound)
{
    unsigned oneX = 0;
    std::set<unsigned> states;
    std::set<unsigned> pilotCounts;
    std::optional<unsigned> evdo;
    for (const TimedMessage& each : tour()) {
        const PhoneMessage& message = each.message;
        if (message.code == 0x119C)
            oneX = oneXStateOf(message);
        if (message.code == 0x1183) {
            evdo = byteAt(message, 36);
            states.insert(*evdo);
            EXPECT_EQ(*evdo == 0, oneX == 8);
            EXPECT_EQ(wordAt(message, 18) == 0xFFFF, *evdo < 2);
        }
        if (message.code == 0x12B6) {
            pilotCounts.insert(byteAt(message, 15));
            EXPECT_EQ(byteAt(message, 15) == 0, *evdo < 2);
        }
        if (message.code == 0x108A) {
            EXPECT_EQ(wordAt(message, 23) == 0xFFFF, *evdo < 2);
        }
    }
    EXPECT_THAT(states, ElementsAre(0, 1, 2, 3, 4, 5));
    EXPECT_THAT(pilotCounts, IsSupersetOf({0U, 1U, 2U, 3U}));
}

TEST(CDMAScenarioTest, EverySubnetNegotiatesItsSessionWithAnIdentifierOfItsOwn)
{
    std::set<unsigned> sessions;
    std::map<unsigned, std::set<unsigned>> identifiersOfColour;
    unsigned changes = 0;
    unsigned before = 0;
    for (const TimedMessage& each : ofCode(tour(), 0x1183)) {
        sessions.insert(byteAt(each.message, 37));
        const unsigned identifier = bitsAt(each.message, 38, 0, 24);
        changes += identifier != before ? 1 : 0;
        before = identifier;
        identifiersOfColour[byteAt(each.message, 41)].insert(identifier);
    }
    EXPECT_THAT(sessions, ElementsAre(0, 1, 2, 3, 4));
    EXPECT_EQ(identifiersOfColour.size(), 3U);
    EXPECT_GE(changes, 4U);
}

TEST(CDMAScenarioTest, FingersAreLockedOnPilotsOfTheTownOrNone)
{
    std::set<unsigned> locked;
    std::set<unsigned> ratios;
    for (const TimedMessage& each : ofCode(tour(), 0x108A))
        for (std::size_t i = 0; i < byteAt(each.message, 22); ++i) {
            const unsigned offset = wordAt(each.message, 23 + 14 * i);
            if (offset == 0xFFFF)
                continue;
            EXPECT_TRUE(isPilotOfTown(offset)) << offset;
            locked.insert(offset);
            const unsigned ratio = wordAt(each.message, 23 + 14 * i + 6);
            EXPECT_GT(ratio, 0U);
            ratios.insert(ratio);
        }
    EXPECT_GE(locked.size(), 10U);
    EXPECT_GT(ratios.size(), 200U);
}

// The counters of a message, one after the other.
std::vector<std::uint32_t> countersOf(const PhoneMessage& message)
{
    const bool isForward = message.code == 0x1192;
    const std::size_t first = isForward ? 17 : 18;
    const std::size_t end = isForward ? 241 : 1746;
    std::vector<std::uint32_t> counters;
    for (std::size_t at = first; at < end; at += 4)
        counters.push_back(longAt(message, at));
    return counters;
}

TEST(CDMAScenarioTest, TrafficIsCountedUpWithTheSecondsAndAtTimesRests)
{
    for (const std::uint16_t code : {std::uint16_t{0x1192}, std::uint16_t{0x127E}}) {
        std::vector<std::uint32_t> before;
        std::uint32_t secondsBefore = 0;
        int grown = 0;
        int rested = 0;
        for (const TimedMessage& each : ofCode(tour(), code)) {
            const std::uint32_t seconds = longAt(each.message, code == 0x1192 ? 13 : 14);
            const auto counters = countersOf(each.message);
            EXPECT_EQ(milliseconds(seconds * 1000), each.at);
            if (!before.empty()) {
                EXPECT_GT(seconds, secondsBefore);
                for (std::size_t i = 0; i < counters.size(); ++i)
                    EXPECT_GE(counters[i], before[i]);
                ++(counters == before ? rested : grown);
            }
            before = counters;
            secondsBefore = seconds;
        }
        EXPECT_GT(grown, 60);
        EXPECT_GT(rested, 60);
        EXPECT_GE(std::count_if(before.begin(), before.end(), [](auto count) { return count > 0; }),
                  20);
    }
}

TEST(CDMAScenarioTest, TheSystemIsToldWithEveryCellAndChangesOnTheWay)
{
    std::set<unsigned> bases;
    std::set<unsigned> systems;
    std::set<unsigned> indicators;
    for (const TimedMessage& each : ofCode(tour(), 0x134F)) {
        const PhoneMessage& message = each.message;
        EXPECT_EQ(byteAt(message, 13), 2U);
        EXPECT_EQ(longAt(message, 46), 2U);
        const unsigned base = wordAt(message, 184);
        const auto* cell = std::find_if(kCDMATown.begin(), kCDMATown.end(),
                                        [&](const CDMACell& one) { return one.baseId == base; });
        ASSERT_NE(cell, kCDMATown.end());
        EXPECT_EQ(wordAt(message, 50), cell->area.systemId);
        EXPECT_EQ(wordAt(message, 52), cell->area.networkId);
        EXPECT_EQ(byteAt(message, 131), cell->area.packetZone);
        EXPECT_EQ(byteAt(message, 133), 6U);
        bases.insert(base);
        systems.insert(cell->area.systemId);
        indicators.insert(longAt(message, 42));
    }
    EXPECT_GE(bases.size(), 10U);
    EXPECT_EQ(systems.size(), 2U);
    EXPECT_THAT(indicators, ElementsAre(0, 8));
}

TEST(CDMAScenarioTest, ASeedDecidesEverything)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s)));
    EXPECT_FALSE(sameMessages(drive(7, 60s), drive(8, 60s)));
}

TEST(CDMAScenarioTest, LongStepsMissNothing)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s, 1000ms)));
}

} // namespace
} // namespace orvane
