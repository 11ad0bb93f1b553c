#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xD00C;
constexpr std::size_t kStride = 8;

using CCTRCHSIRMeasurementTest = SectionTest<CCTRCHSIRMeasurement>;

std::size_t firstAfter(std::uint32_t transportChannels)
{
    return 289 + 34 * std::size_t{transportChannels};
}

// The packet says `transport` and `count`, and holds `present` channels: channel i has identity i.
PacketBuilder packet(std::uint32_t transport, std::uint32_t count, std::size_t present)
{
    const std::size_t first = firstAfter(transport);
    PacketBuilder builder(kCode, first + kStride * present);
    builder.putBits(14, 6, 6, transport).putBits(15, 4, 4, count);
    for (std::size_t i = 0; i < present; ++i)
        builder.put8(first + kStride * i, static_cast<std::uint32_t>(i));
    return builder;
}

} // namespace

TEST_F(CCTRCHSIRMeasurementTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "CCTRCH SIR");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(CCTRCHSIRMeasurementTest, FillsAChannelsRowsInOrderAndLogsTheCall)
{
    PacketBuilder builder = packet(0, 1, 1);
    for (std::uint32_t i = 0; i < kStride; ++i)
        builder.put8(289 + i, 255 - i);
    send(kCode, builder);
    EXPECT_THAT(
        records(),
        ElementsAre(Rows{
            {"CCTRCH ID", "255"                           },
            {"TSNUM",     "254"                           },
            {"SIR",       "(253, 252, 251, 250, 249, 248)"}
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "CCTRCH SIR Measurement"}));
}

TEST_F(CCTRCHSIRMeasurementTest, RatiosAreAnArrayOfSixTexts)
{
    send(kCode, packet(0, 1, 1));
    const PropertyArray* ratios = (*display.asArray())[0]["SIR"].asArray();
    ASSERT_TRUE(ratios);
    ASSERT_EQ(ratios->size(), 6U);
    for (const PropertyValue& ratio : *ratios)
        EXPECT_EQ(ratio, PropertyValue("0"));
}

TEST_F(CCTRCHSIRMeasurementTest, TheChannelsStartFarBehindTheTransportChannels)
{
    PacketBuilder builder(kCode, 407);
    builder.put8(14, 0xC0).put8(15, 0x20); // three transport channels, two composite ones
    send(kCode, builder.put8(391, 41).put8(399, 42));
    ASSERT_EQ(records().size(), 2U);
    EXPECT_EQ(records()[0][0].second, "41");
    EXPECT_EQ(records()[1][0].second, "42");
}

TEST_F(CCTRCHSIRMeasurementTest, WithoutTransportChannelsTheyStartAt289)
{
    send(kCode, PacketBuilder(kCode, 297).putBits(15, 4, 4, 1).put8(289, 77));
    ASSERT_EQ(records().size(), 1U);
    EXPECT_EQ(records()[0][0].second, "77");
}

TEST_F(CCTRCHSIRMeasurementTest, ShowsTheLargestCounts)
{
    send(kCode, packet(63, 15, 16));
    ASSERT_EQ(records().size(), 15U);
    EXPECT_EQ(records()[14][0].second, "14");
}

TEST_F(CCTRCHSIRMeasurementTest, NoChannelsEmptyTheList)
{
    send(kCode, packet(0, 1, 1));
    send(kCode, PacketBuilder(kCode, 400).put8(14, 0x3F).put8(15, 0x0F));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(CCTRCHSIRMeasurementTest, ACountBeyondThePacketShowsItsWholeChannels)
{
    const Bytes three = packet(1, 15, 3);
    for (std::size_t size = 17; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        EXPECT_EQ(records().size(), size < 323 ? 0 : (size - 323) / kStride) << size;
    }
}

TEST_F(CCTRCHSIRMeasurementTest, APacketOfTheMinimumLengthWithoutRecordsEmptiesTheList)
{
    section.updateSectionRef(display);
    display.asArray()->append("shown before");
    send(kCode, PacketBuilder(kCode, 17));
    EXPECT_THAT(display.asArray()->elements(), IsEmpty());
}

TEST_F(CCTRCHSIRMeasurementTest, ShorterPacketsKeepTheList)
{
    send(kCode, packet(0, 1, 1));
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 17), 17);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(CCTRCHSIRMeasurementTest, OtherCodesAreIgnoredSilentlyAndKeepTheList)
{
    send(kCode, packet(0, 1, 1));
    send(0xD00B, packet(0, 0, 0));
    EXPECT_EQ(records().size(), 1U);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
