#include "LogGenerator/Section.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr Field kRows[] = {bytesField("Row", 13, 1, decimal), bytesField("Late", 20, 1, decimal)};
constexpr Field kRecordRows[] = {bytesField("Record", 0, 1, decimal)};
constexpr RecordLayout kRecords = {countAt<13>, startAt<14>, 2, kRecordRows};

constexpr PacketLayout kRowPackets[] = {rowsPacket(7, 14, kRows), ownPacket(5, 0)};
constexpr SectionLayout kReporting = {"Lamp", "lamp called", UnknownCode::Report, kRowPackets};
constexpr SectionLayout kQuiet = {"Quiet", "quiet called", UnknownCode::Ignore, kRowPackets,
                                  LogPriority::Notice};
constexpr PacketLayout kListPackets[] = {recordsPacket(7, 14, kRecords), ownPacket(5, 0)};
constexpr SectionLayout kList = {"List", "list called", UnknownCode::Report, kListPackets};

template <const SectionLayout& Layout>
struct RowSection final : Section {
    RowSection() : Section(Layout) {}
};
struct RecordSection final : ListSection {
    RecordSection() : ListSection(kList) {}
};

using SectionLayoutTest = SectionTest<RowSection<kReporting>>;
using QuietSectionTest = SectionTest<RowSection<kQuiet>>;
using ListSectionTest = SectionTest<RecordSection>;

} // namespace

TEST_F(SectionLayoutTest, ItsCodesAreThePacketsInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Lamp");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(7, 5));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Dictionary);
}

TEST_F(SectionLayoutTest, EveryCallIsLoggedWhateverTheMessage)
{
    send(7, PacketBuilder(7, 14));
    send(7, PacketBuilder(7, 13));
    send(9, PacketBuilder(9, 14));
    EXPECT_EQ(services.log.count("lamp called"), 3U);
    EXPECT_EQ(services.log.warnings().size(), 3U);
}

TEST_F(SectionLayoutTest, ItsMinimumLengthDecidesNotItsFields)
{
    send(7, PacketBuilder(7, 14).put8(13, 3));
    EXPECT_EQ(rows(), (Rows{
                          {"Row", "3"}
    }));
    send(7, PacketBuilder(7, 13));
    EXPECT_EQ(row("Row"), "3");
}

TEST_F(SectionLayoutTest, ReportsOtherCodesAsSignedNumbers)
{
    expectReported(8);
    services.log.lines.clear();
    send(0xFFFFFFFF, PacketBuilder(8, 14));
    EXPECT_THAT(services.log.errors(), ElementsAre("Received an unknown log message: -1"));
}

TEST_F(QuietSectionTest, SaysNothingAboutOtherCodesAndLogsAtItsOwnPriority)
{
    send(8, PacketBuilder(8, 14));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Notice, "quiet called"}));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(ListSectionTest, EachPacketMakesTheListAnew)
{
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
    send(7, PacketBuilder(7, 18).put8(13, 2).put8(14, 3).put8(16, 4));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
                                   {"Record", "3"}
    },
                               Rows{{"Record", "4"}}));
    send(7, PacketBuilder(7, 18));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(ListSectionTest, AnElementTakenEarlierKeepsItsRows)
{
    send(7, PacketBuilder(7, 18).put8(13, 1).put8(14, 3));
    const PropertyValue taken = (*display.asArray())[0];
    send(7, PacketBuilder(7, 18).put8(13, 1).put8(14, 4));
    EXPECT_EQ(taken["Record"], PropertyValue("3"));
    EXPECT_EQ((*display.asArray())[0]["Record"], PropertyValue("4"));
}

TEST_F(ListSectionTest, APacketThatIsTooShortOrUnknownKeepsTheList)
{
    send(7, PacketBuilder(7, 18).put8(13, 1));
    send(7, PacketBuilder(7, 13));
    send(6, PacketBuilder(6, 18));
    EXPECT_EQ(records().size(), 1U);
}

} // namespace orvane
