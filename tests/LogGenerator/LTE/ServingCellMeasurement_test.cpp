#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kCode = 0xB17F;
constexpr std::size_t kSize = 33;

using ServingCellMeasurementTest = SectionTest<ServingCellMeasurement>;

struct Place {
    std::size_t byte;
    unsigned bit;
    unsigned bits;
};
constexpr Place kMaximumPower = {26, 7, 7};
constexpr Place kUserPower = {27, 6, 6};
constexpr Place kSearch = {30, 5, 6};
constexpr Place kOtherSearch = {31, 3, 6};

PacketBuilder packetWith(Place place, std::uint32_t value)
{
    PacketBuilder builder(kCode, kSize);
    return builder.putBits(place.byte, place.bit, place.bits, value);
}

PacketBuilder packet()
{
    PacketBuilder builder(kCode, kSize);
    return builder.put8(13, 4)
        .put16(17, 1300)
        .putBits(19, 0, 9, 501)
        .putBits(20, 1, 4, 7)
        .putBits(21, 0, 9, 181)
        .putBits(22, 1, 9, 300)
        .putBits(23, 2, 7, 77)
        .putBits(24, 1, 7, 90)
        .putBits(25, 0, 9, 161)
        .putBits(26, 1, 6, 9)
        .putBits(26, 7, 7, 53)
        .putBits(27, 6, 6, 53)
        .putBits(29, 0, 7, 70)
        .putBits(29, 7, 6, 41)
        .putBits(30, 5, 6, 31)
        .putBits(31, 3, 6, 4)
        .putBits(32, 1, 1, 1)
        .putBits(32, 2, 4, 9);
}

} // namespace

