#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

class TechnologyFactoryTest : public ::testing::Test
{
protected:
    template <typename Generator>
    static bool makes(const char* technology)
    {
        const auto generator = LogGenerator::generatorFromTechnology(technology);
        return dynamic_cast<Generator*>(generator.get()) != nullptr;
    }

    TestServices services;
};

} // namespace

TEST_F(TechnologyFactoryTest, EachTechnologyHasItsGenerator)
{
    EXPECT_TRUE(makes<GSMLogGenerator>(kTSLogChannelTechnology_IFX));
    EXPECT_TRUE(makes<VRN_GSMLogGenerator>(kTSLogChannelTechnology_Varnel_GSM));
    EXPECT_TRUE(makes<C2KLogGenerator>(kTSLogChannelTechnology_Varnel_CDMA));
    EXPECT_TRUE(makes<LTELogGenerator>(kTSLogChannelTechnology_Varnel_LTE));
    EXPECT_TRUE(makes<UTRANLogGenerator>(kTSLogChannelTechnology_Varnel_UTRAN2));
}

TEST_F(TechnologyFactoryTest, AnyOtherValueHasNone)
{
    const PropertyValue kOthers[] = {
        PropertyValue(),
        PropertyValue(""),
        PropertyValue("kTSLogChannelTechnology_Varnel"),
        PropertyValue("ktslogchanneltechnology_varnel_lte"),
        PropertyValue(std::string(kTSLogChannelTechnology_Varnel_LTE) + " "),
        PropertyValue::integer(1),
        PropertyValue::arrayOf({kTSLogChannelTechnology_Varnel_LTE}),
    };
    for (const PropertyValue& other : kOthers)
        EXPECT_EQ(LogGenerator::generatorFromTechnology(other), nullptr) << other.description();
}

TEST_F(TechnologyFactoryTest, EachCallMakesANewGenerator)
{
    const auto first = LogGenerator::generatorFromTechnology(kTSLogChannelTechnology_Varnel_LTE);
    const auto second = LogGenerator::generatorFromTechnology(kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_NE(first, second);
}

} // namespace orvane
