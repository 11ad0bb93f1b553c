#include "LogGenerator/UTRAN/UTRANClassIndex.h"

#include "LogGenerator/support/IndexOrder.h"
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

} // namespace

TEST_F(UTRANClassIndexTest, FindsEachSectionByItsName)
{
    UTRANClassIndex index;
    index.init();
    ASSERT_FALSE(index.sections().empty());
    for (const auto& [name, section] : index.sections()) {
        EXPECT_EQ(section->getSectionName(), name);
        EXPECT_EQ(index.getClass(name), section);
    }
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
    const std::vector<std::string> codes = {"53472", "53474", "16711681", "53258",
                                            "53262", "53260", "16711682", "16711680"};
    EXPECT_EQ(onlyThose(codes, index.getAllLogCodes()), codes);
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
