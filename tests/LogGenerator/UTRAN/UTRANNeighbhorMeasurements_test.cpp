#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xD00A;
constexpr std::size_t kFirst = 168;
constexpr std::size_t kStride = 16;
constexpr std::size_t kRead = 4; // of each record

using UTRANNeighbhorMeasurementsTest = SectionTest<UTRANNeighbhorMeasurements>;

// The packet says `count` and holds `present` cells: cell i is on channel 10000 + i.
PacketBuilder packet(std::uint32_t count, std::size_t present)
{
    PacketBuilder builder(kCode, kFirst + kStride * present);
    builder.putBits(16, 1, 7, count);
    for (std::size_t i = 0; i < present; ++i)
        builder.putBits(kFirst + kStride * i, 0, 14, static_cast<std::uint32_t>(10000 + i));
    return builder;
}

} // namespace

TEST_F(UTRANNeighbhorMeasurementsTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Neighbor Cell List");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(UTRANNeighbhorMeasurementsTest, FillsACellsRowsInOrderAndLogsAnotherTextThanItsName)
{
    send(kCode, packet(1, 1)
                    .putBits(kFirst, 0, 14, 16383)
                    .putBits(kFirst + 1, 6, 7, 101)
                    .putBits(kFirst + 2, 5, 8, 128)
                    .putBits(kFirst + 3, 5, 2, 1)
                    .putBits(kFirst + 3, 7, 1, 1));
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"UARFCN",      "16383"   },
                               {"Cell ID",     "101"     },
                               {"Filter RSCP", "0.500000"},
                               {"Status",      "MSET"    },
                               {"inJDCS",      "TRUE"    }
    }));
    EXPECT_THAT(services.log.lines, ElementsAre(RecordingLog::Line{LogPriority::Warning,
                                                                   "NeighbhorMeasurements List"}));
}

TEST_F(UTRANNeighbhorMeasurementsTest, EachFieldReadsItsOwnBitsOnly)
{
    const struct {
        const char* row;
        std::size_t byte;
        unsigned bit;
        unsigned bits;
        const char* zero;
    } kFields[] = {
        {"UARFCN",      0, 0, 14, "0"       },
        {"Cell ID",     1, 6, 7,  "0"       },
        {"Filter RSCP", 2, 5, 8,  "0.000000"},
        {"Status",      3, 5, 2,  "ASET"    },
        {"inJDCS",      3, 7, 1,  "FALSE"   },
    };
    for (const auto& field : kFields) {
        PacketBuilder builder = packet(1, 1).put32(kFirst, 0xFFFFFFFF);
        send(kCode, builder.putBits(kFirst + field.byte, field.bit, field.bits, 0));
        for (const auto& other : kFields)
            EXPECT_EQ((*display.asArray())[0][other.row].description() == other.zero,
                      field.row == other.row)
                << field.row << " and " << other.row;
    }
}

TEST_F(UTRANNeighbhorMeasurementsTest, TheFourthStatusHasNoRow)
{
    const std::pair<std::uint32_t, const char*> kStatuses[] = {
        {0, "ASET"  },
        {1, "MSET"  },
        {2, "DSET"  },
        {3, "(null)"}
    };
    for (const auto& [status, name] : kStatuses) {
        send(kCode, packet(1, 1).putBits(kFirst + 3, 5, 2, status));
        EXPECT_EQ((*display.asArray())[0]["Status"].description(), name);
        EXPECT_EQ(records()[0].size(), status == 3 ? 4U : 5U);
    }
}

TEST_F(UTRANNeighbhorMeasurementsTest, FilterRscpIsIn256thsAsPrintfWritesThem)
{
    for (std::uint32_t raw = 0; raw < 256; ++raw) {
        char text[32];
        std::snprintf(text, sizeof text, "%f", raw * 0.00390625);
        send(kCode, packet(1, 1).putBits(kFirst + 2, 5, 8, raw));
        EXPECT_EQ((*display.asArray())[0]["Filter RSCP"].description(), text);
    }
}

TEST_F(UTRANNeighbhorMeasurementsTest, TheCountIsTheUpperSevenBits)
{
    send(kCode, packet(0, 3).put8(16, 5));
    ASSERT_EQ(records().size(), 2U);
    EXPECT_EQ(records()[0][0].second, "10000"); // at 168
    EXPECT_EQ(records()[1][0].second, "10001"); // at 184
    send(kCode, packet(0, 3).put8(16, 1));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(UTRANNeighbhorMeasurementsTest, NoCellsEmptyTheListAlsoInAShortPacket)
{
    send(kCode, packet(2, 2));
    send(kCode, PacketBuilder(kCode, 21));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(UTRANNeighbhorMeasurementsTest, ShowsTheLargestCount)
{
    send(kCode, packet(127, 128));
    ASSERT_EQ(records().size(), 127U);
    EXPECT_EQ(records()[126][0].second, "10126");
}

TEST_F(UTRANNeighbhorMeasurementsTest, ACountBeyondThePacketShowsItsWholeCells)
{
    const Bytes three = packet(127, 3);
    for (std::size_t size = 21; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        const std::size_t whole = size < kFirst ? 0 : (size - kFirst + kStride - kRead) / kStride;
        EXPECT_EQ(records().size(), whole) << size;
    }
}

TEST_F(UTRANNeighbhorMeasurementsTest, ShorterPacketsKeepTheList)
{
    send(kCode, packet(2, 2));
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 21), 21);
    EXPECT_EQ(records().size(), 2U);
}

TEST_F(UTRANNeighbhorMeasurementsTest, OtherCodesAreIgnoredSilentlyAndKeepTheList)
{
    send(kCode, packet(2, 2));
    send(0xD00B, packet(0, 0));
    EXPECT_EQ(records().size(), 2U);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
