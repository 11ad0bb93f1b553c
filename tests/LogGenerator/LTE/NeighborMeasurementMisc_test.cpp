#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kCode = 0xB180;

using NeighborMeasurementMiscTest = SectionTest<NeighborMeasurementMisc>;

} // namespace

TEST_F(NeighborMeasurementMiscTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Neighbor Measurements");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(NeighborMeasurementMiscTest, FillsItsRowsInOrderAndLogsItsName)
{
    send(kCode, PacketBuilder(kCode, 21).put8(13, 4).put16(17, 65535).putBits(19, 0, 6, 9));
    EXPECT_EQ(rows(), (Rows{
                          {"Version",   "4"       },
                          {"E-ARFCN",   "65535"   },
                          {"Qrxlevmin", "-122 dBm"}
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Neighbor Measurements"}));
}

TEST_F(NeighborMeasurementMiscTest, TheLevelHasSixBits)
{
    send(kCode, PacketBuilder(kCode, 21));
    EXPECT_EQ(row("Qrxlevmin"), "-140 dBm");
    send(kCode, PacketBuilder(kCode, 21).put8(19, 0xFF));
    EXPECT_EQ(row("Qrxlevmin"), "-14 dBm");
}

TEST_F(NeighborMeasurementMiscTest, ShorterPacketsChangeNothing)
{
    send(kCode, PacketBuilder(kCode, 21));
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 21).put8(13, 1).put16(17, 2).put8(19, 3),
                           21);
}

TEST_F(NeighborMeasurementMiscTest, OtherCodesAreReported) { expectReported(0xB179); }

} // namespace orvane
