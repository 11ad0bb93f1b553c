#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"

#include "LogGenerator/GSM/VRN_GSMClassIndex.h"
#include "LogGenerator/support/CellRecord.h"
#include "LogGenerator/support/IndexOrder.h"
#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;

class VRN_GSMLogGeneratorTest : public ::testing::Test
{
protected:
    VRN_GSMLogGeneratorTest()
    {
        services.useShippedResources();
        generator = VRN_GSMLogGenerator::generator();
    }

    void send(const Bytes& message) { generator->updateState(*state.asDictionary(), message); }
    [[nodiscard]] const PropertyValue& section(const char* name) const
    {
        return state["Display"][name];
    }

    TestServices services;
    PropertyValue state = PropertyValue::newDictionary();
    std::unique_ptr<LogGenerator> generator;
};

} // namespace

TEST_F(VRN_GSMLogGeneratorTest, StartsTheLogOfItsCodesInTheOrderOfTheSections)
{
    const PropertyValue command = generator->getStartCommand();
    EXPECT_EQ(*command["SetState"].asString(), "Streaming");
    const std::vector<std::int64_t> modemCodes = {
        0x417A, 0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137, 0x5134,
        0x5076, 0x51F8, 0x51FF, 0x7130, 0x7132, 0x4005, 0x7131, 0x7150, 0x512C,
        0x5072, 0x4125, 0x4031, 0x4127, 0x4157, 0x4116, 0x4221};
    EXPECT_EQ(onlyThose(modemCodes, integersOf(command["SetVarnelLogCodes"])), modemCodes);
    const std::vector<std::int64_t> extraCodes = {1, 2, 0};
    EXPECT_EQ(onlyThose(extraCodes, integersOf(command["SetTsExtraCodes"])), extraCodes);
}

TEST_F(VRN_GSMLogGeneratorTest, SaysWhenItIsMadeAndWhenItGoes)
{
    EXPECT_THAT(services.log.errors(), ElementsAre("Creating VRN_GSMLogGenerator object"));
    services.log.lines.clear();
    generator.reset();
    // The base class logs the same line again.
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(StartsWith("VRN_GSMLogGenerator is destructed 0x"),
                            StartsWith("VRN_GSMLogGenerator is destructed 0x")));
    EXPECT_THAT(services.console.lines,
                ElementsAre("Deallocing VRN_GSMClassIndex", "Deallocing ClassIndex"));
}

TEST_F(VRN_GSMLogGeneratorTest, LogsItselfThenItsSectionsThenItsBases)
{
    VRN_GSMClassIndex index;
    std::vector<std::string> texts = services.log.texts();
    index.init();
    EXPECT_EQ(std::erase_if(
                  texts, [](const std::string& text) { return text.starts_with("Array Count: "); }),
              index.sections().size());
    EXPECT_THAT(texts, ElementsAre("Creating VRN_GSMLogGenerator object",
                                   StartsWith("Creating VRNLogGenerator2 object with 0x"),
                                   StartsWith("Creating Log object: 0x"), "Class Index: 1"));
    EXPECT_EQ(services.log.lines[1].text, "Array Count: 1");
}

TEST_F(VRN_GSMLogGeneratorTest, TheTemplateGivesEverySectionItsPartAndHoldsNothingElse)
{
    services.log.lines.clear();
    send(PacketBuilder(0x4125, 14));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    VRN_GSMClassIndex index;
    index.init();
    for (const auto& [name, owner] : index.sections())
        EXPECT_EQ(section(name.c_str()).type(), owner->subtreeType()) << name;
    EXPECT_EQ(state["Display"].asDictionary()->size(), index.sections().size());
}

TEST_F(VRN_GSMLogGeneratorTest, AnActiveSetPacketReachesAllFourSets)
{
    send(PacketBuilder(0x4125, 14));
    for (const char* set : {"Active Set", "Detected Set", "Monitored Set", "Virtual Active Set"})
        section(set).asArray()->append("earlier");
    services.log.lines.clear();
    send(PacketBuilder(0x417A, 16 + 15 + 44).put8(15, 1).put16(16 + 7, 300));
    EXPECT_THAT(recordsOf(section("Active Set")), ElementsAre(Rows{
                                                      {"Scrambling Code", "300"   },
                                                      {"RSCP",            "-55 dB"},
                                                      {"Energy Per Chip", "0 dB"  },
    }));
    for (const char* set : {"Detected Set", "Monitored Set", "Virtual Active Set"})
        EXPECT_TRUE(section(set).asArray()->empty()) << set;
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("ActiveSet", "DetectedSet", "MonitoredSet", "VirtualActiveSet"));
}

