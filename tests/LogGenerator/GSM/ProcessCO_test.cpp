#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/NasNames.h"
#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kMm = 0x7131;
constexpr std::uint32_t kRegistration = 0x7132;

using ProcessCOTest = SectionTest<ProcessCO>;

} // namespace

TEST_F(ProcessCOTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Process CO");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kMm, kRegistration));
}

TEST_F(ProcessCOTest, MmPacketShowsTheStateAlone)
{
    send(kMm, PacketBuilder(kMm, 16).put8(13, 19).put8(14, 1).put8(15, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"MM State", "MM_IDLE"}
    }));
}

TEST_F(ProcessCOTest, RegistrationPacketShowsTheServiceStateAlone)
{
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 2).put8(14, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"MM Service State", "REG_STATE_REGISTERING"}
    }));
}

TEST_F(ProcessCOTest, LogsTheTextOfTheCircuitSwitchedSection)
{
    send(kMm, PacketBuilder(kMm, 16));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "ProcessCS"}));
}

TEST_F(ProcessCOTest, NamesEveryStateAndNoOther)
{
    for (std::uint32_t value = 0; value < 256; ++value) {
        send(kMm, PacketBuilder(kMm, 16).put8(13, value));
        EXPECT_EQ(row("MM State"), expectedName(kMmStateNames, value)) << value;
        send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, value));
        EXPECT_EQ(row("MM Service State"), expectedName(kRegistrationStateNames, value)) << value;
    }
}

TEST_F(ProcessCOTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kMm, PacketBuilder(kMm, 16).put8(13, 19));
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 2));
    expectShorterIsIgnored(kMm, PacketBuilder(kMm, 16), 16);
    expectShorterIsIgnored(kRegistration, PacketBuilder(kRegistration, 16), 16);
}

TEST_F(ProcessCOTest, OtherCodesAreReported)
{
    expectReported(0x7130);
    expectReported(0x7133);
}

} // namespace orvane
