#include "insight/ServingCell.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "recordings/LogDecoder.h"
#include "recordings/support/LogFiles.h"
#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

PropertyValue shown(const char* group, const char* row, const char* text)
{
    const PropertyValue rows = PropertyValue::newDictionary();
    rows.asDictionary()->set(row, text);
    const PropertyValue display = PropertyValue::newDictionary();
    display.asDictionary()->set(group, rows);
    return display;
}

TEST(ServingCellTest, EachOtherTextOfARowIsAnotherCell)
{
    const struct {
        const char* technology;
        const char* group;
        const char* row;
    } cases[] = {
        {kTSLogChannelTechnology_Varnel_LTE,    "Serving Cell Info",  "Physical Cell ID"    },
        {kTSLogChannelTechnology_Varnel_LTE,    "Serving Cell Info",  "Download Frequency"  },
        {kTSLogChannelTechnology_Varnel_LTE,    "Serving Cell Info",  "Cell Identity"       },
        {kTSLogChannelTechnology_Varnel_UTRAN2, "Serving Cell Info",  "Cell ID"             },
        {kTSLogChannelTechnology_Varnel_UTRAN2, "Serving Cell Info",  "Downlink UARFCN"     },
        {kTSLogChannelTechnology_Varnel_GSM,    "GSM Serving Cell",   "Cell ID"             },
        {kTSLogChannelTechnology_Varnel_GSM,    "GSM Serving Cell",   "ARFCN"               },
        {kTSLogChannelTechnology_Varnel_GSM,    "GSM Serving Cell",   "BSIC"                },
        {kTSLogChannelTechnology_Varnel_GSM,    "UMTS RR Info",       "Cell ID"             },
        {kTSLogChannelTechnology_Varnel_GSM,    "UMTS RR Info",       "Downlink Frequency"  },
        {kTSLogChannelTechnology_Varnel_CDMA,   "03;System Identity", "02;System ID"        },
        {kTSLogChannelTechnology_Varnel_CDMA,   "03;System Identity", "03;Network ID"       },
        {kTSLogChannelTechnology_Varnel_CDMA,   "03;System Identity", "04;Base ID"          },
        {kTSLogChannelTechnology_Varnel_CDMA,   "02;1xEV-DO",         "04;Channel"          },
        {kTSLogChannelTechnology_Varnel_CDMA,   "02;1xEV-DO",         "08;Serving PN Offset"},
    };
    for (const auto& each : cases) {
        ServingCell cell(each.technology);
        EXPECT_TRUE(cell.note(shown(each.group, each.row, "1"))) << each.row;
        EXPECT_FALSE(cell.note(shown(each.group, each.row, "1")));
        EXPECT_TRUE(cell.note(shown(each.group, each.row, "2"))) << each.row;
        EXPECT_FALSE(cell.note(shown(each.group, "Other", "2")));
    }
}

TEST(ServingCellTest, RowsThatShowNoCellLeaveItWhatItWas)
{
    ServingCell cell(kTSLogChannelTechnology_Varnel_CDMA);
    const auto pilot = [](const char* text) {
        return shown("02;1xEV-DO", "08;Serving PN Offset", text);
    };
    EXPECT_FALSE(cell.note({}));
    EXPECT_FALSE(cell.note(pilot("")));
    EXPECT_TRUE(cell.note(pilot("12 × 64chips")));
    EXPECT_FALSE(cell.note(pilot("Invalid Value")));
    EXPECT_FALSE(cell.note(pilot("")));
    EXPECT_FALSE(cell.note({}));
    EXPECT_FALSE(cell.note(pilot("12 × 64chips")));
}

TEST(ServingCellTest, RowsThatBecomeKnownLaterMakeNoOtherCell)
{
    ServingCell cell(kTSLogChannelTechnology_Varnel_LTE);
    const PropertyValue display = shown("Serving Cell Info", "Physical Cell ID", "7");
    EXPECT_TRUE(cell.note(display));
    display["Serving Cell Info"].asDictionary()->set("Download Frequency", "1300");
    EXPECT_FALSE(cell.note(display));
    display["Serving Cell Info"].asDictionary()->set("Cell Identity", "2470931");
    display["Serving Cell Info"].asDictionary()->set("Physical Cell ID", "8");
    EXPECT_TRUE(cell.note(display));
}

TEST(ServingCellTest, DisplaysWithoutSuchRowsHaveNoCell)
{
    ServingCell cell(kTSLogChannelTechnology_IFX);
    EXPECT_FALSE(cell.note(shown("Serving Cell Info", "Cell ID", "1")));
}

// The rows' names are those of the templates: every drive goes through several cells.
TEST(ServingCellTest, EachTechnologysDrivesHaveServingCells)
{
    TestServices services;
    services.useShippedResources();
    for (const RecordedDrive& drive : kDrives) {
        LogDecoder play(recordedLog(drive.file), drive.technology);
        for (play.lookAhead(); play.hasNext();)
            play.takeNext();
        EXPECT_GT(play.servingCellChanges(), 2U) << drive.file;
        RecordProperty(drive.file, static_cast<int>(play.servingCellChanges()));
    }
}

} // namespace
} // namespace orvane