TEST_F(VRN_GSMLogGeneratorTest, AMeasurementPacketReachesAllFourSectionsEachWithItsReading)
{
    send(PacketBuilder(0x5137, 29 + 14)
             .put8(15, 70)
             .put32(16, 0x00010020)
             .put32(20, 0x00020030)
             .put8(26, 1)
             .put8(28, 1)
             .put16(29, 12)
             .put8(31, 80)
             .put32(32, 9));
    EXPECT_EQ(rowsOf(section("GPRS Information")), (Rows{
                                                       {"Cell Reselect Hysteresis", "Applied"}
    }));
    EXPECT_EQ(rowsOf(section("GSM Serving Cell")), (Rows{
                                                       {"RSSI",     "70 dBm"},
                                                       {"C1 Value", "32"    },
                                                       {"C2 Value", "48"    },
    }));
    EXPECT_THAT(recordsOf(section("Neighboring Cells")), ElementsAre(Rows{
                                                             {"ARFCN",    "12"},
                                                             {"RSSI",     "80"},
                                                             {"C1 Value", "9" },
    }));
    EXPECT_EQ(rowsOf(section("GSM RR Info")), (Rows{
                                                  {"Serving Rx Level", "70"    },
                                                  {"Rx Quality Full",  "65568" },
                                                  {"Rx Quality Sub",   "131120"},
    }));
}

TEST_F(VRN_GSMLogGeneratorTest, ARegistrationPacketReachesAllFourSections)
{
    send(PacketBuilder(0x7132, 16).put8(13, 1).put8(14, 1));
    for (const char* name : {"Process CO", "Process CS", "Process PS"})
        EXPECT_EQ(rowsOf(section(name)), (Rows{
                                             {"MM Service State", "REG_STATE_IDLE"}
        }))
            << name;
    EXPECT_EQ(rowsOf(section("Serving PLMN")), (Rows{
                                                   {"PLMN Sel Mod", "Manual"}
    }));
}

TEST_F(VRN_GSMLogGeneratorTest, ACellRecordReachesAllFiveSections)
{
    const PropertyValue umts = servingUmts({
        {kTSCellMonitorMCC,    262  },
        {kTSCellMonitorMNC,    1    },
        {kTSCellMonitorLAC,    7    },
        {kTSCellMonitorCellId, 8    },
        {kTSCellMonitorUARFCN, 10588},
        {kTSCellMonitorSCN,    9    }
    });
    const PropertyValue gsm = servingGsm({
        {kTSCellMonitorCellId, 10},
        {kTSCellMonitorARFCN,  11}
    });
    const PropertyValue gsmNeighbour = neighbouringGsm({
        {kTSCellMonitorARFCN, 12 },
        {kTSCellMonitorRSSI,  -40}
    });
    const PropertyValue umtsNeighbour = neighbouringUmts({
        {kTSCellMonitorUARFCN, 10563},
        {kTSCellMonitorSCN,    13   },
        {kTSCellMonitorRSCP,   -90  },
        {kTSCellMonitorECN0,   32767}
    });
    send(cellRecord({umts, gsm, gsmNeighbour, umtsNeighbour}));
    EXPECT_EQ(rowsOf(section("Serving PLMN")), (Rows{
                                                   {"Mobile Country Code", "262"},
                                                   {"Mobile Network Code", "1"  },
                                                   {"Location Area Code",  "7"  },
    }));
    EXPECT_EQ(rowsOf(section("UMTS RR Info")), (Rows{
                                                   {"Cell ID",         "8"    },
                                                   {"UARFCN",          "10588"},
                                                   {"Scrambling Code", "9"    },
    }));
    EXPECT_EQ(rowsOf(section("GSM Serving Cell")), (Rows{
                                                       {"Cell ID", "10"},
                                                       {"ARFCN",   "11"},
    }));
    EXPECT_THAT(recordsOf(section("Neighboring Cells")), ElementsAre(Rows{
                                                             {"ARFCN", "12"     },
                                                             {"RSSI",  "-80 dBm"},
    }));
    EXPECT_THAT(recordsOf(section("UMTS Set")), ElementsAre(Rows{
                                                    {"UARFCN",          "10563"  },
                                                    {"Scrambling Code", "13"     },
                                                    {"RSCP",            "-90 dBm"},
                                                    {"Energy Per Chip", ""       },
    }));
}

TEST_F(VRN_GSMLogGeneratorTest, CodesThatNoSectionListsAreIgnored)
{
    send(PacketBuilder(0x4125, 14));
    services.log.lines.clear();
    send(PacketBuilder(0x417B, 64));
    EXPECT_THAT(services.log.lines, IsEmpty());
}

} // namespace orvane
