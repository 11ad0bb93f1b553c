#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x4005;

using GSMSetTest = SectionTest<GSMSet>;

Rows cell(const char* channel, const char* colour, const char* level, const char* ranking)
{
    return {
        {"ARFCN",         channel},
        {"BSIC",          colour },
        {"RSSI",          level  },
        {"Ranking Value", ranking},
    };
}

Bytes twoCells(std::uint32_t count)
{
    return PacketBuilder(kCode, 15 + 14)
        .put8(14, count)
        .put16(15, 975)
        .put16(17, 63)
        .put8(19, 0xA6)
        .put16(20, 0xFFF6)
        .put16(22, 0xFFFF)
        .put16(24, 0xFFFF)
        .put8(26, 127)
        .put16(27, 0x8000);
}

} // namespace

TEST_F(GSMSetTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "GSM Set");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(GSMSetTest, ShowsARecordACellWithSignedLevelsAndRankings)
{
    send(kCode, twoCells(2));
    EXPECT_THAT(records(), ElementsAre(cell("975", "63", "-90 dBm", "-10"),
                                       cell("65535", "65535", "127 dBm", "-32768")));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "GSMSet"}));
}

TEST_F(GSMSetTest, RecordsBeginAtOffset15WhateverTheNumberOfUmtsRecords)
{
    Bytes packet = twoCells(1);
    packet[13] = 3;
    send(kCode, packet);
    EXPECT_THAT(records(), ElementsAre(cell("975", "63", "-90 dBm", "-10")));
}

TEST_F(GSMSetTest, ACountOfZeroEmptiesTheList)
{
    send(kCode, twoCells(2));
    send(kCode, twoCells(0));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(GSMSetTest, ACountBeyondThePacketShowsTheWholeRecords)
{
    const std::pair<std::size_t, std::size_t> kCells[] = {
        {15, 0},
        {21, 0},
        {22, 1},
        {28, 1},
        {29, 2},
    };
    for (const auto& [size, cells] : kCells) {
        sendCut(kCode, twoCells(255), size);
        EXPECT_EQ(records().size(), cells) << size;
    }
}

TEST_F(GSMSetTest, TheLargestCountIsShownWhole)
{
    send(kCode, PacketBuilder(kCode, 15 + 255 * 7).put8(14, 255).put16(15 + 254 * 7, 7));
    ASSERT_EQ(records().size(), 255U);
    EXPECT_EQ(records()[254], cell("7", "0", "0 dBm", "0"));
}

TEST_F(GSMSetTest, ShortPacketLeavesTheEarlierList)
{
    send(kCode, twoCells(2));
    expectShorterIsIgnored(kCode, twoCells(0), 15);
    EXPECT_EQ(records().size(), 2U);
}

TEST_F(GSMSetTest, OtherCodesAreReported)
{
    send(kCode, twoCells(2));
    expectReported(0x417A);
    expectReported(0xFF0001);
}

} // namespace orvane
