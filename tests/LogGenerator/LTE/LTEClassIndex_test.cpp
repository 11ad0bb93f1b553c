#include "LogGenerator/LTE/LTEClassIndex.h"

#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/support/IndexOrder.h"
#include "LogGenerator/support/SectionTest.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::MatchesRegex;

class LTEClassIndexTest : public ::testing::Test
{
protected:
    TestServices services;
};

} // namespace

TEST_F(LTEClassIndexTest, FindsEachSectionByItsName)
{
    LTEClassIndex index;
    index.init();
    ASSERT_FALSE(index.sections().empty());
    for (const auto& [name, section] : index.sections()) {
        EXPECT_EQ(section->getSectionName(), name);
        EXPECT_EQ(index.getClass(name), section);
    }
}

TEST_F(LTEClassIndexTest, SectionsShareCodesInTheOrderInWhichTheyAreMade)
{
    LTEClassIndex index;
    index.init();
    EXPECT_THAT(subscribers(index, 0xB0C2), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xB0C1), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xFF0001), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xB179),
                ElementsAre("Connected mode LTE Intra-frequency Measurement",
                            "Measured Neighbor Cells", "Detected Cells"));
    EXPECT_THAT(subscribers(index, 0xB17F), ElementsAre("Serving Cell Measurements"));
    EXPECT_THAT(subscribers(index, 0xB180),
                ElementsAre("Neighbor Measurements", "Neighbor Cells List"));
    EXPECT_THAT(subscribers(index, 0xB186),
                ElementsAre("Reselection Candidates", "Reselection Candidates List"));
    EXPECT_THAT(subscribers(index, 0xFF0000), ElementsAre("SIM Info"));
    EXPECT_THAT(subscribers(index, 0xFF0002), ElementsAre("PDP Context Info"));
    EXPECT_EQ(index.getSubscribers(0x4221), nullptr); // HSDPA belongs to another technology
}

TEST_F(LTEClassIndexTest, TheStartCommandAsksForTheCodesInTheOrderOfTheSections)
{
    LTELogGenerator generator;
    generator.init();
    const PropertyValue command = generator.getStartCommand();
    EXPECT_EQ(command["SetState"], PropertyValue("Streaming"));
    const std::vector<std::int64_t> modemCodes = {0xB0C2, 0xB0C1, 0xB179, 0xB17F, 0xB180, 0xB186};
    EXPECT_EQ(onlyThose(modemCodes, integersOf(command["SetVarnelLogCodes"])), modemCodes);
    const std::vector<std::int64_t> extraCodes = {1, 0, 2};
    EXPECT_EQ(onlyThose(extraCodes, integersOf(command["SetTsExtraCodes"])), extraCodes);
}

TEST_F(LTEClassIndexTest, ItsEndIsToldOnTheConsole)
{
    {
        LTEClassIndex index;
        index.init();
    }
    EXPECT_THAT(services.console.lines,
                ElementsAre("Deallocing LTEClassIndex", "Deallocing ClassIndex"));
}

TEST_F(LTEClassIndexTest, TheGeneratorLogsItselfThenItsSectionsThenItsBases)
{
    LTELogGenerator generator;
    generator.init();
    LTEClassIndex index;
    std::vector<std::string> texts = services.log.texts();
    index.init();
    const std::size_t sectionCount = index.sections().size();
    EXPECT_EQ(std::erase_if(
                  texts, [](const std::string& text) { return text.starts_with("Array Count: "); }),
              sectionCount);
    EXPECT_THAT(texts, ElementsAre("Creating LTELogGenerator object",
                                   MatchesRegex("Creating VRNLogGenerator2 object with 0x.+"),
                                   MatchesRegex("Creating Log object: 0x.+"), "Class Index: 1"));
    EXPECT_EQ(services.log.lines[1].text, "Array Count: 3");
}

TEST_F(LTEClassIndexTest, TheGeneratorsStartAndEndAreLogged)
{
    {
        LTELogGenerator generator;
        generator.init();
        EXPECT_THAT(services.log.errors(), ElementsAre("Creating LTELogGenerator object"));
        services.log.lines.clear();
    }
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("LTELogGenerator is destructed 0x.+"),
                            MatchesRegex("VRN_GSMLogGenerator is destructed 0x.+")));
}

} // namespace orvane
