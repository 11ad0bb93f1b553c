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

using ProcessCSTest = SectionTest<ProcessCS>;

} // namespace

TEST_F(ProcessCSTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Process CS");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kMm, kRegistration));
}

TEST_F(ProcessCSTest, MmPacketFillsItsRowsInOrder)
{
    send(kMm, PacketBuilder(kMm, 16).put8(13, 19).put8(14, 8).put8(15, 0));
    EXPECT_EQ(rows(), (Rows{
                          {"MM State",        "MM_IDLE"          },
                          {"MM Sub State",    "MM_NORMAL_SERVICE"},
                          {"LU Reject Cause", "UPDATED"          },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "ProcessCS"}));
}

TEST_F(ProcessCSTest, RegistrationPacketShowsTheServiceState)
{
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 6));
    EXPECT_EQ(rows(), (Rows{
                          {"MM Service State", "REG_STATE_OFFLINE"}
    }));
}

TEST_F(ProcessCSTest, NamesEveryValueAndNoOther)
{
    const ExpectedNames kSubStates = {
        {0, "MM_NULL_SUBSTATE"             },
        {1, "MM_NO_IMSI"                   },
        {2, "MM_PLMN_SEARCH"               },
        {3, "MM_LIMITED_SERVICE"           },
        {4, "MM_ATTEMPTING_TO_UPDATE"      },
        {5, "MM_LOCATION_UPDATE_NEEDED"    },
        {6, "MM_NO_CELL_AVAILABLE"         },
        {7, "MM_PLMN_SEARCH_NORMAL_SERVICE"},
        {8, "MM_NORMAL_SERVICE"            },
    };
    const ExpectedNames kUpdateStatuses = {
        {0, "UPDATED"                  },
        {1, "NOT_UPDATED"              },
        {2, "ROAMING_NOT_ALLOWED"      },
        {3, "LOCATION_AREA_NOT_ALLOWED"},
    };
    for (std::uint32_t value = 0; value < 256; ++value) {
        send(kMm, PacketBuilder(kMm, 16).put8(13, value).put8(14, value).put8(15, value));
        EXPECT_EQ(row("MM State"), expectedName(kMmStateNames, value)) << value;
        EXPECT_EQ(row("MM Sub State"), expectedName(kSubStates, value)) << value;
        EXPECT_EQ(row("LU Reject Cause"), expectedName(kUpdateStatuses, value)) << value;
        send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, value));
        EXPECT_EQ(row("MM Service State"), expectedName(kRegistrationStateNames, value)) << value;
    }
}

TEST_F(ProcessCSTest, HolesInTheStatesAreUnknown)
{
    for (const std::uint32_t hole : {1U, 2U, 4U, 11U, 12U, 16U, 24U, 26U, 255U}) {
        send(kMm, PacketBuilder(kMm, 16).put8(13, hole));
        EXPECT_EQ(row("MM State"), "Unknown") << hole;
    }
}

TEST_F(ProcessCSTest, TwoStatesKeepTheBlankInsideTheirNames)
{
    send(kMm, PacketBuilder(kMm, 16).put8(13, 20));
    EXPECT_EQ(row("MM State"), "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION");
    send(kMm, PacketBuilder(kMm, 16).put8(13, 21));
    EXPECT_EQ(row("MM State"), "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT");
}

TEST_F(ProcessCSTest, TheUpdateStatusIsCalledARejectCause)
{
    send(kMm, PacketBuilder(kMm, 16).put8(15, 2));
    EXPECT_EQ(row("LU Reject Cause"), "ROAMING_NOT_ALLOWED");
}

TEST_F(ProcessCSTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kMm, PacketBuilder(kMm, 16).put8(13, 19));
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 2));
    expectShorterIsIgnored(kMm, PacketBuilder(kMm, 16), 16);
    expectShorterIsIgnored(kRegistration, PacketBuilder(kRegistration, 16), 16);
}

TEST_F(ProcessCSTest, OtherCodesAreReported)
{
    expectReported(0x7130);
    expectReported(0x7135);
}

} // namespace orvane
