#include "telephonyd/phone/LTEScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "platform/plist/PropertyList.h"
#include "telephonyd/phone/ServerItems.h"

#include <gmock/gmock.h>

#include <cmath>
#include <map>
#include <set>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using std::chrono::milliseconds;
using testing::ElementsAre;
using Kind = PhoneMessage::Kind;

constexpr std::size_t kHeaderBytes = 13;

// An offset into the whole message, as receivers count it.
unsigned byteAt(const PhoneMessage& message, std::size_t offset)
{
    return message.payload.at(offset - kHeaderBytes);
}
unsigned wordAt(const PhoneMessage& message, std::size_t offset)
{
    return byteAt(message, offset) | byteAt(message, offset + 1) << 8;
}
// `width` bits from bit `bit` of the byte at `offset` on.
unsigned bitsAt(const PhoneMessage& message, std::size_t offset, unsigned bit, unsigned width)
{
    unsigned value = 0;
    for (unsigned i = 0; i < width; ++i) {
        const unsigned at = bit + i;
        value |= (byteAt(message, offset + at / 8) >> at % 8 & 1U) << i;
    }
    return value;
}
std::size_t sizeOf(const PhoneMessage& message) { return kHeaderBytes + message.payload.size(); }

struct Timed {
    milliseconds at;
    PhoneMessage message;
};

std::vector<Timed> drive(std::uint64_t seed, std::chrono::seconds duration,
                         milliseconds step = 40ms)
{
    LTEScenario scenario(seed);
    std::vector<Timed> found;
    for (milliseconds now{0}; now <= duration; now += step)
        for (PhoneMessage& message : scenario.step(now))
            found.push_back({now, std::move(message)});
    return found;
}

// One tour through the town, for all tests.
const std::vector<Timed>& tour()
{
    static const std::vector<Timed> messages = drive(1, 720s);
    return messages;
}

std::vector<Timed> ofCode(std::uint16_t code, Kind kind = Kind::Modem)
{
    std::vector<Timed> found;
    for (const Timed& each : tour())
        if (each.message.kind == kind && each.message.code == code)
            found.push_back(each);
    return found;
}

PropertyValue listOf(const Timed& item) { return readPropertyList(item.message.payload).value; }

std::set<std::pair<Kind, unsigned>> everything()
{
    return {
        {Kind::Modem,  0xB0C2},
        {Kind::Modem,  0xB0C1},
        {Kind::Modem,  0xB179},
        {Kind::Modem,  0xB17F},
        {Kind::Modem,  0xB180},
        {Kind::Modem,  0xB186},
        {Kind::Server, 0     },
        {Kind::Server, 1     },
        {Kind::Server, 2     },
    };
}

TEST(LTEScenarioTest, TheFirstStepHasOneOfEverything)
{
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        std::set<std::pair<Kind, unsigned>> found;
        for (const PhoneMessage& message : LTEScenario(seed).step(0ms))
            found.insert({message.kind, message.code});
        EXPECT_EQ(found, everything()) << "seed " << seed;
    }
    EXPECT_EQ(LTEScenario(1).technology(), kTSLogChannelTechnology_Varnel_LTE);
}

TEST(LTEScenarioTest, EverythingButTheCardComesAgainWithinThreeMinutes)
{
    std::set<std::pair<Kind, unsigned>> found;
    for (const Timed& each : tour())
        if (each.at > 0ms && each.at < 180s)
            found.insert({each.message.kind, each.message.code});
    auto expected = everything();
    expected.erase({Kind::Server, 0});
    EXPECT_EQ(found, expected);
    EXPECT_EQ(ofCode(kSimFilesItem, Kind::Server).size(), 1U);
}

TEST(LTEScenarioTest, MessagesHaveTheirLengths)
{
    for (const Timed& each : tour()) {
        const PhoneMessage& message = each.message;
        if (message.kind != Kind::Modem)
            continue;
        std::size_t expected = 0;
        switch (message.code) {
        case 0xB0C2:
            expected = 38;
            break;
        case 0xB0C1:
            expected = 22;
            break;
        case 0xB179:
            expected = 29 + 6 * byteAt(message, 27) + 2 * byteAt(message, 28);
            break;
        case 0xB17F:
            expected = 33;
            break;
        case 0xB180:
            expected = 21 + 20 * (bitsAt(message, 19, 6, 5) + 1);
            break;
        case 0xB186: {
            const unsigned technology = wordAt(message, 23);
            ASSERT_LE(technology, 4U);
            expected = technology < 3 ? 29 : 33;
            break;
        }
        default:
            FAIL() << "code " << message.code;
        }
        EXPECT_EQ(sizeOf(message), expected) << "code " << message.code;
    }
}

