#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x4221;

class HSDPAInformationTest : public SectionTest<HSDPAInformation>
{
protected:
    [[nodiscard]] std::vector<Rows> primary() const
    {
        return recordsOf(display["Primary HARQ Process"]);
    }
    [[nodiscard]] std::vector<Rows> secondary() const
    {
        return recordsOf(display["Secondary HARQ Process"]);
    }
};

Rows process(const char* identity, const char* bits, const char* transmissions, const char* errors)
{
    return {
        {"Process ID",   identity     },
        {"No Rx Bits",   bits         },
        {"New Tx",       transmissions},
        {"Block Errors", errors       },
    };
}

PacketBuilder header(std::size_t size, std::uint32_t primary, std::uint32_t secondary)
{
    PacketBuilder packet(kCode, size);
    packet.put8(16, primary).put8(17, secondary);
    return packet;
}

void putProcess(PacketBuilder& packet, std::size_t offset, std::uint32_t identity)
{
    packet.put8(offset, identity)
        .put32(offset + 1, 1000 * identity)
        .put16(offset + 5, 100 * identity)
        .put16(offset + 7, 10 * identity);
}

// Two primary processes, 1 and 2, and a secondary one, 3.
Bytes threeProcesses()
{
    PacketBuilder packet = header(342 + 9, 2, 1);
    putProcess(packet, 18, 1);
    putProcess(packet, 27, 2);
    putProcess(packet, 342, 3);
    return packet;
}

} // namespace

