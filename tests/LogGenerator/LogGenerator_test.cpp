#include "LogGenerator/LogGenerator.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/UnrecognisedOperation.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::MatchesRegex;

class LogGeneratorTest : public ::testing::Test
{
protected:
    TestServices services;
    PropertyDictionary state;

    [[nodiscard]] const PropertyArray& history() const { return *state[kHistoryKey].asArray(); }
    // The keys of the newest snapshot, in order.
    [[nodiscard]] std::vector<std::string> newestKeys() const
    {
        std::vector<std::string> keys;
        for (const auto& [key, value] : *history()[history().size() - 1].asDictionary())
            keys.push_back(key);
        return keys;
    }
    void fillState()
    {
        state.set(kExtraInfoKey, PropertyValue::newDictionary());
        state.set(kDisplayKey, PropertyValue::dictionaryOf({
                                   {"Row", "text"}
        }));
        state.set(kDisplayStateKey, PropertyValue::data({1, 2}));
    }
};

} // namespace

TEST_F(LogGeneratorTest, AbstractOperationsThrow)
{
    LogGenerator generator;
    EXPECT_THROW(generator.updateState(state, {}), UnrecognisedOperation);
    EXPECT_THROW(generator.generateLogUsingState(state), UnrecognisedOperation);
    EXPECT_THROW(static_cast<void>(generator.getStartCommand()), UnrecognisedOperation);
    EXPECT_THROW(generator.getSaveContentsFromState(state), UnrecognisedOperation);
}

TEST_F(LogGeneratorTest, InitLogsTheCreationAndTheConstructorDoesNot)
{
    LogGenerator generator;
    EXPECT_TRUE(services.log.lines.empty());
    generator.init();
    EXPECT_THAT(services.log.warnings(), ElementsAre(MatchesRegex("Creating Log object: 0x.+")));
}

TEST_F(LogGeneratorTest, ASnapshotHoldsCopiesInOrderAndItsDate)
{
    fillState();
    LogGenerator::updateHistoryInState(state);
    EXPECT_THAT(newestKeys(),
                ElementsAre("DisplayState", "Display", "ExtraInfo", "Date", "Description"));
    const PropertyValue& snapshot = history()[0];
    EXPECT_EQ(snapshot["Date"], PropertyValue("2026-11-21 10:00:00 +0000"));
    EXPECT_EQ(snapshot["Description"], PropertyValue("Snapshot (2026-11-21 10:00:00 +0000)"));
    state[kDisplayKey].asDictionary()->set("Row", "changed");
    state[kExtraInfoKey].asDictionary()->set("Key", "changed");
    EXPECT_EQ(snapshot["Display"]["Row"], PropertyValue("text"));
    EXPECT_EQ(snapshot["ExtraInfo"], PropertyValue::newDictionary());
    EXPECT_EQ(*snapshot["DisplayState"].asData(), Bytes({1, 2}));
}

TEST_F(LogGeneratorTest, ASnapshotEndsAtTheFirstValueThatTheStateLacks)
{
    fillState();
    state.remove(kExtraInfoKey);
    LogGenerator::updateHistoryInState(state);
    EXPECT_THAT(newestKeys(), ElementsAre("DisplayState", "Display"));
    fillState();
    state.remove(kDisplayKey);
    LogGenerator::updateHistoryInState(state);
    EXPECT_THAT(newestKeys(), ElementsAre("DisplayState"));
}

TEST_F(LogGeneratorTest, AStateWithoutDisplayStateGivesAnEmptySnapshotNotNone)
{
    fillState();
    state.remove(kDisplayStateKey);
    LogGenerator::updateHistoryInState(state);
    ASSERT_EQ(history().size(), 1U);
    EXPECT_EQ(history()[0], PropertyValue::newDictionary());
}

TEST_F(LogGeneratorTest, TheHistoryKeepsTheFiveNewest)
{
    fillState();
    for (std::uint8_t i = 0; i < 6; ++i) {
        state.set(kDisplayStateKey, PropertyValue::data({i}));
        LogGenerator::updateHistoryInState(state);
        EXPECT_EQ(history().size(), std::min<std::size_t>(i + 1U, 5));
    }
    for (std::uint8_t i = 0; i < 5; ++i)
        EXPECT_EQ(*history()[i]["DisplayState"].asData(),
                  Bytes({static_cast<std::uint8_t>(i + 1)}));
}

TEST_F(LogGeneratorTest, AnOverlongHistoryIsCutToFive)
{
    fillState();
    PropertyValue old = PropertyValue::newArray();
    for (int i = 0; i < 9; ++i)
        old.asArray()->append(PropertyValue::integer(i));
    state.set(kHistoryKey, old);
    LogGenerator::updateHistoryInState(state);
    ASSERT_EQ(history().size(), 5U);
    EXPECT_EQ(history()[0], PropertyValue::integer(5));
}

} // namespace orvane
