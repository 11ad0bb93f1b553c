#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kState = 0x512C;
constexpr std::uint32_t kMeasurement = 0x5137;
constexpr std::uint32_t kDtx = 0x5072;
constexpr std::uint32_t kCellOptions = 0x51F6;

using GSMRRInfoTest = SectionTest<GSMRRInfo>;

} // namespace

TEST_F(GSMRRInfoTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "GSM RR Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kState, kMeasurement, kDtx, kCellOptions));
}

TEST_F(GSMRRInfoTest, StatePacketFillsItsRowsInOrder)
{
    send(kState, PacketBuilder(kState, 17).put8(13, 5).put8(14, 200).put8(15, 7).put8(16, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"RR State",     "RR_IDLE"},
                          {"RR Sub State", "200"    },
                          {"RR Status",    "7"      },
                          {"RR Mode",      "Data"   },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "GSMRRInfo"}));
}

TEST_F(GSMRRInfoTest, NamesEveryStateAndNoOther)
{
    const char* const kStates[] = {
        "RR_INACTIVE",
        "RR_GOING_ACTIVE",
        "RR_GOING_INACTIVE",
        "RR_CELL_SELECTION",
        "RR_PLMN_LIST_CONSTRUCTION",
        "RR_IDLE",
        "RR_CELL_RESELECTION",
        "RR_CONNECTION_PENDING",
        "RR_CHOOSE_CELL",
        "RR_DATA_TRANSFER",
        "RR_NO_CHANNELS",
        "RR_CONNECTION_RELEASE",
        "RR_EARLY_CAMPED_WAIT_FOR_SI",
        "RR_W2G_INTERRAT_HANDOVER_ PROGRESS",
        "RR_W2G_INTERRAT_RESELECTION_PROGRESS",
        "RR_WAIT_FOR_EARLY_PSCAN",
        "GRR51",
        "GRR52",
        "RR_G2W_INTERRAT_RESELECTION_PROGRESS",
        "RR_G2W_INTERRAT_HANDOVER_ PROGRESS",
        "RR_CELL_REEST",
        "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS",
    };
    for (std::uint32_t state = 0; state < 256; ++state) {
        send(kState, PacketBuilder(kState, 17).put8(13, state));
        EXPECT_EQ(row("RR State"), state < 22 ? kStates[state] : "Unknown") << state;
    }
}

TEST_F(GSMRRInfoTest, ThreeStatesKeepABlankInTheirNames)
{
    const std::pair<std::uint32_t, const char*> kStates[] = {
        {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"},
        {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"},
        {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"},
    };
    for (const auto& [state, name] : kStates) {
        send(kState, PacketBuilder(kState, 17).put8(13, state));
        EXPECT_EQ(row("RR State"), name);
    }
}

TEST_F(GSMRRInfoTest, FlagsAreSetForEveryValueButZero)
{
    const struct {
        std::uint32_t value;
        const char* mode;
        const char* transmission;
    } kCases[] = {
        {0,   "Voice", "OFF"},
        {1,   "Data",  "ON" },
        {255, "Data",  "ON" },
    };
    for (const auto& [value, mode, transmission] : kCases) {
        send(kState, PacketBuilder(kState, 17).put8(16, value));
        EXPECT_EQ(row("RR Mode"), mode) << value;
        send(kDtx, PacketBuilder(kDtx, 20).put8(19, value));
        EXPECT_EQ(row("DTX Used"), transmission) << value;
    }
}

TEST_F(GSMRRInfoTest, MeasurementPacketShowsTheCriteriaOfTheServingCellUncut)
{
    send(kMeasurement,
         PacketBuilder(kMeasurement, 29).put8(15, 200).put32(16, 0x0001FFFF).put32(20, 0xFFFF0003));
    EXPECT_EQ(rows(), (Rows{
                          {"Serving Rx Level", "200"   },
                          {"Rx Quality Full",  "131071"},
                          {"Rx Quality Sub",   "-65533"},
    }));
}

TEST_F(GSMRRInfoTest, CellOptionsShowTheReceptionTimer)
{
    send(kCellOptions, PacketBuilder(kCellOptions, 24).put8(16, 255));
    EXPECT_EQ(rows(), (Rows{
                          {"DRX Used", "255 sec"}
    }));
}

TEST_F(GSMRRInfoTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    const std::pair<std::uint32_t, std::size_t> kMinimums[] = {
        {kState,       17},
        {kMeasurement, 29},
        {kDtx,         20},
        {kCellOptions, 24},
    };
    for (const auto& [code, minimum] : kMinimums)
        send(code, PacketBuilder(code, minimum));
    EXPECT_EQ(rows().size(), 9U);
    for (const auto& [code, minimum] : kMinimums) {
        PacketBuilder packet(code, minimum);
        for (std::size_t offset = 13; offset < minimum; ++offset)
            packet.put8(offset, 1);
        expectShorterIsIgnored(code, packet, minimum);
    }
}

TEST_F(GSMRRInfoTest, OtherCodesAreReported)
{
    expectReported(0x5076);
    expectReported(0x51F5);
}

} // namespace orvane
