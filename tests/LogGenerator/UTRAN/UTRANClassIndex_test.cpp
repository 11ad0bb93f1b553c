#include "LogGenerator/UTRAN/UTRANClassIndex.h"

#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

class UTRANClassIndexTest : public ::testing::Test
{
protected:
    TestServices services;
};

// The names of the sections that subscribe to the code, in order.
std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code)
{
    std::vector<std::string> names;
    if (const auto* sections = index.getSubscribers(code))
        for (const Base* section : *sections)
            names.push_back(section->getSectionName());
    return names;
}

} // namespace

TEST_F(UTRANClassIndexTest, MakesItsSectionsInOrder)
{
    UTRANClassIndex index;
    index.init();
    std::vector<std::string> names;
    for (const auto& [name, section] : index.sections()) {
        names.push_back(name);
        EXPECT_EQ(section->getSectionName(), name);
    }
    EXPECT_THAT(names, ElementsAre("RRC Info", "Serving Cell Info", "Neighbor Cell List",
                                   "GSM Neighbor Cell List", "TRCH BLER", "CCTRCH SIR",
                                   "PDP Context Info", "SIM Info"));
}

TEST_F(UTRANClassIndexTest, SectionsShareCodesInTheOrderInWhichTheyAreMade)
{
    UTRANClassIndex index;
    index.init();
    EXPECT_THAT(subscribers(index, 0xD0E0), ElementsAre("RRC Info"));
    EXPECT_THAT(subscribers(index, 0xD0E2), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xFF0001), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xD00A), ElementsAre("Neighbor Cell List"));
    EXPECT_THAT(subscribers(index, 0xD00E), ElementsAre("GSM Neighbor Cell List"));
    EXPECT_THAT(subscribers(index, 0xD00C), ElementsAre("TRCH BLER", "CCTRCH SIR"));
    EXPECT_THAT(subscribers(index, 0xFF0002), ElementsAre("PDP Context Info"));
    EXPECT_THAT(subscribers(index, 0xFF0000), ElementsAre("SIM Info"));
    EXPECT_THAT(index.getAllLogCodes(), ElementsAre("53472", "53474", "16711681", "53258", "53262",
                                                    "53260", "16711682", "16711680"));
}

TEST_F(UTRANClassIndexTest, OnlyTheBaseTellsOfItsEndOnTheConsole)
{
    {
        UTRANClassIndex index;
        index.init();
    }
    EXPECT_THAT(services.console.lines, ElementsAre("Deallocing ClassIndex"));
}

} // namespace orvane