TEST_F(ServingCellMeasurementTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Serving Cell Measurements");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(ServingCellMeasurementTest, FillsItsRowsInOrderAndLogsItsName)
{
    send(kCode, packet());
    EXPECT_EQ(rows(), (Rows{
                          {"Version",                                "4"         },
                          {"E-ARFCN",                                "1300"      },
                          {"Physical Cell ID",                       "501"       },
                          {"Serving Layer Priority",                 "7"         },
                          {"Measured RSRP",                          "-94.75 dBm"},
                          {"Average RSRP",                           "-65.00 dBm"},
                          {"Measured RSRQ",                          "-10.75 dB" },
                          {"Average RSRQ",                           "-7.50 dB"  },
                          {"Measured RSSI",                          "-59.50 dBm"},
                          {"Qrxlevmin",                              "-122 dBm"  },
                          {"P_Max",                                  "23 dBm"    },
                          {"Max UE Tx Power",                        "23 dBm"    },
                          {"Srxlev",                                 "40 dBm"    },
                          {"Num of Consecutive DRX Cycles of S < 0", "41"        },
                          {"S Intra Search",                         "62 dB"     },
                          {"S Non Intra Search",                     "8 dBm"     },
                          {"Measurement Rules Updated",              "True"      },
                          {"Measurement Rules",                      "9"         },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Serving Cell Measurements"}));
}

// With all other bits set, a field that also reads bits of its neighbours is found out.
TEST_F(ServingCellMeasurementTest, EachFieldReadsItsOwnBitsOnly)
{
    const struct {
        const char* row;
        Place place;
        const char* textOfZero;
    } kFields[] = {
        {"Version",                                {13, 0, 8},  "0"          },
        {"E-ARFCN",                                {17, 0, 16}, "0"          },
        {"Physical Cell ID",                       {19, 0, 9},  "0"          },
        {"Serving Layer Priority",                 {20, 1, 4},  "0"          },
        {"Measured RSRP",                          {21, 0, 9},  "-140.00 dBm"},
        {"Average RSRP",                           {22, 1, 9},  "-140.00 dBm"},
        {"Measured RSRQ",                          {23, 2, 7},  "-30.00 dB"  },
        {"Average RSRQ",                           {24, 1, 7},  "-30.00 dB"  },
        {"Measured RSSI",                          {25, 0, 9},  "-140.00 dBm"},
        {"Qrxlevmin",                              {26, 1, 6},  "-140 dBm"   },
        {"P_Max",                                  {26, 7, 7},  "-30 dBm"    },
        {"Max UE Tx Power",                        {27, 6, 6},  "-30 dBm"    },
        {"Srxlev",                                 {29, 0, 7},  "-30 dBm"    },
        {"Num of Consecutive DRX Cycles of S < 0", {29, 7, 6},  "0"          },
        {"S Intra Search",                         {30, 5, 6},  "0 dB"       },
        {"S Non Intra Search",                     {31, 3, 6},  "0 dBm"      },
        {"Measurement Rules Updated",              {32, 1, 1},  "False"      },
        {"Measurement Rules",                      {32, 2, 4},  "0"          },
    };
    for (const auto& field : kFields) {
        PacketBuilder builder(kCode, kSize);
        for (std::size_t i = 13; i < kSize; ++i)
            builder.put8(i, 0xFF);
        send(kCode, builder.putBits(field.place.byte, field.place.bit, field.place.bits, 0));
        EXPECT_EQ(row(field.row), field.textOfZero) << field.row;
        send(kCode, packetWith(field.place, 0));
        const Rows allZero = rows();
        send(kCode, packetWith(field.place, (1U << field.place.bits) - 1));
        for (const auto& [name, text] : allZero)
            EXPECT_EQ(row(name) != text, name == field.row) << field.row << " and " << name;
    }
}

TEST_F(ServingCellMeasurementTest, ShowsTheLargestLevels)
{
    PacketBuilder builder(kCode, kSize);
    for (std::size_t i = 13; i < kSize; ++i)
        builder.put8(i, 0xFF);
    send(kCode, builder);
    EXPECT_EQ(row("Measured RSRP"), "-12.25 dBm");
    EXPECT_EQ(row("Average RSRQ"), "1.75 dB");
    EXPECT_EQ(row("Measured RSSI"), "115.50 dBm");
    EXPECT_EQ(row("Qrxlevmin"), "-14 dBm");
    EXPECT_EQ(row("P_Max"), "97 dBm");
    EXPECT_EQ(row("Srxlev"), "97 dBm");
    EXPECT_EQ(row("S Intra Search"), "126 dB");
}

TEST_F(ServingCellMeasurementTest, ShorterPacketsChangeNothing)
{
    send(kCode, PacketBuilder(kCode, kSize));
    expectShorterIsIgnored(kCode, packet(), kSize);
}

TEST_F(ServingCellMeasurementTest, AnAbsentMaximumPowerIsNamed)
{
    const std::pair<std::uint32_t, const char*> kPowers[] = {
        {0,  "-30 dBm"    },
        {63, "33 dBm"     },
        {64, "Not Present"},
        {65, "35 dBm"     },
    };
    for (const auto& [raw, text] : kPowers) {
        send(kCode, packetWith(kMaximumPower, raw));
        EXPECT_EQ(row("P_Max"), text) << raw;
    }
}

TEST_F(ServingCellMeasurementTest, MaxUeTxPowerIsAlwaysANumber)
{
    for (std::uint32_t raw = 0; raw < 64; ++raw) {
        send(kCode, packetWith(kUserPower, raw));
        EXPECT_EQ(row("Max UE Tx Power"), std::to_string(static_cast<int>(raw) - 30) + " dBm");
    }
}

TEST_F(ServingCellMeasurementTest, TheTwoSearchThresholdsHaveDifferentUnits)
{
    send(kCode, packetWith(kSearch, 5));
    EXPECT_EQ(row("S Intra Search"), "10 dB");
    send(kCode, packetWith(kOtherSearch, 5));
    EXPECT_EQ(row("S Non Intra Search"), "10 dBm");
}

TEST_F(ServingCellMeasurementTest, AnAbsentSearchThresholdIsNamed)
{
    for (const std::uint32_t raw : {31U, 33U}) {
        send(kCode, packetWith(kSearch, raw));
        EXPECT_EQ(row("S Intra Search"), std::to_string(2 * raw) + " dB");
        send(kCode, packetWith(kOtherSearch, raw));
        EXPECT_EQ(row("S Non Intra Search"), std::to_string(2 * raw) + " dBm");
    }
    send(kCode, packetWith(kSearch, 32));
    EXPECT_EQ(row("S Intra Search"), "Not Present");
    send(kCode, packetWith(kOtherSearch, 32));
    EXPECT_EQ(row("S Non Intra Search"), "Not Present");
}

TEST_F(ServingCellMeasurementTest, OtherCodesAreReported) { expectReported(0xB180); }

} // namespace orvane
