#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kCode = 0xB180;
constexpr std::size_t kFirst = 21;
constexpr std::size_t kStride = 20;
constexpr std::size_t kRead = 16; // the last four bytes of a record are not read

using NeighborCellsListTest = SectionTest<NeighborCellsList>;

// The packet says `count` (1 to 32) and holds `present` cells: cell i has identity 100 + i.
PacketBuilder packet(std::uint32_t count, std::size_t present)
{
    PacketBuilder builder(kCode, kFirst + kStride * present);
    builder.putBits(19, 6, 5, count - 1);
    for (std::size_t i = 0; i < present; ++i)
        builder.putBits(kFirst + kStride * i, 0, 9, static_cast<std::uint32_t>(100 + i));
    return builder;
}

PacketBuilder oneCell()
{
    PacketBuilder builder = packet(1, 1);
    return builder.putBits(kFirst, 0, 9, 501)
        .putBits(kFirst + 1, 1, 8, 161)
        .putBits(kFirst + 2, 1, 9, 81)
        .putBits(kFirst + 4, 0, 9, 300)
        .putBits(kFirst + 5, 1, 7, 77)
        .putBits(kFirst + 6, 0, 7, 90)
        .putBits(kFirst + 6, 7, 7, 70)
        .put16(kFirst + 8, 65535)
        .putBits(kFirst + 12, 0, 11, 2047)
        .putBits(kFirst + 13, 3, 19, 307200);
}

} // namespace

TEST_F(NeighborCellsListTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Neighbor Cells List");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(NeighborCellsListTest, FillsACellsRowsInOrder)
{
    send(kCode, oneCell());
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"Physical Cell ID",    "501"       },
                               {"Measured RSSI",       "-59.50 dBm"},
                               {"Measured RSRP",       "-99.50 dBm"},
                               {"Average RSRP",        "10.00 dBm" },
                               {"Measured RSRQ",       "-10.75 dB" },
                               {"Average RSRQ",        "-7.50 dB"  },
                               {"Srxlev",              "40 dBm"    },
                               {"Frequency Offset",    "65535"     },
                               {"Ant 0 Frame Offset",  "2047"      },
                               {"Ant 0 Sample Offset", "307200"    },
                               {"Ant 1 Frame Offset",  "2047"      },
                               {"Ant 1 Sample Offset", "307200"    },
    }));
}

TEST_F(NeighborCellsListTest, EachFieldReadsItsOwnBitsOnly)
{
    const struct {
        std::vector<std::string> rows;
        std::size_t byte;
        unsigned bit;
        unsigned bits;
    } kFields[] = {
        {{"Physical Cell ID"},                           0,  0, 9 },
        {{"Measured RSSI"},                              1,  1, 8 },
        {{"Measured RSRP"},                              2,  1, 9 },
        {{"Average RSRP"},                               4,  0, 9 },
        {{"Measured RSRQ"},                              5,  1, 7 },
        {{"Average RSRQ"},                               6,  0, 7 },
        {{"Srxlev"},                                     6,  7, 7 },
        {{"Frequency Offset"},                           8,  0, 16},
        {{"Ant 0 Frame Offset", "Ant 1 Frame Offset"},   12, 0, 11},
        {{"Ant 0 Sample Offset", "Ant 1 Sample Offset"}, 13, 3, 19},
    };
    send(kCode, PacketBuilder(kCode, kFirst + kStride));
    const Rows allZero = records()[0];
    for (const auto& field : kFields) {
        PacketBuilder ones(kCode, kFirst + kStride);
        for (std::size_t i = kFirst; i < kFirst + kStride; ++i)
            ones.put8(i, 0xFF);
        send(kCode, ones.putBits(kFirst + field.byte, field.bit, field.bits, 0));
        std::vector<std::string> zeroRows;
        for (const auto& [name, text] : allZero)
            if ((*display.asArray())[0][name].description() == text)
                zeroRows.push_back(name);
        EXPECT_EQ(zeroRows, field.rows);
    }
}

