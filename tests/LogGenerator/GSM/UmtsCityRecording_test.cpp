// Five minutes of GSM and UMTS in a city, played through the generator. The expected
// values were decoded from the file without the sections.

#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"
#include "LogGenerator/support/RecordedMessages.h"
#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;

class UmtsCityRecordingTest : public ::testing::Test
{
protected:
    UmtsCityRecordingTest() : messages(recordedMessages("umts-city.dlf"))
    {
        services.useShippedResources();
        generator = VRN_GSMLogGenerator::generator();
        services.log.lines.clear();
    }

    // Plays on until the first `count` messages have been played.
    void playUpTo(std::size_t count)
    {
        for (; played < count && played < messages.size(); ++played)
            generator->updateState(*state.asDictionary(), messages[played]);
    }
    [[nodiscard]] const PropertyValue& section(const char* name) const
    {
        return state["Display"][name];
    }
    [[nodiscard]] std::string row(const char* name, const char* key) const
    {
        return section(name)[key].description();
    }

    TestServices services;
    std::vector<Bytes> messages;
    std::size_t played = 0;
    PropertyValue state = PropertyValue::newDictionary();
    std::unique_ptr<LogGenerator> generator;
};

Rows activeCell(const char* code, const char* power, const char* energy)
{
    return {
        {"Scrambling Code", code  },
        {"RSCP",            power },
        {"Energy Per Chip", energy},
    };
}

Rows rankedUmtsCell(const char* code, const char* power, const char* energy, const char* ranking,
                    const char* cellPower)
{
    return {
        {"Scrambling Code",    code     },
        {"RSCP",               power    },
        {"Energy Per Chip",    energy   },
        {"Downlink Frequency", "10713"  },
        {"Ranking Value",      ranking  },
        {"Rank Cell RSCP",     cellPower},
    };
}

Rows rankedGsmCell(const char* channel, const char* colour, const char* level, const char* ranking)
{
    return {
        {"ARFCN",         channel},
        {"BSIC",          colour },
        {"RSSI",          level  },
        {"Ranking Value", ranking},
    };
}

Rows neighbour(const char* channel, const char* level, const char* criterion, const char* colour)
{
    return {
        {"ARFCN",    channel  },
        {"RSSI",     level    },
        {"C1 Value", criterion},
        {"BSIC",     colour   },
    };
}

Rows process(const char* identity, const char* bits, const char* transmissions, const char* errors)
{
    return {
        {"Process ID",   identity     },
        {"No Rx Bits",   bits         },
        {"New Tx",       transmissions},
        {"Block Errors", errors       },
    };
}

Rows transportChannel(const char* identity, const char* received, const char* wrong)
{
    return {
        {"Transport Channel ID",  identity},
        {"CRC Received",          received},
        {"CRC Received in Error", wrong   },
    };
}

Rows network(const char* country, const char* code)
{
    return {
        {"Mobile Country Code", country},
        {"Mobile Network Code", code   },
    };
}

} // namespace

TEST_F(UmtsCityRecordingTest, TheMiddleShowsADataTransfer)
{
    ASSERT_THAT(messages, SizeIs(2928));
    playUpTo(1817);
    EXPECT_EQ(row("UMTS RR Info", "RRC State"), "CELL_DCH");
    EXPECT_EQ(row("UMTS RR Info", "Cell ID"), "28698576");
    EXPECT_EQ(row("UMTS RR Info", "Transmit Power"), "-11.67 dBm");
    EXPECT_EQ(row("GSM RR Info", "RR State"), "RR_DATA_TRANSFER");
    EXPECT_EQ(row("GPRS Information", "T3192"), "?? ms");
    EXPECT_THAT(recordsOf(section("Active Set")),
                ElementsAre(activeCell("363", "-115 dB", "-1 dB"),
                            activeCell("241", "-117 dB", "-3 dB"),
                            activeCell("489", "-116 dB", "-2 dB")));
    EXPECT_THAT(recordsOf(section("UMTS Set")),
                ElementsAre(rankedUmtsCell("84", "-98 dB", "-3.500000 dB", "-85", "-90 dB"),
                            rankedUmtsCell("142", "-93 dB", "-4.000000 dB", "-84", "-89 dB")));
    EXPECT_THAT(recordsOf(section("GSM Set")),
                ElementsAre(rankedGsmCell("10713", "84", "-77 dBm", "-90")));
    EXPECT_THAT(recordsOf(section("Neighboring Cells")),
                ElementsAre(neighbour("48", "74", "20", "42"), neighbour("17", "70", "21", "47"),
                            neighbour("31", "69", "22", "49"), neighbour("61", "68", "23", "38")));
    EXPECT_THAT(
        recordsOf(section("BLER")["Transport Channels"]),
        ElementsAre(transportChannel("1", "5205", "12"), transportChannel("2", "5205", "13")));
    EXPECT_EQ(row("HSDPA Info", "Carrier Info"), "Single Carrier");
    EXPECT_THAT(recordsOf(section("HSDPA Info")["Primary HARQ Process"]),
                ElementsAre(process("0", "1000204", "400", "7")));
    EXPECT_THAT(
        recordsOf(section("HSDPA Info")["Secondary HARQ Process"]),
        ElementsAre(process("0", "2000204", "300", "3"), process("1", "2000204", "300", "3")));
}

