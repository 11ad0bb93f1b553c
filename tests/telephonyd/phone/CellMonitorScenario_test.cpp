#include "telephonyd/phone/CellMonitorScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "telephonyd/support/PhoneTour.h"

#include <gmock/gmock.h>

#include <string>

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
    CellMonitorScenario scenario(seed);
    return tourOf(scenario, duration, step);
}

// One tour through the town, for all tests.
const Tour& tour()
{
    static const Tour messages = drive(1, 720s);
    return messages;
}

void expectOnlyTexts(const PropertyValue& value)
{
    if (const PropertyDictionary* dictionary = value.asDictionary()) {
        EXPECT_FALSE(dictionary->empty());
        for (const auto& [key, each] : *dictionary)
            expectOnlyTexts(each);
    } else if (const PropertyArray* array = value.asArray()) {
        for (const PropertyValue& each : *array)
            expectOnlyTexts(each);
    } else {
        ASSERT_TRUE(value.asString()) << value.typeName();
        EXPECT_FALSE(value.asString()->empty());
    }
}

int numberOf(const PropertyValue& text) { return std::stoi(*text.asString()); }

TEST(CellMonitorScenarioTest, ThereIsAListAtOnceAndAtLeastOneASecond)
{
    for (const unsigned seed : {1U, 2U, 3U})
        EXPECT_EQ(drive(seed, 0s).size(), 1U);
    EXPECT_EQ(CellMonitorScenario(1).technology(), kTSLogChannelTechnology_IFX);
    for (std::size_t i = 1; i < tour().size(); ++i)
        EXPECT_LE(tour()[i].at - tour()[i - 1].at, 1s);
}

TEST(CellMonitorScenarioTest, MessagesAreBareListsOfTextsThatAreSentWhateverWasAskedFor)
{
    for (const TimedMessage& each : tour()) {
        ASSERT_EQ(each.message.kind, Kind::Bare);
        const PropertyValue list = listOf(each);
        ASSERT_TRUE(list.asDictionary());
        expectOnlyTexts(list);
    }
}

TEST(CellMonitorScenarioTest, NothingThatViewersLeaveOutIsMissed)
{
    std::set<std::size_t> counts;
    for (const TimedMessage& each : tour()) {
        const PropertyValue list = listOf(each);
        EXPECT_GT(list["Network"].asDictionary()->size(), 1U);
        EXPECT_GT(list["Serving Cell"].asDictionary()->size(), 1U);
        const PropertyArray& cells = *list["Neighbor Cells"].asArray();
        // The first element describes the others and is left out.
        ASSERT_GE(cells.size(), 1U);
        EXPECT_EQ(numberOf(cells[0]["Count"]), static_cast<int>(cells.size()) - 1);
        for (std::size_t i = 1; i < cells.size(); ++i)
            EXPECT_GT(cells[i].asDictionary()->size(), 1U) << "it would show as its value";
        counts.insert(cells.size() - 1);
    }
    EXPECT_GE(counts.size(), 2U);
    EXPECT_LE(*counts.rbegin(), 6U);
}

TEST(CellMonitorScenarioTest, SomeValuesStandInDictionariesOfTheirOwn)
{
    const PropertyValue list = listOf(tour().front());
    EXPECT_EQ(list["Serving Cell"]["Channel"].asDictionary()->size(), 1U);
    EXPECT_TRUE(list["Serving Cell"]["BSIC"].asString());
}

TEST(CellMonitorScenarioTest, TheServingCellChangesAndLevelsMove)
{
    std::set<std::string> cells;
    std::set<std::string> areas;
    std::set<std::string> bands;
    std::set<int> levels;
    for (const TimedMessage& each : tour()) {
        const PropertyValue list = listOf(each);
        const PropertyValue& serving = list["Serving Cell"];
        cells.insert(*serving["Cell Identity"].asString());
        areas.insert(*list["Network"]["Location Area"].asString());
        bands.insert(*serving["Band"].asString());
        levels.insert(numberOf(serving["Received Level"]["Average"]));
    }
    EXPECT_GE(cells.size(), 10U);
    EXPECT_THAT(areas, ElementsAre("4101", "4102", "4103"));
    EXPECT_THAT(bands, ElementsAre("DCS 1800", "GSM 900"));
    EXPECT_GT(levels.size(), 15U);
    EXPECT_GE(*levels.begin(), -110);
    EXPECT_LE(*levels.rbegin(), -60);
}

TEST(CellMonitorScenarioTest, NeighboursAreListedTheStrongestFirstWithoutTheServingCell)
{
    for (const TimedMessage& each : tour()) {
        const PropertyValue list = listOf(each);
        const PropertyArray& cells = *list["Neighbor Cells"].asArray();
        for (std::size_t i = 1; i < cells.size(); ++i) {
            EXPECT_NE(cells[i]["Channel"], list["Serving Cell"]["Channel"]);
            EXPECT_GE(numberOf(cells[i]["Received Level"]["Average"]), -110);
            if (i > 1) {
                EXPECT_LE(numberOf(cells[i]["Received Level"]["Average"]),
                          numberOf(cells[i - 1]["Received Level"]["Average"]));
            }
        }
    }
}

TEST(CellMonitorScenarioTest, CallsComeAndGoWithRowsOfTheirOwn)
{
    int calls = 0;
    bool wasCall = false;
    for (const TimedMessage& each : tour()) {
        const PropertyValue list = listOf(each);
        const PropertyValue& serving = list["Serving Cell"];
        const bool isCall = serving["Mode"] == PropertyValue("Dedicated");
        EXPECT_EQ(static_cast<bool>(serving["Timing Advance"]), isCall);
        EXPECT_EQ(static_cast<bool>(serving["C1"]), !isCall);
        calls += isCall && !wasCall ? 1 : 0;
        wasCall = isCall;
    }
    EXPECT_GE(calls, 8);
}

TEST(CellMonitorScenarioTest, ASeedDecidesEverything)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s)));
    EXPECT_FALSE(sameMessages(drive(7, 60s), drive(8, 60s)));
}

TEST(CellMonitorScenarioTest, LongStepsMissNothing)
{
    EXPECT_TRUE(sameMessages(drive(7, 60s), drive(7, 60s, 1000ms)));
}

} // namespace
} // namespace orvane