TEST_F(NeighborCellsListTest, TheSecondAntennaRepeatsTheFirst)
{
    PacketBuilder builder(kCode, kFirst + kStride);
    // All bytes after the first antenna's fields differ from those fields.
    for (std::size_t i = kFirst + 16; i < kFirst + kStride; ++i)
        builder.put8(i, 0xAA);
    send(kCode, builder.putBits(kFirst + 12, 0, 11, 5).putBits(kFirst + 13, 3, 19, 7));
    const PropertyValue& cell = (*display.asArray())[0];
    EXPECT_EQ(cell["Ant 1 Frame Offset"].description(), "5");
    EXPECT_EQ(cell["Ant 1 Sample Offset"].description(), "7");
}

TEST_F(NeighborCellsListTest, ACountFieldOfZeroIsOneCell)
{
    send(kCode, PacketBuilder(kCode, kFirst + 2 * kStride));
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(NeighborCellsListTest, ACountFieldOf31Is32Cells)
{
    send(kCode, packet(32, 33));
    ASSERT_EQ(records().size(), 32U);
    EXPECT_EQ(records()[31][0].second, "131");
}

TEST_F(NeighborCellsListTest, TheCountIsFiveBitsAcrossTwoBytes)
{
    send(kCode, packet(1, 40).putBits(19, 0, 16, 0xF83F));
    EXPECT_EQ(records().size(), 1U);
    send(kCode, packet(1, 40).putBits(19, 0, 16, 0x0100));
    EXPECT_EQ(records().size(), 5U);
}

TEST_F(NeighborCellsListTest, ACountBeyondThePacketShowsItsWholeCells)
{
    const Bytes three = packet(32, 3);
    for (std::size_t size = kFirst; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        EXPECT_EQ(records().size(), (size - kFirst + kStride - kRead) / kStride) << size;
    }
}

TEST_F(NeighborCellsListTest, APacketWithoutAWholeCellEmptiesTheList)
{
    send(kCode, oneCell());
    send(kCode, packet(1, 0));
    EXPECT_TRUE(records().empty());
}

TEST_F(NeighborCellsListTest, LogsTheCountAndEachCell)
{
    send(kCode, oneCell());
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Neighbor Cells List",
                            "Number of neighboring cells being reported: 1\n",
                            "Physical Cell ID: 501\n", "Measured RSSI: -59.500000\n",
                            "Measured RSSI: -99.500000\n", "Measured RSSI: 10.000000\n",
                            "Measured RSSI: -10.750000\n", "Measured RSSI: -7.500000\n"));
    EXPECT_EQ(services.log.warnings().size(), services.log.lines.size());
}

TEST_F(NeighborCellsListTest, EveryLevelIsLoggedAsTheRssi)
{
    send(kCode, packet(2, 2));
    EXPECT_EQ(services.log.count("Measured RSSI: -140.000000\n"), 6U);
    EXPECT_EQ(services.log.count("Measured RSSI: -30.000000\n"), 4U);
    EXPECT_EQ(services.log.count("Physical Cell ID: 100\n"), 1U);
    EXPECT_EQ(services.log.count("Physical Cell ID: 101\n"), 1U);
}

TEST_F(NeighborCellsListTest, LogsWhatThePacketClaimsAndTheCellsThatAreThere)
{
    send(kCode, packet(32, 1));
    EXPECT_EQ(services.log.count("Number of neighboring cells being reported: 32\n"), 1U);
    EXPECT_EQ(services.log.lines.size(), 8U);
}

TEST_F(NeighborCellsListTest, ShorterPacketsKeepTheList)
{
    send(kCode, oneCell());
    expectShorterIsIgnored(kCode, packet(1, 0), kFirst);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(NeighborCellsListTest, OtherCodesAreReportedAndKeepTheList)
{
    send(kCode, oneCell());
    expectReported(0xB181);
}

} // namespace orvane
