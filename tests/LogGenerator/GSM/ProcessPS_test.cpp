#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/NasNames.h"
#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kGmm = 0x7130;
constexpr std::uint32_t kRegistration = 0x7132;

using ProcessPSTest = SectionTest<ProcessPS>;

} // namespace

TEST_F(ProcessPSTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Process PS");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kGmm, kRegistration));
}

TEST_F(ProcessPSTest, GmmPacketFillsItsRowsInOrder)
{
    send(kGmm, PacketBuilder(kGmm, 16).put8(13, 3).put8(14, 0).put8(15, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"MM State",            "GMM_REGISTERED"     },
                          {"MM Sub State",        "GMM_NORMAL_SERVICE" },
                          {"Attach Reject Cause", "GMM_GU2_NOT_UPDATED"},
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "ProcessPS"}));
}

TEST_F(ProcessPSTest, RegistrationPacketShowsTheServiceState)
{
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"MM Service State", "REG_STATE_IDLE"}
    }));
}

TEST_F(ProcessPSTest, NamesEveryValueAndNoOther)
{
    const ExpectedNames kStates = {
        {0, "GMM_NULL"                         },
        {1, "GMM_DEREGISTERED"                 },
        {2, "GMM_REGISTERED_INITIATED"         },
        {3, "GMM_REGISTERED"                   },
        {4, "GMM_DEREGISTERED_INITIATED"       },
        {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
        {6, "GMM_SERVICE_REQUEST_INITIATED"    },
    };
    const ExpectedNames kSubStates = {
        {0,  "GMM_NORMAL_SERVICE"         },
        {1,  "GMM_LIMITED_SERVICE"        },
        {2,  "GMM_ATTACH_NEEDED"          },
        {3,  "GMM_ATTEMPTING_TO_ATTACH"   },
        {4,  "GMM_NO_IMSI"                },
        {5,  "GMM_NO_CELL_AVAILABLE"      },
        {6,  "GMM_PLMN_SEARCH"            },
        {7,  "GMM_SUSPENDED"              },
        {8,  "GMM_UPDATE_NEEDED"          },
        {9,  "GMM_ATTEMPING_TO_UPDATE"    },
        {10, "GMM_ATTEMPTING_TO_UPDATE_MM"},
        {11, "GMM_IMSI_DETACH_INITIATED"  },
        {12, "GMM_NULL_SUBSTATE"          },
    };
    const ExpectedNames kUpdateStatuses = {
        {0, "GMM_GU1_UPDATED"                 },
        {1, "GMM_GU2_NOT_UPDATED"             },
        {2, "GMM_GU3_PLMN_NOT_ALLOWED"        },
        {3, "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"},
    };
    for (std::uint32_t value = 0; value < 256; ++value) {
        send(kGmm, PacketBuilder(kGmm, 16).put8(13, value).put8(14, value).put8(15, value));
        EXPECT_EQ(row("MM State"), expectedName(kStates, value)) << value;
        EXPECT_EQ(row("MM Sub State"), expectedName(kSubStates, value)) << value;
        EXPECT_EQ(row("Attach Reject Cause"), expectedName(kUpdateStatuses, value)) << value;
        send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, value));
        EXPECT_EQ(row("MM Service State"), expectedName(kRegistrationStateNames, value)) << value;
    }
}

TEST_F(ProcessPSTest, OneSubStateKeepsItsSpelling)
{
    send(kGmm, PacketBuilder(kGmm, 16).put8(14, 9));
    EXPECT_EQ(row("MM Sub State"), "GMM_ATTEMPING_TO_UPDATE");
}

TEST_F(ProcessPSTest, ItsRowsCarryTheNamesOfTheCircuitSwitchedOnes)
{
    send(kGmm, PacketBuilder(kGmm, 16));
    EXPECT_EQ(row("MM State"), "GMM_NULL");
    EXPECT_EQ(row("GMM State"), "(no row)");
}

TEST_F(ProcessPSTest, TheUpdateStatusIsCalledARejectCause)
{
    send(kGmm, PacketBuilder(kGmm, 16));
    EXPECT_EQ(row("Attach Reject Cause"), "GMM_GU1_UPDATED");
}

TEST_F(ProcessPSTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kGmm, PacketBuilder(kGmm, 16).put8(13, 3));
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 2));
    expectShorterIsIgnored(kGmm, PacketBuilder(kGmm, 16), 16);
    expectShorterIsIgnored(kRegistration, PacketBuilder(kRegistration, 16), 16);
}

TEST_F(ProcessPSTest, OtherCodesAreReported)
{
    expectReported(0x7131);
    expectReported(0xFF0001);
}

} // namespace orvane
