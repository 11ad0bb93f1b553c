#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xD00E;
constexpr std::size_t kFirst = 17;
constexpr std::size_t kStride = 8;

using GSMNeighbhorMeasurementsTest = SectionTest<GSMNeighbhorMeasurements>;

// The packet says `count` and holds `present` cells.
PacketBuilder packet(std::uint32_t count, std::size_t present)
{
    PacketBuilder builder(kCode, kFirst + kStride * present);
    return builder.put8(16, count);
}

// The rows that the section decodes but does not show.
std::vector<Rows> decoded(const Bytes& bytes)
{
    const Bytes exact(bytes.begin(), bytes.end());
    const PropertyValue cells = PropertyValue::newArray();
    cells.asArray()->replaceElements(GSMNeighbhorMeasurements::decodedCells(PacketView(exact)));
    return recordsOf(cells);
}

} // namespace

TEST_F(GSMNeighbhorMeasurementsTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "GSM Neighbor Cell List");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(GSMNeighbhorMeasurementsTest, DecodesACellsRowsInOrder)
{
    EXPECT_THAT(decoded(packet(1, 1)
                            .putBits(kFirst, 0, 14, 16383)
                            .putBits(kFirst + 1, 7, 1, 1)
                            .put8(kFirst + 2, 7)
                            .put8(kFirst + 3, 255)
                            .put16(kFirst + 4, 65535)
                            .put8(kFirst + 6, 0xA6)
                            .put8(kFirst + 7, 0xFF)),
                ElementsAre(Rows{
                    {"Cell ID",        "16383"},
                    {"Band Indicator", "0"    },
                    {"BSIC Valid",     "1"    },
                    {"NCC",            "7"    },
                    {"BCC",            "255"  },
                    {"ARFCN",          "65535"},
                    {"RSSI",           "-90"  }
    }));
    EXPECT_EQ(decoded(packet(1, 1).put8(kFirst + 1, 0x40))[0][1].second, "1");
}

TEST_F(GSMNeighbhorMeasurementsTest, DecodesAsManyCellsAsThePacketSaysAndHolds)
{
    EXPECT_THAT(decoded(packet(0, 2)), IsEmpty());
    EXPECT_EQ(decoded(packet(1, 2)).size(), 1U);
    EXPECT_EQ(decoded(packet(255, 255)).size(), 255U);
    const Bytes three = packet(255, 3);
    for (std::size_t size = kFirst; size <= three.size(); ++size) {
        const Bytes cut(three.begin(), three.begin() + static_cast<std::ptrdiff_t>(size));
        EXPECT_EQ(decoded(cut).size(), (size - kFirst) / kStride) << size;
    }
}

TEST_F(GSMNeighbhorMeasurementsTest, EveryPacketLeavesTheListEmpty)
{
    for (const std::size_t present : {0U, 1U, 3U}) {
        display.asArray()->append("earlier");
        send(kCode, packet(static_cast<std::uint32_t>(present), present));
        EXPECT_EQ(display, PropertyValue::newArray()) << present;
    }
}

TEST_F(GSMNeighbhorMeasurementsTest, LogsItsNameAndNothingElse)
{
    send(kCode, packet(2, 2));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "GSM Neighbor Cell List"}));
}

TEST_F(GSMNeighbhorMeasurementsTest, ShorterPacketsKeepTheList)
{
    display.asArray()->append("earlier");
    expectShorterIsIgnored(kCode, packet(0, 0), kFirst);
    EXPECT_EQ(display.asArray()->size(), 1U);
}

TEST_F(GSMNeighbhorMeasurementsTest, OtherCodesAreIgnoredSilentlyAndKeepTheList)
{
    display.asArray()->append("earlier");
    send(0xD00A, packet(0, 0));
    EXPECT_EQ(display.asArray()->size(), 1U);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
