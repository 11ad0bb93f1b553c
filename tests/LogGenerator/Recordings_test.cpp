// Plays recordings through their generators. The expected values were decoded from the recordings
// without the sections.

#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "LogGenerator/support/SectionTest.h"
#include "dlf/DlfReader.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/FileSystem.h"
#include "support/Paths.h"

#include <functional>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

class RecordingsTest : public ::testing::Test
{
protected:
    RecordingsTest() { services.useShippedResources(); }

    // Plays the whole recording; `afterItem` is called after each item with its log code.
    void play(LogGenerator& generator, const std::string& name,
              const std::function<void(std::uint32_t code)>& afterItem)
    {
        const Bytes file = readFile(testDataPath(name)).value_or(Bytes());
        DlfReader reader(file);
        while (const auto item = reader.next()) {
            Bytes message = {item->type};
            message.insert(message.end(), item->bytes.begin(), item->bytes.end());
            generator.updateState(state, message);
            afterItem(item->logCode);
        }
    }
    [[nodiscard]] const PropertyValue& part(const char* section) const
    {
        return state[kDisplayKey][section];
    }
    [[nodiscard]] std::size_t length(const char* section) const
    {
        const PropertyArray* list = part(section).asArray();
        return list ? list->size() : 0;
    }

    TestServices services;
    PropertyDictionary state;
};

} // namespace

TEST_F(RecordingsTest, ADriveThroughLte)
{
    LTELogGenerator generator;
    generator.init();
    services.log.lines.clear();
    int cellChanges = -1;
    std::string identity;
    std::size_t neighbours = 0;
    std::size_t measured = 0;
    std::size_t detected = 0;
    std::size_t candidates = 0;
    play(generator, "lte-drive.dlf", [&](std::uint32_t code) {
        if (code == 0xB0C2 &&
            part("Serving Cell Info")["Cell Identity"].description() != identity) {
            identity = part("Serving Cell Info")["Cell Identity"].description();
            ++cellChanges;
        }
        neighbours += code == 0xB180 ? length("Neighbor Cells List") : 0;
        measured += code == 0xB179 ? length("Measured Neighbor Cells") : 0;
        detected += code == 0xB179 ? length("Detected Cells") : 0;
        candidates += code == 0xB186 ? length("Reselection Candidates List") : 0;
    });
    EXPECT_EQ(cellChanges, 23);
    EXPECT_EQ(neighbours, 1555U);
    EXPECT_EQ(measured, 1171U);
    EXPECT_EQ(detected, 258U);
    EXPECT_EQ(candidates, 138U);

    EXPECT_EQ(part("Serving Cell Info").description(),
              "{Physical Cell ID = 13; Download Frequency = 1300; Upload Frequency = 19300; "
              "Download Bandwidth = 20 MHz; Upload Bandwidth = 20 MHz; Cell Identity = 2470931; "
              "Tracking Area Code = 4302; Freq Band Indicator = 3; Num Tx Antennas = 2}");
    EXPECT_EQ(part("Serving Cell Measurements").description(),
              "{Version = 4; E-ARFCN = 1300; Physical Cell ID = 13; Serving Layer Priority = 5; "
              "Measured RSRP = -91.25 dBm; Average RSRP = -91.75 dBm; Measured RSRQ = -7.50 dB; "
              "Average RSRQ = -7.25 dB; Measured RSSI = -63.50 dBm; Qrxlevmin = -124 dBm; "
              "P_Max = 23 dBm; Max UE Tx Power = 23 dBm; Srxlev = 33 dBm; "
              "Num of Consecutive DRX Cycles of S < 0 = 0; S Intra Search = 62 dB; "
              "S Non Intra Search = 4 dBm; Measurement Rules Updated = True; "
              "Measurement Rules = 2}");
    EXPECT_EQ(part("Neighbor Measurements").description(),
              "{Version = 4; E-ARFCN = 1300; Qrxlevmin = -124 dBm}");
    const std::vector<Rows> neighbourRows = recordsOf(part("Neighbor Cells List"));
    ASSERT_EQ(neighbourRows.size(), 4U);
    EXPECT_EQ(neighbourRows[2], (Rows{
                                    {"Physical Cell ID",    "469"       },
                                    {"Measured RSSI",       "-71.50 dBm"},
                                    {"Measured RSRP",       "-97.50 dBm"},
                                    {"Average RSRP",        "-98.00 dBm"},
                                    {"Measured RSRQ",       "-13.75 dB" },
                                    {"Average RSRQ",        "-10.50 dB" },
                                    {"Srxlev",              "26 dBm"    },
                                    {"Frequency Offset",    "78"        },
                                    {"Ant 0 Frame Offset",  "781"       },
                                    {"Ant 0 Sample Offset", "222747"    },
                                    {"Ant 1 Frame Offset",  "781"       },
                                    {"Ant 1 Sample Offset", "222747"    }
    }));
    EXPECT_EQ(part("Connected mode LTE Intra-frequency Measurement").description(),
              "{E-ARFCN = 1300; Serving Physical Cell ID = 68; Subframe Number = 685; "
              "Serving Filtered RSRP = -93.75 dBm; Serving Filtered RSRQ = -7.88 dB}");
    EXPECT_EQ(part("Measured Neighbor Cells").description(),
              "({Physical Cell ID = 13; Filtered RSRP = -88.00 dBm; Filtered RSRQ = -16.50 dB}, "
              "{Physical Cell ID = 270; Filtered RSRP = -90.50 dBm; Filtered RSRQ = -16.38 dB}, "
              "{Physical Cell ID = 498; Filtered RSRP = -91.75 dBm; Filtered RSRQ = -14.38 dB})");
    EXPECT_EQ(part("Detected Cells").description(),
              "({Physical Cell ID = 410}, {Physical Cell ID = 469})");
    EXPECT_EQ(part("Reselection Candidates List").description(),
              "({Candidate Priority = 5; Candidate RAT Type = LTE; E ARFCN = 1300; Cell ID = 270}, "
              "{Candidate Priority = 1300; Candidate RAT Type = ??})");

    // Each packet about antennas is reported, and nothing else.
    EXPECT_EQ(services.log.errors(),
              std::vector<std::string>(24, "Received an unknown log message: 45249"));
}

