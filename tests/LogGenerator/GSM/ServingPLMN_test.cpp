#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/NasNames.h"
#include "LogGenerator/support/CellRecord.h"
#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kPlmn = 0x7135;
constexpr std::uint32_t kRegistration = 0x7132;

using ServingPLMNTest = SectionTest<ServingPLMN>;

Bytes plmnPacket()
{
    return PacketBuilder(kPlmn, 32)
        .put8(13, 1)
        .put8(14, 3)
        .put8(15, 0x62)
        .put8(16, 0xF0)
        .put8(17, 0x10)
        .put8(18, 0x12)
        .put8(19, 0x34)
        .put8(20, 200);
}

} // namespace

TEST_F(ServingPLMNTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Serving PLMN");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kPlmn, kRegistration, kCellRecord));
}

TEST_F(ServingPLMNTest, PlmnPacketFillsItsRowsInOrder)
{
    send(kPlmn, plmnPacket());
    EXPECT_EQ(rows(), (Rows{
                          {"Mobile Country Code", "260"          },
                          {"Mobile Network Code", "01 "          },
                          {"Location Area Code",  "4660"         },
                          {"Routing Area Code",   "200"          },
                          {"Service Type",        "CS_PS_SERVICE"},
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Serving PLMN"}));
}

TEST_F(ServingPLMNTest, EveryDigitOfTheIdentityHasItsPlace)
{
    send(kPlmn, PacketBuilder(kPlmn, 32).put8(15, 0x21).put8(16, 0x63).put8(17, 0x54));
    EXPECT_EQ(row("Mobile Country Code"), "123");
    EXPECT_EQ(row("Mobile Network Code"), "456");
}

TEST_F(ServingPLMNTest, HalfBytesThatAreNoDigitsShowAsBlanks)
{
    send(kPlmn, PacketBuilder(kPlmn, 32).put8(15, 0xA9).put8(16, 0xFB).put8(17, 0xEC));
    EXPECT_EQ(row("Mobile Country Code"), "9  ");
    EXPECT_EQ(row("Mobile Network Code"), "   ");
}

TEST_F(ServingPLMNTest, RegistrationPacketShowsTheSelectionModeAlone)
{
    send(kRegistration, PacketBuilder(kRegistration, 16).put8(13, 2).put8(14, 1));
    EXPECT_EQ(rows(), (Rows{
                          {"PLMN Sel Mod", "Manual"}
    }));
}

TEST_F(ServingPLMNTest, NamesEveryValueAndNoOther)
{
    const ExpectedNames kModes = {
        {0, "Automatic"          },
        {1, "Manual"             },
        {2, "Limited"            },
        {3, "LIMITED_ROUTINE_ACQ"},
        {4, "LIMITED_MANUAL_ACQ" },
    };
    const ExpectedNames kServices = {
        {0, "NO_SERVICE"     },
        {1, "CS_ONLY"        },
        {2, "PS_ONLY"        },
        {3, "CS_PS_SERVICE"  },
        {4, "LIMITED_SERVICE"},
    };
    for (std::uint32_t value = 0; value < 256; ++value) {
        send(kRegistration, PacketBuilder(kRegistration, 16).put8(14, value));
        EXPECT_EQ(row("PLMN Sel Mod"), expectedName(kModes, value)) << value;
        send(kPlmn, PacketBuilder(kPlmn, 32).put8(14, value));
        EXPECT_EQ(row("Service Type"), expectedName(kServices, value)) << value;
    }
}

TEST_F(ServingPLMNTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kPlmn, plmnPacket());
    send(kRegistration, PacketBuilder(kRegistration, 16));
    expectShorterIsIgnored(kPlmn, PacketBuilder(kPlmn, 32), 32);
    expectShorterIsIgnored(kRegistration, PacketBuilder(kRegistration, 16).put8(14, 3), 16);
}

TEST_F(ServingPLMNTest, OtherCodesAreReported)
{
    expectReported(0x7131);
    expectReported(0x7134);
}

TEST_F(ServingPLMNTest, TheServingCellOfEitherTechnologyFillsTheRows)
{
    for (const PropertyValue& serving : {
             servingUmts(
                 {{kTSCellMonitorMCC, 262}, {kTSCellMonitorMNC, 1}, {kTSCellMonitorLAC, 77}}
                 ),
             servingGsm(
                 {{kTSCellMonitorMCC, 262}, {kTSCellMonitorMNC, 1}, {kTSCellMonitorLAC, 77}}
                 ),
    }) {
        display.asDictionary()->clear();
        send(kCellRecord, cellRecord({serving}));
        EXPECT_EQ(rows(), (Rows{
                              {"Mobile Country Code", "262"},
                              {"Mobile Network Code", "1"  },
                              {"Location Area Code",  "77" },
        }));
    }
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(ServingPLMNTest, TheFirstServingCellIsTaken)
{
    send(kCellRecord, cellRecord({
                          neighbouringUmts({{kTSCellMonitorMCC, 1}}
                          ),
                          cellOf(kTSCellMonitorRadioAccessTechnologyLTE,
                                 kTSCellMonitorCellTypeServing, {{kTSCellMonitorMCC, 2}}
                          ),
                          servingGsm({{kTSCellMonitorMCC, 3}}
                          ),
                          servingUmts({{kTSCellMonitorMCC, 4}}
                          ),
    }));
    EXPECT_EQ(row("Mobile Country Code"), "3");
}

TEST_F(ServingPLMNTest, PacketAndCellsShowTheCodesDifferentlyInTheSameRows)
{
    send(kPlmn, plmnPacket());
    EXPECT_EQ(row("Mobile Network Code"), "01 ");
    const auto cells = cellRecord({
        servingUmts(
            {{kTSCellMonitorMCC, 260}, {kTSCellMonitorMNC, 1}, {kTSCellMonitorLAC, 4660}}
            )
    });
    send(kCellRecord, cells);
    EXPECT_EQ(row("Mobile Network Code"), "1");
    send(kPlmn, plmnPacket());
    EXPECT_EQ(row("Mobile Network Code"), "01 ");
}

TEST_F(ServingPLMNTest, EachMissingNumberIsLoggedAndItsRowLeft)
{
    send(kPlmn, plmnPacket());
    services.log.lines.clear();
    send(kCellRecord, cellRecord({servingGsm()}));
    EXPECT_THAT(services.log.errors(), ElementsAre("ServingPLMN: Failed to retrieve MCC\n",
                                                   "ServingPLMN: Failed to retrieve MNC\n",
                                                   "ServingPLMN: Failed to retrieve LAC\n"));
    EXPECT_EQ(row("Mobile Country Code"), "260");
    EXPECT_EQ(row("Location Area Code"), "4660");
}

TEST_F(ServingPLMNTest, AFailedNumberDoesNotKeepTheNextFromBeingShown)
{
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorLAC, 5}}
                          )
    }));
    EXPECT_EQ(rows(), (Rows{
                          {"Location Area Code", "5"}
    }));
}

TEST_F(ServingPLMNTest, CellsThatAreOfNoUseChangeNothing)
{
    send(kPlmn, plmnPacket());
    const Rows before = rows();
    services.log.lines.clear();
    send(kCellRecord, cellRecord({}));
    send(kCellRecord, cellRecord({
                          neighbouringGsm({{kTSCellMonitorMCC, 1}}
                          )
    }));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    send(kCellRecord, PacketBuilder::withText(kCellRecord, "nonsense"));
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
    services.log.lines.clear();
    send(kCellRecord, PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary()));
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
    EXPECT_EQ(rows(), before);
}

TEST_F(ServingPLMNTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kPlmn, plmnPacket());
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorLAC, 5}}
                          )
    }));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
