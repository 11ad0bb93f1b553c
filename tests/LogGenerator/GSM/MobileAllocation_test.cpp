#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x51F8;

class MobileAllocationTest : public SectionTest<MobileAllocation>
{
protected:
    [[nodiscard]] std::vector<std::string> channels() const
    {
        std::vector<std::string> texts;
        if (const PropertyArray* list = display["ARFCNs"].asArray())
            for (const PropertyValue& channel : *list)
                texts.push_back(channel.description());
        return texts;
    }
};

Bytes twoChannels(std::uint32_t count)
{
    return PacketBuilder(kCode, 19).put8(13, 63).put8(14, count).put16(15, 975).put16(17, 65535);
}

} // namespace

TEST_F(MobileAllocationTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Mobile Allocation");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(MobileAllocationTest, ShowsTheSequenceAndItsChannels)
{
    send(kCode, twoChannels(2));
    EXPECT_EQ(rows(), (Rows{
                          {"HSN",    "63"          },
                          {"ARFCNs", "(975, 65535)"},
    }));
    EXPECT_THAT(channels(), ElementsAre("975", "65535"));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "MobileAllocation"}));
}

TEST_F(MobileAllocationTest, ACountOfZeroShowsAnEmptyList)
{
    send(kCode, twoChannels(2));
    send(kCode, twoChannels(0));
    ASSERT_TRUE(display["ARFCNs"].asArray());
    EXPECT_THAT(channels(), IsEmpty());
}

TEST_F(MobileAllocationTest, TheListIsReplacedAsAWhole)
{
    send(kCode, twoChannels(2));
    const PropertyValue earlier = display["ARFCNs"];
    send(kCode, twoChannels(1));
    EXPECT_THAT(channels(), ElementsAre("975"));
    EXPECT_EQ(earlier.asArray()->size(), 2U);
}

TEST_F(MobileAllocationTest, ACountBeyondThePacketShowsTheWholeChannels)
{
    const std::pair<std::size_t, std::size_t> kChannels[] = {
        {15, 0},
        {16, 0},
        {17, 1},
        {18, 1},
        {19, 2},
    };
    for (const auto& [size, count] : kChannels) {
        sendCut(kCode, twoChannels(255), size);
        EXPECT_EQ(channels().size(), count) << size;
        EXPECT_EQ(row("HSN"), "63");
    }
}

TEST_F(MobileAllocationTest, TheLargestCountIsShownWhole)
{
    send(kCode, PacketBuilder(kCode, 15 + 2 * 255).put8(14, 255).put16(15 + 2 * 254, 9));
    ASSERT_EQ(channels().size(), 255U);
    EXPECT_EQ(channels()[254], "9");
}

TEST_F(MobileAllocationTest, ShortPacketLeavesEarlierRowsInPlace)
{
    send(kCode, twoChannels(2));
    expectShorterIsIgnored(kCode, twoChannels(0), 15);
}

TEST_F(MobileAllocationTest, OtherCodesAreReported) { expectReported(0x51F7); }

TEST_F(MobileAllocationTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, twoChannels(2));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