TEST(LTEScenarioTest, TheServingCellIsOneOfTheTown)
{
    std::set<unsigned> bandwidths;
    std::set<unsigned> areas;
    for (const Timed& each : ofCode(0xB0C2)) {
        const auto cell =
            std::find_if(kLTETown.begin(), kLTETown.end(), [&](const LTECell& candidate) {
                return candidate.physicalCellId == wordAt(each.message, 14);
            });
        ASSERT_NE(cell, kLTETown.end());
        EXPECT_EQ(wordAt(each.message, 16), cell->earfcn);
        EXPECT_EQ(wordAt(each.message, 18), cell->earfcn + 18000U);
        EXPECT_EQ(byteAt(each.message, 20), cell->resourceBlocks);
        EXPECT_EQ(byteAt(each.message, 21), cell->resourceBlocks);
        EXPECT_EQ(wordAt(each.message, 22) | wordAt(each.message, 24) << 16, cell->cellIdentity);
        EXPECT_EQ(wordAt(each.message, 26), cell->trackingAreaCode);
        EXPECT_EQ(wordAt(each.message, 28), cell->band);
        EXPECT_EQ(wordAt(each.message, 30), 0U);
        bandwidths.insert(byteAt(each.message, 20));
        areas.insert(wordAt(each.message, 26));
    }
    EXPECT_THAT(bandwidths, ElementsAre(6, 15, 25, 50, 75, 100));
    EXPECT_GE(areas.size(), 3U);
}

TEST(LTEScenarioTest, ThePhoneChangesCellsAndSaysSoAtOnce)
{
    const auto changes = ofCode(0xB0C2);
    ASSERT_GE(changes.size(), 10U);
    EXPECT_LT(changes[1].at, 120s);
    for (std::size_t i = 1; i < changes.size(); ++i) {
        EXPECT_NE(wordAt(changes[i].message, 14), wordAt(changes[i - 1].message, 14));
        const auto sameTime = [&](std::uint16_t code, Kind kind) {
            const auto found = ofCode(code, kind);
            return std::any_of(found.begin(), found.end(),
                               [&](const Timed& each) { return each.at == changes[i].at; });
        };
        EXPECT_TRUE(sameTime(0xB0C1, Kind::Modem));
        EXPECT_TRUE(sameTime(kCellsItem, Kind::Server));
    }
}

TEST(LTEScenarioTest, ServingLevelsArePlausibleAndAgree)
{
    std::set<unsigned> powers;
    std::set<double> qualities;
    std::optional<double> before;
    unsigned cellBefore = 0;
    for (const Timed& each : ofCode(0xB17F)) {
        const PhoneMessage& message = each.message;
        const unsigned cell = bitsAt(message, 19, 0, 9);
        const double power = bitsAt(message, 21, 0, 9) * 0.25 - 140;
        const double average = bitsAt(message, 22, 1, 9) * 0.25 - 140;
        const double quality = bitsAt(message, 23, 2, 7) * 0.25 - 30;
        const double averageQuality = bitsAt(message, 24, 1, 7) * 0.25 - 30;
        const double total = bitsAt(message, 25, 0, 9) * 0.5 - 140;
        const int least = static_cast<int>(bitsAt(message, 26, 1, 6)) * 2 - 140;
        const int level = static_cast<int>(bitsAt(message, 29, 0, 7)) - 30;
        for (const double one : {power, average}) {
            EXPECT_GE(one, -120);
            EXPECT_LE(one, -75);
        }
        for (const double one : {quality, averageQuality}) {
            EXPECT_GE(one, -17);
            EXPECT_LE(one, -6);
        }
        EXPECT_GT(total, power); // it is the sum of all
        EXPECT_LT(total, -20);
        EXPECT_NEAR(level, average - least, 1);
        EXPECT_EQ(bitsAt(message, 27, 6, 6), 53U); // 23 dBm
        if (before && cell == cellBefore && average > -110) {
            EXPECT_LT(std::abs(average - *before), 25); // phases lie between
        }
        before = average;
        cellBefore = cell;
        powers.insert(bitsAt(message, 21, 0, 9));
        qualities.insert(quality);
    }
    EXPECT_GT(powers.size(), 40U); // values move
    EXPECT_GT(qualities.size(), 12U);
}

