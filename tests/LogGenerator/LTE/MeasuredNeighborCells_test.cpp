#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xB179;

using MeasuredNeighborCellsTest = SectionTest<MeasuredNeighborCells>;

// `count` is what the packet says, `present` how many cells it holds: cell i has identity 100 + i.
PacketBuilder packet(std::uint32_t count, std::size_t present)
{
    PacketBuilder builder(kCode, 29 + 6 * present);
    builder.put8(27, count);
    for (std::size_t i = 0; i < present; ++i)
        builder.put16(29 + 6 * i, static_cast<std::uint32_t>(100 + i));
    return builder;
}

} // namespace

TEST_F(MeasuredNeighborCellsTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Measured Neighbor Cells");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(MeasuredNeighborCellsTest, ReadsCellsFromOffsets29And35)
{
    send(kCode, PacketBuilder(kCode, 43)
                    .put8(27, 2)
                    .put8(28, 1)
                    .put16(29, 11)
                    .put16(31, 160)
                    .put16(33, 80)
                    .put16(35, 65535)
                    .put16(37, 65535)
                    .put16(39, 1)
                    .put16(41, 77));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
                                   {"Physical Cell ID", "11"         },
                                   {"Filtered RSRP",    "-100.00 dBm"},
                                   {"Filtered RSRQ",    "-10.00 dB"  }
    },
                               Rows{{"Physical Cell ID", "65535"},
                                    {"Filtered RSRP", "16243.75 dBm"},
                                    {"Filtered RSRQ", "-19.88 dB"}}));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Measured Neighbor Cells"}));
}

TEST_F(MeasuredNeighborCellsTest, NoCellsEmptyTheList)
{
    send(kCode, packet(2, 2));
    send(kCode, packet(0, 2));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(MeasuredNeighborCellsTest, ShowsTheLargestCount)
{
    send(kCode, packet(255, 255));
    ASSERT_EQ(records().size(), 255U);
    EXPECT_EQ(records()[254][0].second, "354");
}

TEST_F(MeasuredNeighborCellsTest, ACountBeyondThePacketShowsItsWholeCells)
{
    const Bytes three = packet(255, 3);
    for (std::size_t size = 29; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        EXPECT_EQ(records().size(), (size - 29) / 6) << size;
    }
    EXPECT_EQ(records()[2][0].second, "102");
}

TEST_F(MeasuredNeighborCellsTest, APacketOfTheMinimumLengthWithoutRecordsEmptiesTheList)
{
    section.updateSectionRef(display);
    display.asArray()->append("shown before");
    send(kCode, PacketBuilder(kCode, 29));
    EXPECT_THAT(display.asArray()->elements(), IsEmpty());
}

TEST_F(MeasuredNeighborCellsTest, ShorterPacketsKeepTheList)
{
    send(kCode, packet(1, 1));
    expectShorterIsIgnored(kCode, packet(0, 0), 29);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(MeasuredNeighborCellsTest, OtherCodesAreReportedAndKeepTheList)
{
    send(kCode, packet(1, 1));
    expectReported(0xB180);
}

TEST_F(MeasuredNeighborCellsTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, packet(1, 1));
    EXPECT_THAT(records(), IsEmpty());
}

} // namespace orvane
