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
constexpr std::size_t kFirst = 17;

using TRCHBLERMeasurementTest = SectionTest<TRCHBLERMeasurement>;

// The packet says `count` and holds `present` channels: channel i has identity i.
PacketBuilder packet(std::uint32_t count, std::size_t present)
{
    PacketBuilder builder(kCode, kFirst + 2 * present);
    builder.putBits(14, 6, 6, count);
    for (std::size_t i = 0; i < present; ++i)
        builder.put8(kFirst + 2 * i, static_cast<std::uint32_t>(i));
    return builder;
}

Rows channel(const char* identity, const char* rate)
{
    return {
        {"TRCH ID",               identity},
        {"TRCH BLER Measurement", rate    }
    };
}

} // namespace

TEST_F(TRCHBLERMeasurementTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "TRCH BLER");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(TRCHBLERMeasurementTest, ReadsChannelsFromOffsets17And19And21)
{
    send(kCode, packet(0, 3)
                    .put8(14, 0xC0)
                    .put8(15, 0x20) // three, and two composite ones
                    .put8(17, 1)
                    .put8(18, 255)
                    .put8(19, 31)
                    .put8(20, 2)
                    .put8(21, 32)
                    .put8(22, 3));
    EXPECT_THAT(records(),
                ElementsAre(channel("1", "255"), channel("31", "2"), channel("32", "3")));
}

TEST_F(TRCHBLERMeasurementTest, TheCallIsLoggedAsANotice)
{
    send(kCode, packet(1, 1));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Notice, "TRCH BLER Measurement"}));
}

TEST_F(TRCHBLERMeasurementTest, TheCountIsSixBitsAcrossTwoBytes)
{
    send(kCode, packet(0, 63).put8(14, 0x3F).put8(15, 0xF0));
    EXPECT_THAT(records(), IsEmpty());
    send(kCode, packet(63, 64));
    EXPECT_EQ(records().size(), 63U);
    EXPECT_EQ(records().back(), channel("62", "0"));
}

TEST_F(TRCHBLERMeasurementTest, NoChannelsEmptyTheList)
{
    send(kCode, packet(2, 2));
    send(kCode, packet(0, 2));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(TRCHBLERMeasurementTest, ACountBeyondThePacketShowsItsWholeChannels)
{
    const Bytes three = packet(63, 3);
    for (std::size_t size = kFirst; size <= three.size(); ++size) {
        sendCut(kCode, three, size);
        EXPECT_EQ(records().size(), (size - kFirst) / 2) << size;
    }
}

TEST_F(TRCHBLERMeasurementTest, APacketOfTheMinimumLengthWithoutRecordsEmptiesTheList)
{
    section.updateSectionRef(display);
    display.asArray()->append("shown before");
    send(kCode, PacketBuilder(kCode, 17));
    EXPECT_THAT(display.asArray()->elements(), IsEmpty());
}

TEST_F(TRCHBLERMeasurementTest, ShorterPacketsKeepTheList)
{
    send(kCode, packet(1, 1));
    expectShorterIsIgnored(kCode, packet(0, 0), kFirst);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(TRCHBLERMeasurementTest, OtherCodesAreIgnoredSilentlyAndKeepTheList)
{
    send(kCode, packet(1, 1));
    send(0xD00D, packet(0, 0));
    EXPECT_EQ(records().size(), 1U);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