TEST(LTEScenarioTest, AnIdlePhoneReportsItsCellEvery640MillisecondsAndItsNeighboursEvery1280)
{
    const auto regular = [](std::uint16_t code, milliseconds period) {
        const auto found = ofCode(code);
        std::size_t atPeriod = 0;
        for (std::size_t i = 1; i < found.size(); ++i)
            atPeriod += found[i].at - found[i - 1].at == period ? 1 : 0;
        return static_cast<double>(atPeriod) / static_cast<double>(found.size());
    };
    EXPECT_GT(regular(0xB17F, 640ms), 0.9);
    EXPECT_GT(regular(0xB180, 1280ms), 0.85);
    EXPECT_GT(regular(0xB179, 240ms), 0.9);
}

TEST(LTEScenarioTest, IdleAndConnectedPhasesTakeTurns)
{
    // The phase of each second, by the messages sent in it.
    std::map<std::int64_t, char> seconds;
    for (const Timed& each : tour())
        if (each.at > 0ms && each.message.kind == Kind::Modem) {
            char& kind = seconds[each.at / 1s];
            if (each.message.code == 0xB179)
                kind = kind == 'i' ? 'x' : 'c';
            else if (each.message.code == 0xB17F)
                kind = kind == 'c' ? 'x' : 'i';
        }
    std::map<char, int> counts;
    for (const auto& [second, kind] : seconds)
        ++counts[kind];
    EXPECT_GT(counts['i'], 200);
    EXPECT_GT(counts['c'], 200);
    EXPECT_LT(counts['x'], 60); // only where the phase changes
}

TEST(LTEScenarioTest, NeighboursComeAndGo)
{
    std::set<unsigned> measured;
    std::set<unsigned> detected;
    for (const Timed& each : ofCode(0xB179)) {
        measured.insert(byteAt(each.message, 27));
        detected.insert(byteAt(each.message, 28));
        for (unsigned i = 0; i < byteAt(each.message, 27); ++i) {
            const double power = wordAt(each.message, 29 + 6 * i + 2) * 0.25 - 140;
            EXPECT_GE(power, -120);
            EXPECT_LE(power, -75);
            EXPECT_NE(wordAt(each.message, 29 + 6 * i), wordAt(each.message, 19));
        }
    }
    EXPECT_GE(measured.size(), 2U);
    EXPECT_GE(detected.size(), 2U);

    std::set<unsigned> counts;
    for (const Timed& each : ofCode(0xB180)) {
        const unsigned count = bitsAt(each.message, 19, 6, 5) + 1;
        counts.insert(count);
        for (unsigned i = 0; i < count; ++i) {
            const std::size_t record = 21 + 20 * i;
            const double average = bitsAt(each.message, record + 4, 0, 9) * 0.5 - 140;
            const double quality = bitsAt(each.message, record + 6, 0, 7) * 0.25 - 30;
            EXPECT_GE(average, -120);
            EXPECT_LE(average, -75);
            EXPECT_GE(quality, -17);
            EXPECT_LE(quality, -6);
            EXPECT_EQ(bitsAt(each.message, record + 12, 0, 32),
                      bitsAt(each.message, record + 16, 0, 32)); // both antennas
        }
    }
    EXPECT_GE(counts.size(), 3U);
}

