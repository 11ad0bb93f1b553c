#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"

#include <map>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kAccess = 0x51F5;
constexpr std::uint32_t kPlmn = 0x7135;
constexpr std::uint32_t kCellOptions = 0x51F6;
constexpr std::uint32_t kBroadcastChannel = 0x51FB;
constexpr std::uint32_t kPacketStatus = 0x51FD;
constexpr std::uint32_t kSystemInformation = 0x51F4;
constexpr std::uint32_t kMeasurement = 0x5137;

using Names = std::map<std::uint32_t, const char*>;

const Names kPositions = {
    {0,   "Located on BCCH"         },
    {1,   "Located on Extended BCCH"},
    {255, "Not Available"           },
};

const Names kControlOrders = {
    {0,   "NC0"          },
    {1,   "NC1"          },
    {2,   "NC2"          },
    {255, "Not Available"},
};

const Names kFlowControlSupports = {
    {0,   "Not Supported"},
    {1,   "Supported"    },
    {255, "Available"    },
};

const Names kThresholds = {
    {0,   "Barred (PKT access not allowed in the Cell)"},
    {1,   "Barred"                                     },
    {2,   "Barred"                                     },
    {3,   "1 Only"                                     },
    {4,   "1 to 2"                                     },
    {5,   "1 to 3"                                     },
    {6,   "1 to 4"                                     },
    {7,   "Allowed"                                    },
    {255, "Not Available"                              },
};

const Names kTimes = {
    {0, "500 ms" },
    {1, "1000 ms"},
    {2, "1500 ms"},
    {3, "0 ms"   },
    {4, "80 ms"  },
    {5, "120 ms" },
    {6, "160 ms" },
    {7, "200 ms" },
};

const Names kModes = {
    {0, "Class 1"},
    {1, "Class 2"},
    {2, "Class 3"},
};

class GPRSInformationTest : public SectionTest<GPRSInformation>
{
protected:
    // Sends the packet with every value of its byte.
    void expectNames(std::uint32_t code, std::size_t offset, const char* rowName,
                     const Names& names, const char* fallback)
    {
        for (std::uint32_t value = 0; value < 256; ++value) {
            send(code, PacketBuilder(code, 35).put8(offset, value));
            const auto name = names.find(value);
            EXPECT_EQ(row(rowName), name == names.end() ? fallback : name->second)
                << rowName << " " << value;
        }
    }
};

} // namespace

TEST_F(GPRSInformationTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "GPRS Information");
    EXPECT_THAT(section.getLogCodeArray(),
                ElementsAre(kAccess, kPlmn, kCellOptions, kBroadcastChannel, kPacketStatus,
                            kSystemInformation, kMeasurement));
}

TEST_F(GPRSInformationTest, SystemInformationShowsItsPosition)
{
    send(kSystemInformation, PacketBuilder(kSystemInformation, 15).put8(14, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"SI13 Position", "Located on Extended BCCH"}
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "GPRSInformation"}));
}

TEST_F(GPRSInformationTest, AccessPacketFillsItsRowsInOrder)
{
    send(kAccess, PacketBuilder(kAccess, 18).put8(13, 1).put8(14, 6).put8(15, 2));
    EXPECT_EQ(rows(), (Rows{
                          {"Network Control Order",     "NC2"      },
                          {"PFC Supported",             "Supported"},
                          {"Priority Access Threshold", "1 to 4"   },
    }));
}

TEST_F(GPRSInformationTest, CellOptionsFillTheirRowsInOrder)
{
    send(kCellOptions, PacketBuilder(kCellOptions, 24).put8(15, 2).put8(16, 30).put8(17, 0));
    EXPECT_EQ(rows(), (Rows{
                          {"T3192",             "1500 ms"     },
                          {"Access Burst Type", "8-bit format"},
                          {"DRX Timer Max",     "30"          },
    }));
}

TEST_F(GPRSInformationTest, BroadcastChannelShowsAsItsNumber)
{
    send(kBroadcastChannel, PacketBuilder(kBroadcastChannel, 34).put8(13, 255));
    EXPECT_EQ(rows(), (Rows{
                          {"PBCCH Present", "255"}
    }));
}