TEST_F(RecordingsTest, AWalkThroughUtran)
{
    UTRANLogGenerator generator;
    generator.init();
    services.log.lines.clear();
    std::vector<std::string> states;
    std::size_t neighbours = 0;
    std::size_t gsmNeighbours = 0;
    std::size_t channels = 0;
    std::size_t compositeChannels = 0;
    play(generator, "utran-walk.dlf", [&](std::uint32_t code) {
        if (code == 0xD0E0)
            states.push_back(part("RRC Info")["State"].description());
        neighbours += code == 0xD00A ? length("Neighbor Cell List") : 0;
        gsmNeighbours += length("GSM Neighbor Cell List");
        channels += code == 0xD00C ? length("TRCH BLER") : 0;
        compositeChannels += code == 0xD00C ? length("CCTRCH SIR") : 0;
    });
    EXPECT_THAT(states,
                ElementsAre("Disconnected", "Cell URA PCH", "Cell PCH", "Cell DCH", "Disconnected",
                            "Cell Fach", "Connecting", "Cell URA PCH", "Disconnected", "Cell PCH",
                            "Cell PCH", "Disconnected", "Cell PCH", "Connecting", "Cell PCH"));
    EXPECT_EQ(neighbours, 1317U);
    EXPECT_EQ(gsmNeighbours, 0U); // although the packets carry 594
    EXPECT_EQ(channels, 587U);
    EXPECT_EQ(compositeChannels, 448U);

    EXPECT_EQ(part("Serving Cell Info").description(),
              "{Cell Access Restrictions = 0; Cell ID = 45533372; Downlink UARFCN = 10054; "
              "Uplink UARFCN = 9700; URA ID = 228; Allowed Access = All Calls}");
    const std::vector<Rows> neighbourRows = recordsOf(part("Neighbor Cell List"));
    ASSERT_EQ(neighbourRows.size(), 5U);
    EXPECT_EQ(neighbourRows[0], (Rows{
                                    {"UARFCN",      "10054"   },
                                    {"Cell ID",     "3"       },
                                    {"Filter RSCP", "0.347656"},
                                    {"Status",      "ASET"    },
                                    {"inJDCS",      "TRUE"    }
    }));
    EXPECT_EQ(neighbourRows[4], (Rows{
                                    {"UARFCN",      "10054"   },
                                    {"Cell ID",     "118"     },
                                    {"Filter RSCP", "0.378906"},
                                    {"inJDCS",      "FALSE"   }
    }));
    EXPECT_EQ(part("TRCH BLER").description(), "({TRCH ID = 1; TRCH BLER Measurement = 18}, "
                                               "{TRCH ID = 2; TRCH BLER Measurement = 0}, "
                                               "{TRCH ID = 3; TRCH BLER Measurement = 3})");
    EXPECT_EQ(part("CCTRCH SIR").description(),
              "({CCTRCH ID = 1; TSNUM = 1; SIR = (21, 30, 38, 11, 38, 18)})");
    EXPECT_THAT(services.log.errors(), ::testing::IsEmpty());
}

} // namespace orvane
