#include "platform/base/Technology.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

TEST(TechnologyTest, TechnologiesHaveNames)
{
    EXPECT_EQ(technologyNamed("lte"), kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(technologyNamed("umts"), kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(technologyNamed("utran"), kTSLogChannelTechnology_Varnel_UTRAN2);
    EXPECT_EQ(technologyNamed("cdma"), kTSLogChannelTechnology_Varnel_CDMA);
    EXPECT_EQ(technologyNamed("cellmonitor"), kTSLogChannelTechnology_IFX);
    EXPECT_FALSE(technologyNamed("gsm"));
    EXPECT_FALSE(technologyNamed(""));
    EXPECT_EQ(nameOfTechnology(kTSLogChannelTechnology_Varnel_GSM), "umts");
    EXPECT_EQ(nameOfTechnology("umts"), "");
    EXPECT_EQ(technologyNames(), "lte, umts, utran, cdma, cellmonitor");
}

} // namespace
} // namespace orvane
