#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kCode = 0xB179;
constexpr const char* kName = "Connected mode LTE Intra-frequency Measurement";

using ConnectedModeMeasurementMiscTest = SectionTest<ConnectedModeMeasurementMisc>;

Bytes packet(std::size_t size = 29)
{
    return PacketBuilder(kCode, size)
        .put16(17, 65535)
        .put16(19, 503)
        .put16(21, 10239)
        .put16(23, 177)
        .put16(25, 77);
}

} // namespace

TEST_F(ConnectedModeMeasurementMiscTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), kName);
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(ConnectedModeMeasurementMiscTest, FillsItsRowsInOrderAndLogsItsName)
{
    send(kCode, packet());
    EXPECT_EQ(rows(), (Rows{
                          {"E-ARFCN",                  "65535"     },
                          {"Serving Physical Cell ID", "503"       },
                          {"Subframe Number",          "10239"     },
                          {"Serving Filtered RSRP",    "-95.75 dBm"},
                          {"Serving Filtered RSRQ",    "-10.38 dB" }, // -10.375
    }));
    EXPECT_THAT(services.log.lines, ElementsAre(RecordingLog::Line{LogPriority::Warning, kName}));
}

TEST_F(ConnectedModeMeasurementMiscTest, ShorterPacketsChangeNothing)
{
    send(kCode, PacketBuilder(kCode, 29));
    expectShorterIsIgnored(kCode, packet(), 29);
}

TEST_F(ConnectedModeMeasurementMiscTest, LevelsOfZeroAreTheLowest)
{
    send(kCode, PacketBuilder(kCode, 29));
    EXPECT_EQ(row("Serving Filtered RSRP"), "-140.00 dBm");
    EXPECT_EQ(row("Serving Filtered RSRQ"), "-20.00 dB");
}

TEST_F(ConnectedModeMeasurementMiscTest, TiesRoundToEvenAsPrintfDoes)
{
    const std::pair<std::uint32_t, const char*> kQualities[] = {
        {1,     "-19.88 dB" }, // -19.875
        {3,     "-19.62 dB" }, // -19.625
        {159,   "-0.12 dB"  }, // -0.125
        {160,   "0.00 dB"   },
        {161,   "0.12 dB"   }, // 0.125
        {65535, "8171.88 dB"}, // 8171.875
    };
    for (const auto& [raw, text] : kQualities) {
        send(kCode, PacketBuilder(kCode, 29).put16(25, raw));
        EXPECT_EQ(row("Serving Filtered RSRQ"), text) << raw;
    }
}

TEST_F(ConnectedModeMeasurementMiscTest, NumbersOfCellsDoNotMatter)
{
    send(kCode, PacketBuilder(kCode, 29).put8(27, 255).put8(28, 255).put16(17, 1300));
    EXPECT_EQ(row("E-ARFCN"), "1300");
}

TEST_F(ConnectedModeMeasurementMiscTest, OtherCodesAreReported) { expectReported(0xB17F); }

} // namespace orvane
