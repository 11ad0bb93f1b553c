#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x417A;

using VirtualActiveSetTest = SectionTest<VirtualActiveSet>;

} // namespace

TEST_F(VirtualActiveSetTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Virtual Active Set");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(VirtualActiveSetTest, StaysEmptyWhateverTheSetsOfThePacketsCells)
{
    for (std::uint32_t set = 0; set < 8; ++set) {
        display.asArray()->append("earlier");
        send(kCode, PacketBuilder(kCode, 16 + 15 + 44).put8(15, 1).put16(16 + 7, 5 | set << 13));
        EXPECT_TRUE(display.asArray()->empty()) << set;
    }
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_EQ(services.log.warnings(), std::vector<std::string>(8, "VirtualActiveSet"));
}

TEST_F(VirtualActiveSetTest, ACountOfZeroEmptiesTheList)
{
    display.asArray()->append("earlier");
    send(kCode, PacketBuilder(kCode, 16));
    EXPECT_TRUE(display.asArray()->empty());
}

TEST_F(VirtualActiveSetTest, ACountBeyondThePacketIsHarmless)
{
    display.asArray()->append("earlier");
    send(kCode, PacketBuilder(kCode, 16).put8(15, 255));
    EXPECT_TRUE(display.asArray()->empty());
}

TEST_F(VirtualActiveSetTest, ShortPacketLeavesTheEarlierList)
{
    display.asArray()->append("earlier");
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 16), 16);
    EXPECT_EQ(display.asArray()->size(), 1U);
}

TEST_F(VirtualActiveSetTest, OtherCodesAreReported)
{
    display.asArray()->append("earlier");
    expectReported(0x4005);
}

} // namespace orvane
