#include "LogGenerator/LogTechnology.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "support/Paths.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::IsEmpty;

Bytes fileOf(std::initializer_list<std::uint16_t> codes)
{
    Bytes file;
    for (const std::uint16_t code : codes) {
        Bytes item(20);
        item[0] = 20;
        item[2] = static_cast<std::uint8_t>(code & 0xFF);
        item[3] = static_cast<std::uint8_t>(code >> 8);
        item[9] = 1; // of the timestamp
        file.insert(file.end(), item.begin(), item.end());
    }
    return file;
}

TEST(LogTechnologyTest, TheCodesOfARecordingTellItsTechnology)
{
    EXPECT_EQ(technologyOfLog(fileOf({0x1FFD, 0xB0C2})), kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(technologyOfLog(fileOf({0x1111, 0x2222, 0xB17F, 0x3333})),
              kTSLogChannelTechnology_Varnel_LTE);
}

TEST(LogTechnologyTest, ARealDriveIsRecognised)
{
    const auto file = readFile(testDataPath("lte-drive.dlf"));
    ASSERT_TRUE(file);
    EXPECT_EQ(technologyOfLog(*file), kTSLogChannelTechnology_Varnel_LTE);
}

TEST(LogTechnologyTest, EachTechnologyIsToldByACodeOfItsOwn)
{
    TestServices services;
    services.useShippedResources(); // UTRAN's codes come with its template
    const struct {
        std::uint16_t code;
        const char* technology;
    } cases[] = {
        {0xB179, kTSLogChannelTechnology_Varnel_LTE   },
        {0xD0E0, kTSLogChannelTechnology_Varnel_UTRAN2},
        {0x417A, kTSLogChannelTechnology_Varnel_GSM   },
        {0x119C, kTSLogChannelTechnology_Varnel_CDMA  },
    };
    for (const auto& each : cases)
        EXPECT_EQ(technologyOfLog(fileOf({0x1FFD, each.code, 0x3333})), each.technology)
            << each.code;
}

TEST(LogTechnologyTest, TheTechnologyThatKnowsMostItemsWins)
{
    EXPECT_EQ(technologyOfLog(fileOf({0x417A, 0x4005, 0xB179, 0xB17F, 0xB17F})),
              kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(technologyOfLog(fileOf({0x417A, 0x4005, 0xB179, 0x4005, 0xB17F})),
              kTSLogChannelTechnology_Varnel_GSM);
}

TEST(LogTechnologyTest, CodesThatNoGeneratorKnowsTellNothing)
{
    EXPECT_FALSE(technologyOfLog({}));
    EXPECT_FALSE(technologyOfLog(fileOf({0x1FFD})));
    EXPECT_FALSE(technologyOfLog(fileOf({0x1FFD, 0x1111, 0x2222})));
    EXPECT_FALSE(technologyOfLog(Bytes(100, 0xAB)));
}

TEST(LogTechnologyTest, AskingLeavesNoLines)
{
    TestServices services;
    EXPECT_TRUE(technologyOfLog(fileOf({0xB0C2})));
    EXPECT_THAT(services.log.lines, IsEmpty());
    EXPECT_THAT(services.console.lines, IsEmpty());
    logError("afterwards lines are taken again");
    EXPECT_EQ(services.log.lines.size(), 1U);
}

} // namespace
} // namespace orvane