TEST(LTEScenarioTest, ReselectionCandidatesAreOfEveryTechnology)
{
    std::set<unsigned> technologies;
    for (const Timed& each : ofCode(0xB186)) {
        EXPECT_EQ(wordAt(each.message, 19), 1U);
        technologies.insert(wordAt(each.message, 23));
        if (wordAt(each.message, 23) == 0) {
            const unsigned cell = wordAt(each.message, 27) >> 7;
            EXPECT_TRUE(std::any_of(kLTETown.begin(), kLTETown.end(), [&](const LTECell& one) {
                return one.physicalCellId == cell && one.earfcn == wordAt(each.message, 25);
            }));
        }
    }
    EXPECT_THAT(technologies, ElementsAre(0, 1, 2, 3, 4));
}

TEST(LTEScenarioTest, TheServerListsTheCellsOnceASecond)
{
    const auto lists = ofCode(kCellsItem, Kind::Server);
    std::size_t regular = 0;
    for (std::size_t i = 1; i < lists.size(); ++i) {
        EXPECT_LE(lists[i].at - lists[i - 1].at, 1s);
        regular += lists[i].at % 1s == 0ms ? 1 : 0;
    }
    EXPECT_EQ(regular, 720U);
    for (const Timed& each : lists) {
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asArray());
        const PropertyValue& serving = (*list.asArray())[0];
        EXPECT_EQ(serving[kTSCellMonitorCellRadioAccessTechnology],
                  PropertyValue(kTSCellMonitorRadioAccessTechnologyLTE));
        EXPECT_EQ(serving[kTSCellMonitorCellType], PropertyValue(kTSCellMonitorCellTypeServing));
        for (const char* key : {kTSCellMonitorTAC, kTSCellMonitorCellId, kTSCellMonitorPID,
                                kTSCellMonitorBandInfo, kTSCellMonitorUARFCN})
            EXPECT_TRUE(serving[key].asInteger()) << key;
        for (std::size_t i = 1; i < list.asArray()->size(); ++i)
            EXPECT_EQ((*list.asArray())[i][kTSCellMonitorCellType],
                      PropertyValue(kTSCellMonitorCellTypeNeighbor));
    }
}

TEST(LTEScenarioTest, TheDataConnectionComesAndGoesWithAnotherAddressEachTime)
{
    std::set<std::string> addresses;
    std::set<std::size_t> counts;
    for (const Timed& each : ofCode(kDataConnectionsItem, Kind::Server)) {
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asArray());
        counts.insert(list.asArray()->size());
        for (const PropertyValue& connection : *list.asArray())
            for (const char* key : {"APN", "IP Address", "State", "QCI"})
                ASSERT_TRUE(connection[key].asString()) << key;
        if (list.asArray()->size() == 2)
            addresses.insert(*(*list.asArray())[1]["IP Address"].asString());
    }
    EXPECT_THAT(counts, ElementsAre(1, 2));
    EXPECT_GE(addresses.size(), 3U);
}

TEST(LTEScenarioTest, TheCardsFilesAreTextAndData)
{
    const PropertyValue files = listOf(ofCode(kSimFilesItem, Kind::Server).front());
    for (const char* key : {"kSimFile_ICCID", "kSimFile_MSISDN", "kSimFile_MBDN", "kSimFile_HPPLMN",
                            "kSimFile_FPLMN", "kSimFile_AHPLMN", "kSimFile_RATMODE", "kSimFile_PNN",
                            "kSimFile_OPL", "kSimFile_OPLMNAcT"})
        EXPECT_TRUE(files[key].asString()) << key;
    for (const char* key : {"kSimFile_LOCI", "kSimFile_PSLOCI", "kSimFile_ACC", "kSimFile_AD"})
        EXPECT_TRUE(files[key].asData()) << key;
    EXPECT_EQ(files.asDictionary()->size(), 14U);
}

bool equal(const std::vector<Timed>& left, const std::vector<Timed>& right)
{
    return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                      [](const Timed& one, const Timed& other) {
                          return one.message.code == other.message.code &&
                                 one.message.payload == other.message.payload;
                      });
}

TEST(LTEScenarioTest, ASeedDecidesEverything)
{
    EXPECT_TRUE(equal(drive(7, 60s), drive(7, 60s)));
    EXPECT_FALSE(equal(drive(7, 60s), drive(8, 60s)));
}

TEST(LTEScenarioTest, LongStepsMissNothing)
{
    EXPECT_TRUE(equal(drive(7, 60s), drive(7, 60s, 1000ms)));
}

} // namespace
} // namespace orvane
