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

using DetectedCellsTest = SectionTest<DetectedCells>;

// The packet says `measured` and `detected`, and ends after `present` of the detected cells, which
// have identities from 200 on.
PacketBuilder packet(std::uint32_t measured, std::uint32_t detected, std::size_t present)
{
    const std::size_t first = 29 + 6 * std::size_t{measured};
    PacketBuilder builder(kCode, first + 2 * present);
    builder.put8(27, measured).put8(28, detected);
    for (std::size_t i = 0; i < present; ++i)
        builder.put16(first + 2 * i, static_cast<std::uint32_t>(200 + i));
    return builder;
}

Rows cell(const char* identity)
{
    return {
        {"Physical Cell ID", identity}
    };
}

} // namespace

TEST_F(DetectedCellsTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Detected Cells");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(DetectedCellsTest, ReadsOneCellFromOffset41AfterTwoMeasuredOnes)
{
    send(kCode,
         PacketBuilder(kCode, 43).put8(27, 2).put8(28, 1).put16(29, 1).put16(39, 2).put16(41, 503));
    EXPECT_THAT(records(), ElementsAre(cell("503")));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Detected Cells"}));
}

TEST_F(DetectedCellsTest, FollowsDirectlyWhereNoCellWasMeasured)
{
    send(kCode, packet(0, 2, 2));
    EXPECT_THAT(records(), ElementsAre(cell("200"), cell("201")));
}

TEST_F(DetectedCellsTest, NoCellsEmptyTheList)
{
    send(kCode, packet(0, 2, 2));
    send(kCode, packet(1, 0, 2));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(DetectedCellsTest, ShowsTheLargestCounts)
{
    send(kCode, packet(255, 255, 255));
    ASSERT_EQ(records().size(), 255U);
    EXPECT_EQ(records().back(), cell("454"));
}

TEST_F(DetectedCellsTest, ACountBeyondThePacketShowsItsWholeCells)
{
    const Bytes three = packet(1, 255, 3);
    for (std::size_t size = 35; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        EXPECT_EQ(records().size(), (size - 35) / 2) << size;
    }
}

TEST_F(DetectedCellsTest, MeasuredCellsBeyondThePacketLeaveNone)
{
    send(kCode, packet(0, 1, 1));
    send(kCode, PacketBuilder(kCode, 60).put8(27, 255).put8(28, 3));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(DetectedCellsTest, APacketOfTheMinimumLengthWithoutRecordsEmptiesTheList)
{
    section.updateSectionRef(display);
    display.asArray()->append("shown before");
    send(kCode, PacketBuilder(kCode, 29));
    EXPECT_THAT(display.asArray()->elements(), IsEmpty());
}

TEST_F(DetectedCellsTest, ShorterPacketsKeepTheList)
{
    send(kCode, packet(0, 1, 1));
    expectShorterIsIgnored(kCode, packet(0, 0, 0), 29);
    EXPECT_THAT(records(), ElementsAre(cell("200")));
}

TEST_F(DetectedCellsTest, OtherCodesAreReportedAndKeepTheList)
{
    send(kCode, packet(0, 1, 1));
    expectReported(0xB178);
}

} // namespace orvane