TEST_F(UmtsCityRecordingTest, TheEndShowsThePhoneIdle)
{
    playUpTo(messages.size());
    EXPECT_THAT(services.log.errors(), IsEmpty());

    EXPECT_EQ(rowsOf(section("Serving PLMN")), (Rows{
                                                   {"PLMN Sel Mod",        "Automatic"    },
                                                   {"Mobile Country Code", "262"          },
                                                   {"Mobile Network Code", "01 "          },
                                                   {"Location Area Code",  "4660"         },
                                                   {"Routing Area Code",   "7"            },
                                                   {"Service Type",        "CS_PS_SERVICE"},
    }));
    EXPECT_EQ(rowsOf(section("GSM Serving Cell")), (Rows{
                                                       {"Cell ID",            "31042" },
                                                       {"ARFCN",              "31"    },
                                                       {"BSIC",               "42"    },
                                                       {"MA Dedicated ARFCN", "35"    },
                                                       {"RSSI",               "60 dBm"},
                                                       {"C1 Value",           "36"    },
                                                       {"C2 Value",           "40"    },
    }));
    EXPECT_EQ(row("UMTS RR Info", "RRC State"), "Disconnected");
    EXPECT_EQ(row("UMTS RR Info", "Cell ID"), "143091015");
    EXPECT_EQ(row("UMTS RR Info", "Downlink Frequency"), "10713");
    EXPECT_EQ(row("UMTS RR Info", "Uplink Frequency"), "9763");
    EXPECT_EQ(row("UMTS RR Info", "URA ID"), "3");
    EXPECT_EQ(row("UMTS RR Info", "Ciphering"), "Enabled");
    EXPECT_EQ(row("UMTS RR Info", "Transmit Power"), "-22.50 dBm");
    EXPECT_EQ(row("GSM RR Info", "RR State"), "RR_IDLE");
    EXPECT_EQ(row("GSM RR Info", "RR Mode"), "Data");
    EXPECT_EQ(row("GSM RR Info", "Serving Rx Level"), "60");
    EXPECT_EQ(row("GSM RR Info", "Rx Quality Full"), "36");
    EXPECT_EQ(row("GSM RR Info", "DTX Used"), "OFF");
    EXPECT_EQ(row("GSM RR Info", "DRX Used"), "4 sec");
    EXPECT_EQ(rowsOf(section("Process CS")), (Rows{
                                                 {"MM Service State", "REG_STATE_IDLE"      },
                                                 {"MM State",         "MM_CONNECTION_ACTIVE"},
                                                 {"MM Sub State",     "MM_NORMAL_SERVICE"   },
                                                 {"LU Reject Cause",  "UPDATED"             },
    }));
    EXPECT_EQ(row("Process PS", "MM State"), "GMM_REGISTERED");
    EXPECT_EQ(row("Process CO", "MM State"), "MM_CONNECTION_ACTIVE");
    EXPECT_EQ(row("Mobile Allocation", "ARFCNs"), "(31, 76, 70, 17)");
    EXPECT_EQ(row("GPRS Information", "T3192"), "120 ms");
    EXPECT_EQ(row("GPRS Information", "Priority Access Threshold"), "Allowed");
    EXPECT_THAT(recordsOf(section("Equivalent PLMN List")),
                ElementsAre(network("262", "20"), network("200", "223")));
    EXPECT_THAT(
        recordsOf(section("Active Set")),
        ElementsAre(activeCell("317", "-117 dB", "-4 dB"), activeCell("281", "-116 dB", "-3 dB")));
    EXPECT_THAT(recordsOf(section("Neighboring Cells")),
                ElementsAre(neighbour("61", "64", "20", "58"), neighbour("78", "75", "21", "33"),
                            neighbour("48", "75", "22", "62"), neighbour("31", "75", "23", "0"),
                            neighbour("17", "50", "24", "8")));
    EXPECT_THAT(recordsOf(section("BLER")["Transport Channels"]), IsEmpty());
    EXPECT_THAT(recordsOf(section("HSDPA Info")["Primary HARQ Process"]),
                ElementsAre(process("0", "1000333", "400", "7")));
}

} // namespace orvane
