#include "LogGenerator/Base.h"

#include "LogGenerator/UnrecognisedOperation.h"
#include "LogGenerator/support/RecordingSection.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using Type = PropertyValue::Type;

class BaseTest : public ::testing::Test
{
protected:
    TestServices services;
    ClassDictionary classDict;
    CodeDictionary codeDict;
    RecordingSection lamp{
        "Lamp", {7, 8}
    };
    RecordingSection doors{"Doors", {9}, Type::Array};
};

} // namespace

TEST_F(BaseTest, AbstractOperationsThrow)
{
    Base base;
    EXPECT_THROW(base.updateWithData({}, 1), UnrecognisedOperation);
    EXPECT_THROW(static_cast<void>(base.getSectionName()), UnrecognisedOperation);
    EXPECT_THROW(static_cast<void>(base.getLogCodeArray()), UnrecognisedOperation);
    EXPECT_THROW(base.initWithDict(classDict, codeDict), UnrecognisedOperation);
    EXPECT_THROW(base.updateLogCodeDict(codeDict), UnrecognisedOperation);
}

TEST_F(BaseTest, RegistersUnderItsNameAndCodesAndTellsHowMany)
{
    lamp.initWithDict(classDict, codeDict);
    ASSERT_TRUE(classDict.find("Lamp"));
    EXPECT_EQ(*classDict.find("Lamp"), &lamp);
    ASSERT_TRUE(codeDict.find("8"));
    EXPECT_THAT(*codeDict.find("8"), ElementsAre(&lamp));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Array Count: 2"}));
}

TEST_F(BaseTest, RegisteringForgetsThePartOfTheDisplay)
{
    const PropertyValue rows = PropertyValue::newDictionary();
    lamp.updateSectionRef(rows);
    lamp.initWithDict(classDict, codeDict);
    EXPECT_EQ(lamp.rows(), nullptr);
}

TEST_F(BaseTest, TakesThePartOfTheDisplayAndLogsItsName)
{
    const PropertyValue rows = PropertyValue::newDictionary();
    lamp.updateSectionRef(rows);
    EXPECT_EQ(lamp.rows().get(), rows.asDictionary());
    EXPECT_EQ(lamp.list(), nullptr);
    const PropertyValue list = PropertyValue::newArray();
    doors.updateSectionRef(list);
    EXPECT_EQ(doors.list().get(), list.asArray());
    EXPECT_EQ(doors.rows(), nullptr);
    EXPECT_THAT(services.log.lines, ElementsAre(RecordingLog::Line{LogPriority::Warning, "Lamp"},
                                                RecordingLog::Line{LogPriority::Warning, "Doors"}));
}

TEST_F(BaseTest, APartOfTheWrongKindIsReportedOnceAndNotTaken)
{
    lamp.updateSectionRef(PropertyValue::newDictionary());
    services.log.lines.clear();
    const PropertyValue list = PropertyValue::newArray();
    lamp.updateSectionRef(list);
    EXPECT_EQ(lamp.rows(), nullptr);
    EXPECT_EQ(lamp.list(), nullptr);
    EXPECT_THAT(services.log.errors(),
                ElementsAre("The template's part for \"Lamp\" is of type array instead of "
                            "dictionary: it stays empty"));
    doors.updateSectionRef("text");
    EXPECT_EQ(doors.list(), nullptr);
    EXPECT_EQ(services.log.errors().size(), 2U);
}

TEST_F(BaseTest, ThePartOfTheDisplayIsNotOwned)
{
    PropertyValue rows = PropertyValue::newDictionary();
    lamp.updateSectionRef(rows);
    rows = PropertyValue();
    EXPECT_EQ(lamp.rows(), nullptr);
}

TEST_F(BaseTest, ClearsAnArray)
{
    const PropertyValue list = PropertyValue::arrayOf({"a", "b"});
    Base::clearElementsInArray(list.asArray());
    EXPECT_EQ(list, PropertyValue::newArray());
    Base::clearElementsInArray(nullptr);
}

TEST_F(BaseTest, ReplacesAnArraysElements)
{
    const PropertyValue list = PropertyValue::arrayOf({"a", "b"});
    Base::replaceArray(list.asArray(), {"c"});
    EXPECT_EQ(list, PropertyValue::arrayOf({"c"}));
    Base::replaceArray(list.asArray(), {});
    EXPECT_EQ(list, PropertyValue::newArray());
    Base::replaceArray(nullptr, {"d"});
}

TEST_F(BaseTest, EnergyBandsBeginJustAboveTheirThresholds)
{
    const std::pair<std::uint32_t, int> kBands[] = {
        {417647, -1 },
        {331808, -2 },
        {263624, -3 },
        {209463, -4 },
        {166441, -5 },
        {132268, -6 },
        {105123, -7 },
        {83562,  -8 },
        {66435,  -9 },
        {52830,  -10},
        {42023,  -11},
        {33440,  -12},
        {26621,  -13},
        {21205,  -14},
        {16903,  -15},
        {13486,  -16},
        {10771,  -17},
        {8615,   -18},
        {6902,   -19},
        {5542,   -20},
        {4461,   -21},
        {3603,   -22},
        {2921,   -23},
        {2240,   -24},
        {1949,   -25},
        {1607,   -26},
        {1336,   -27},
        {1120,   -28},
        {949,    -29},
        {813,    -30},
        {756,    -31},
        {705,    -31},
    };
    std::uint32_t top = 524287;
    for (const auto& [threshold, decibels] : kBands) {
        EXPECT_EQ(Base::lookUpECNO(threshold + 1), decibels) << threshold;
        EXPECT_EQ(Base::lookUpECNO(top), decibels) << threshold;
        top = threshold;
    }
}

TEST_F(BaseTest, ThereIsNoEnergyRatioOfMinus32)
{
    for (std::uint32_t ratio = 706; ratio <= 813; ++ratio)
        EXPECT_EQ(Base::lookUpECNO(ratio), -31) << ratio;
}

TEST_F(BaseTest, TheWeakestEnergyRatiosShowZeroAsTheStrongestDo)
{
    for (const std::uint32_t ratio : {0U, 1U, 705U, 524288U, 524289U, 4294967295U})
        EXPECT_EQ(Base::lookUpECNO(ratio), 0) << ratio;
}

} // namespace orvane