TEST_F(HSDPAInformationTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "HSDPA Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(HSDPAInformationTest, PacketWithoutProcessesFillsItsRowsInOrder)
{
    send(kCode, header(18, 0, 0).put8(13, 255).putBits(14, 0, 10, 1000).putBits(15, 2, 2, 2));
    EXPECT_EQ(rows(), (Rows{
                          {"Version",      "255"         },
                          {"Sub Frames",   "1000"        },
                          {"Carrier Info", "Dual Carrier"},
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "HSDPA Info"}));
}

TEST_F(HSDPAInformationTest, SubFramesAndCarriersShareAByte)
{
    send(kCode, header(18, 0, 0).put8(14, 0xFF).put8(15, 0xF3));
    EXPECT_EQ(row("Sub Frames"), "1023");
    EXPECT_EQ(row("Carrier Info"), "Single Carrier");
    send(kCode, header(18, 0, 0).put8(14, 0).put8(15, 0xFC));
    EXPECT_EQ(row("Sub Frames"), "0");
    EXPECT_EQ(row("Carrier Info"), "Reserved");
}

TEST_F(HSDPAInformationTest, NamesEveryCarrierConfiguration)
{
    const char* const kNames[] = {"Single Carrier", "MIMO", "Dual Carrier", "Reserved"};
    for (std::uint32_t value = 0; value < 4; ++value) {
        send(kCode, header(18, 0, 0).putBits(15, 2, 2, value));
        EXPECT_EQ(row("Carrier Info"), kNames[value]);
    }
}

TEST_F(HSDPAInformationTest, ProcessesOfBothCarriersShow)
{
    send(kCode, threeProcesses());
    EXPECT_THAT(primary(),
                ElementsAre(process("1", "1000", "100", "10"), process("2", "2000", "200", "20")));
    EXPECT_THAT(secondary(), ElementsAre(process("3", "3000", "300", "30")));
}

TEST_F(HSDPAInformationTest, ThePrimaryCarriersProcessesTake162BytesEachBeforeTheSecondaryOnes)
{
    for (std::uint32_t count = 1; count < 4; ++count) {
        const std::size_t second = 18 + 162 * count;
        PacketBuilder packet = header(second + 9, count, 1);
        putProcess(packet, second, 5);
        putProcess(packet, 18 + 9 * count, 6);
        send(kCode, packet);
        EXPECT_THAT(secondary(), ElementsAre(process("5", "5000", "500", "50"))) << count;
    }
}

TEST_F(HSDPAInformationTest, WithoutPrimaryProcessesTheSecondaryOnesComeFirst)
{
    PacketBuilder packet = header(27, 0, 1);
    putProcess(packet, 18, 4);
    send(kCode, packet);
    EXPECT_THAT(secondary(), ElementsAre(process("4", "4000", "400", "40")));
    EXPECT_EQ(row("Primary HARQ Process"), "(no row)");
}

TEST_F(HSDPAInformationTest, NumbersShowUnsigned)
{
    send(kCode,
         header(27, 1, 0).put8(18, 255).put32(19, 0xFFFFFFFF).put16(23, 0xFFFF).put16(25, 0xFFFF));
    EXPECT_THAT(primary(), ElementsAre(process("255", "4294967295", "65535", "65535")));
}

TEST_F(HSDPAInformationTest, CountsOfZeroLeaveTheLastListsInPlace)
{
    send(kCode, threeProcesses());
    send(kCode, header(18, 0, 0).put8(13, 9));
    EXPECT_EQ(row("Version"), "9");
    EXPECT_EQ(primary().size(), 2U);
    EXPECT_EQ(secondary().size(), 1U);
}

TEST_F(HSDPAInformationTest, AListIsReplacedAsAWhole)
{
    send(kCode, threeProcesses());
    const PropertyValue earlier = display["Primary HARQ Process"];
    PacketBuilder packet = header(27, 1, 0);
    putProcess(packet, 18, 7);
    send(kCode, packet);
    EXPECT_THAT(primary(), ElementsAre(process("7", "7000", "700", "70")));
    EXPECT_EQ(earlier.asArray()->size(), 2U);
    EXPECT_EQ(secondary().size(), 1U);
}

TEST_F(HSDPAInformationTest, CountsBeyondThePacketShowTheWholeRecords)
{
    Bytes packet = threeProcesses();
    packet[17] = 255;
    const struct {
        std::size_t size;
        std::size_t primary;
        std::size_t secondary;
    } kCases[] = {
        {18,  0, 0},
        {26,  0, 0},
        {27,  1, 0},
        {35,  1, 0},
        {36,  2, 0},
        {342, 2, 0},
        {350, 2, 0},
        {351, 2, 1},
    };
    for (const auto& [size, first, second] : kCases) {
        sendCut(kCode, packet, size);
        EXPECT_EQ(primary().size(), first) << size;
        EXPECT_EQ(secondary().size(), second) << size;
    }
}

TEST_F(HSDPAInformationTest, ATruncatedPacketEmptiesTheListsItCountsAndKeepsTheOthers)
{
    send(kCode, threeProcesses());
    send(kCode, header(18, 2, 0));
    EXPECT_THAT(primary(), IsEmpty()) << "counted, but not one whole record there";
    EXPECT_EQ(secondary().size(), 1U) << "not counted";

    send(kCode, threeProcesses());
    send(kCode, header(18, 0, 1));
    EXPECT_EQ(primary().size(), 2U);
    EXPECT_THAT(secondary(), IsEmpty());
}

TEST_F(HSDPAInformationTest, TheLargestCountsAreShownWhole)
{
    const std::size_t second = 18 + 162 * 255;
    PacketBuilder packet = header(second + 9 * 255, 255, 255);
    putProcess(packet, 18 + 9 * 254, 1);
    putProcess(packet, second + 9 * 254, 2);
    send(kCode, packet);
    ASSERT_EQ(primary().size(), 255U);
    EXPECT_EQ(primary()[254], process("1", "1000", "100", "10"));
    ASSERT_EQ(secondary().size(), 255U);
    EXPECT_EQ(secondary()[254], process("2", "2000", "200", "20"));
}

TEST_F(HSDPAInformationTest, ShortPacketLeavesEarlierRowsInPlace)
{
    send(kCode, threeProcesses());
    expectShorterIsIgnored(kCode, header(18, 1, 1).put8(13, 9), 18);
}

TEST_F(HSDPAInformationTest, OtherCodesAreIgnoredSilently)
{
    send(kCode, threeProcesses());
    const PropertyValue before = display.deepCopy();
    send(0x4220, PacketBuilder(0x4220, 64));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_EQ(display, before);
}

TEST_F(HSDPAInformationTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, threeProcesses());
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