TEST_F(GPRSInformationTest, PacketStatusFillsItsRowsInOrder)
{
    PacketBuilder packet(kPacketStatus, 35);
    packet.put8(13, 11).put8(14, 12).put8(15, 13).put8(16, 14).put8(33, 1);
    send(kPacketStatus, packet);
    EXPECT_EQ(rows(), (Rows{
                          {"Ext Measurement Order", "14"       },
                          {"Packet PSI Status",     "11"       },
                          {"Packet SI Status",      "Supported"},
                          {"Count LR",              "12"       },
                          {"Count HR",              "13"       },
    }));
}

TEST_F(GPRSInformationTest, MeasurementsShowTheHysteresis)
{
    send(kMeasurement, PacketBuilder(kMeasurement, 29).put8(26, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"Cell Reselect Hysteresis", "Applied"}
    }));
}

TEST_F(GPRSInformationTest, TheServingNetworkShowsItsOperatingMode)
{
    send(kPlmn, PacketBuilder(kPlmn, 32).put8(13, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"Network Operating Mode", "Class 2"}
    }));
}

TEST_F(GPRSInformationTest, NamesEveryPosition)
{
    expectNames(kSystemInformation, 14, "SI13 Position", kPositions, "Unknown");
}

TEST_F(GPRSInformationTest, NamesEveryAccessValue)
{
    expectNames(kAccess, 15, "Network Control Order", kControlOrders, "Unknown");
    expectNames(kAccess, 13, "PFC Supported", kFlowControlSupports, "Unknown");
    expectNames(kAccess, 14, "Priority Access Threshold", kThresholds, "Unknown");
}

TEST_F(GPRSInformationTest, NamesEveryTimeAndMode)
{
    expectNames(kCellOptions, 15, "T3192", kTimes, "?? ms");
    expectNames(kPlmn, 13, "Network Operating Mode", kModes, "Unknown");
}

TEST_F(GPRSInformationTest, FlagsAreSetForEveryValueButZero)
{
    expectNames(kCellOptions, 17, "Access Burst Type",
                {
                    {0, "8-bit format"}
    },
                "11-bit format");
    expectNames(kPacketStatus, 33, "Packet SI Status",
                {
                    {0, "Not Supported"}
    },
                "Supported");
    expectNames(kMeasurement, 26, "Cell Reselect Hysteresis",
                {
                    {0, "Not Applied"}
    },
                "Applied");
}

TEST_F(GPRSInformationTest, OneUnavailableValueReadsAvailable)
{
    send(kAccess, PacketBuilder(kAccess, 18).put8(13, 255).put8(14, 255).put8(15, 255));
    EXPECT_EQ(rows(), (Rows{
                          {"Network Control Order",     "Not Available"},
                          {"PFC Supported",             "Available"    },
                          {"Priority Access Threshold", "Not Available"},
    }));
}

TEST_F(GPRSInformationTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    const std::pair<std::uint32_t, std::size_t> kMinimums[] = {
        {kSystemInformation, 15},
        {kAccess,            18},
        {kCellOptions,       24},
        {kBroadcastChannel,  34},
        {kPacketStatus,      35},
        {kMeasurement,       29},
        {kPlmn,              32},
    };
    for (const auto& [code, minimum] : kMinimums)
        expectShorterIsIgnored(code, PacketBuilder(code, minimum).put8(13, 1), minimum);
    EXPECT_THAT(rows(), IsEmpty());
    for (const auto& [code, minimum] : kMinimums)
        send(code, PacketBuilder(code, minimum));
    EXPECT_EQ(rows().size(), 15U);
    for (const auto& [code, minimum] : kMinimums) {
        PacketBuilder packet(code, minimum);
        for (std::size_t offset = 13; offset < minimum; ++offset)
            packet.put8(offset, 1);
        expectShorterIsIgnored(code, packet, minimum);
    }
}

TEST_F(GPRSInformationTest, TheCodesBetweenTheHandledOnesAreReported)
{
    for (const std::uint32_t code : {0x51F7U, 0x51F8U, 0x51F9U, 0x51FAU, 0x51FCU, 0x51FFU})
        expectReported(code);
}

} // namespace orvane
