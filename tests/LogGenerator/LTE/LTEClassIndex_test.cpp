#include "LogGenerator/LTE/LTEClassIndex.h"

#include "LogGenerator/LTE/LTELogGenerator.h"
#include "support/Recording.h"

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
    // The names of the sections that subscribe to the code, in order.
    static std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code)
    {
        std::vector<std::string> names;
        if (const auto* sections = index.getSubscribers(code))
            for (const Base* section : *sections)
                names.push_back(section->getSectionName());
        return names;
    }

    TestServices services;
};

} // namespace

TEST_F(LTEClassIndexTest, MakesItsSectionsInOrder)
{
    LTEClassIndex index;
    index.init();
    std::vector<std::string> names;
    for (const auto& [name, section] : index.sections()) {
        names.push_back(name);
        EXPECT_EQ(section->getSectionName(), name);
    }
    EXPECT_THAT(
        names, ElementsAre("Serving Cell Info", "Connected mode LTE Intra-frequency Measurement",
                           "Measured Neighbor Cells", "Detected Cells", "Serving Cell Measurements",
                           "Neighbor Measurements", "Neighbor Cells List", "Reselection Candidates",
                           "Reselection Candidates List", "SIM Info", "PDP Context Info"));
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
    EXPECT_EQ(index.getSubscribers(0x4221), nullptr); // HSDPA is of another technology
}

TEST_F(LTEClassIndexTest, TheStartCommandAsksForAllCodes)
{
    LTELogGenerator generator;
    generator.init();
    EXPECT_EQ(generator.getStartCommand().description(),
              "{SetState = Streaming; "
              "SetVarnelLogCodes = (45250, 45249, 45433, 45439, 45440, 45446); "
              "SetTsExtraCodes = (1, 0, 2)}");
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
    std::vector<std::string> texts = services.log.texts();
    EXPECT_EQ(std::erase_if(
                  texts, [](const std::string& text) { return text.starts_with("Array Count: "); }),
              11U);
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
