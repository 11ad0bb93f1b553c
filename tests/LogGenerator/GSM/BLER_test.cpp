#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x4116;

class BLERTest : public SectionTest<BLER>
{
protected:
    [[nodiscard]] std::vector<Rows> channels() const
    {
        return recordsOf(display["Transport Channels"]);
    }
};

Rows channel(const char* identity, const char* received, const char* wrong)
{
    return {
        {"Transport Channel ID",  identity},
        {"CRC Received",          received},
        {"CRC Received in Error", wrong   },
    };
}

Bytes twoChannels(std::uint32_t count)
{
    return PacketBuilder(kCode, 16 + 18)
        .put8(13, count)
        .put16(14, 65535)
        .put8(16, 24)
        .put32(17, 1000)
        .put32(21, 3)
        .put8(25, 255)
        .put32(26, 0xFFFFFFFF)
        .put32(30, 0x80000000);
}

} // namespace

TEST_F(BLERTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "BLER");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(BLERTest, ShowsTheWindowAndItsChannels)
{
    send(kCode, twoChannels(2));
    EXPECT_EQ(row("Window Size"), "65535");
    ASSERT_EQ(rows().size(), 2U);
    EXPECT_EQ(rows()[0].first, "Window Size");
    EXPECT_EQ(rows()[1].first, "Transport Channels");
    EXPECT_THAT(channels(),
                ElementsAre(channel("24", "1000", "3"), channel("255", "-1", "-2147483648")));
    EXPECT_THAT(services.log.lines, ElementsAre(RecordingLog::Line{LogPriority::Warning, "BLER"}));
}

TEST_F(BLERTest, ACountOfZeroShowsAnEmptyList)
{
    send(kCode, twoChannels(2));
    send(kCode, twoChannels(0));
    ASSERT_TRUE(display["Transport Channels"].asArray());
    EXPECT_THAT(channels(), IsEmpty());
}

TEST_F(BLERTest, TheListIsReplacedAsAWhole)
{
    send(kCode, twoChannels(2));
    const PropertyValue earlier = display["Transport Channels"];
    send(kCode, twoChannels(1));
    EXPECT_THAT(channels(), ElementsAre(channel("24", "1000", "3")));
    EXPECT_EQ(earlier.asArray()->size(), 2U);
}

TEST_F(BLERTest, ACountBeyondThePacketShowsTheWholeRecords)
{
    const std::pair<std::size_t, std::size_t> kChannels[] = {
        {16, 0},
        {24, 0},
        {25, 1},
        {33, 1},
        {34, 2},
    };
    for (const auto& [size, count] : kChannels) {
        sendCut(kCode, twoChannels(255), size);
        EXPECT_EQ(channels().size(), count) << size;
    }
}

TEST_F(BLERTest, TheLargestCountIsShownWhole)
{
    send(kCode, PacketBuilder(kCode, 16 + 9 * 255).put8(13, 255).put8(16 + 9 * 254, 6));
    ASSERT_EQ(channels().size(), 255U);
    EXPECT_EQ(channels()[254], channel("6", "0", "0"));
}

TEST_F(BLERTest, ShortPacketLeavesEarlierRowsInPlace)
{
    send(kCode, twoChannels(2));
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 16), 16);
}

TEST_F(BLERTest, OtherCodesAreReported) { expectReported(0x4117); }

TEST_F(BLERTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, twoChannels(2));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
