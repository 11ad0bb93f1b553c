#include "LogGenerator/ClassIndex.h"

#include "LogGenerator/support/RecordingSection.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pointee;

class ClassIndexTest : public ::testing::Test
{
protected:
    TestServices services;
    RecordingClassIndex index;
};

} // namespace

TEST_F(ClassIndexTest, ANewOneIsEmpty)
{
    EXPECT_EQ(index.getClass("Lamp"), nullptr);
    EXPECT_EQ(index.getSubscribers(4483), nullptr);
    EXPECT_THAT(index.getAllLogCodes(), IsEmpty());
}

TEST_F(ClassIndexTest, FindsASectionByItsName)
{
    Base& lamp = index.add("Lamp", {4483});
    EXPECT_EQ(index.getClass("Lamp"), &lamp);
    EXPECT_EQ(index.getClass("lamp"), nullptr);
    EXPECT_EQ(index.getClass(""), nullptr);
}

TEST_F(ClassIndexTest, TheLaterOfTwoSectionsOfOneNameIsFoundAndBothAreCalled)
{
    Base& first = index.add("Lamp", {1});
    Base& second = index.add("Lamp", {1});
    EXPECT_EQ(index.getClass("Lamp"), &second);
    EXPECT_THAT(index.getSubscribers(1), Pointee(ElementsAre(&first, &second)));
}

TEST_F(ClassIndexTest, SubscribersComeInTheOrderOfTheirRegistration)
{
    Base& lamp = index.add("Lamp", {7, 16711682});
    Base& door = index.add("Door", {8, 7});
    EXPECT_THAT(index.getSubscribers(7), Pointee(ElementsAre(&lamp, &door)));
    EXPECT_THAT(index.getSubscribers(8), Pointee(ElementsAre(&door)));
    EXPECT_THAT(index.getSubscribers(0xFF0002), Pointee(ElementsAre(&lamp)));
    EXPECT_EQ(index.getSubscribers(9), nullptr);
    EXPECT_EQ(index.getSubscribers(4294967295), nullptr);
}

TEST_F(ClassIndexTest, ACodeListedTwiceSubscribesTwice)
{
    Base& lamp = index.add("Lamp", {7, 7});
    EXPECT_THAT(index.getSubscribers(7), Pointee(ElementsAre(&lamp, &lamp)));
    EXPECT_THAT(index.getAllLogCodes(), ElementsAre("7"));
}

TEST_F(ClassIndexTest, ListsAllCodesAsDecimalTexts)
{
    index.add("Lamp", {0xB0C0, 0xFF0002});
    index.add("Door", {0, 0xB0C0});
    EXPECT_THAT(index.getAllLogCodes(), ElementsAre("45248", "16711682", "0"));
}

TEST_F(ClassIndexTest, StatusTellsWhatTheSectionDictionaryIs)
{
    index.status();
    EXPECT_THAT(services.log.warnings(), ElementsAre("Dictionary = 1", "String = 0"));
}

TEST_F(ClassIndexTest, ItsEndIsToldOnTheConsole)
{
    {
        const RecordingClassIndex other;
    }
    EXPECT_THAT(services.console.lines, ElementsAre("Deallocing ClassIndex"));
}

} // namespace orvane
