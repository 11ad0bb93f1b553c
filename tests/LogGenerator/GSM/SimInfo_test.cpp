#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

#include <span>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xFF0000;

using SimInfoTest = SectionTest<SimInfo>;
using UnknownDataException = LogCode_0xFF0000::UnknownDataException;

constexpr std::pair<const char*, const char*> kFiles[] = {
    {"kSimFile_ICCID",    "EF-ICCID"                       },
    {"kSimFile_MSISDN",   "EF-MSISDN"                      },
    {"kSimFile_MBDN",     "EF-3GPP MAIL BOX DIALING NUMBER"},
    {"kSimFile_HPPLMN",   "EF-HPPLMN SEARCH PERIOD"        },
    {"kSimFile_LOCI",     "EF-LOCI"                        },
    {"kSimFile_PSLOCI",   "EF-GPRS/PS-LOCI"                },
    {"kSimFile_ACC",      "EF-ACCESS CONTROL CLASS"        },
    {"kSimFile_AD",       "EF-ADMINISTRATIVE DATA"         },
    {"kSimFile_FPLMN",    "EF-FPLMN"                       },
    {"kSimFile_AHPLMN",   "EF-ACTING HPLMN"                },
    {"kSimFile_RATMODE",  "EF-RAT MODE"                    },
    {"kSimFile_PNN",      "EF-PLMN NETWORK NAME"           },
    {"kSimFile_OPL",      "EF-OPERATOR PLMN LIST"          },
    {"kSimFile_OPLMNAcT", "EF-OPLMNAcT"                    },
};

Bytes record(const PropertyValue& root) { return PacketBuilder::withPropertyList(kCode, root); }

// All files in the opposite order, each with its key as content.
PropertyValue allFiles()
{
    PropertyValue files = PropertyValue::newDictionary();
    for (auto file = std::rbegin(kFiles); file != std::rend(kFiles); ++file)
        files.asDictionary()->set(file->first, file->first);
    return files;
}

} // namespace

TEST_F(SimInfoTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "SIM Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(SimInfoTest, ShowsEveryFileInTheTablesOrderAndLogsTheCall)
{
    send(kCode, record(allFiles()));
    Rows expected;
    for (const auto& [key, row] : kFiles)
        expected.emplace_back(row, key);
    EXPECT_EQ(rows(), expected);
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "SimInfo"}));
}

TEST_F(SimInfoTest, AFileThatIsNoLongerReportedKeepsItsRow)
{
    send(kCode, record(allFiles()));
    send(kCode, record(PropertyValue::dictionaryOf({
                    {"kSimFile_ICCID", "8901"}
    })));
    EXPECT_EQ(row("EF-ICCID"), "8901");
    for (const auto& [key, name] : std::span(kFiles).subspan(1))
        EXPECT_EQ(row(name), key);
}

TEST_F(SimInfoTest, ValuesOfEveryTypeAreKeptAsTheyCame)
{
    const PropertyValue values[] = {
        PropertyValue::data({0x98,                       0x10}
        ),
        PropertyValue("text"),
        PropertyValue::integer(7),
        PropertyValue::real(0.5),
        PropertyValue::boolean(true),
        PropertyValue::date({1000000000                         }
        ),
        PropertyValue::arrayOf({"a", PropertyValue::integer(1)}
        ),
        PropertyValue::dictionaryOf({{"key", "value"}}
        ),
    };
    for (const PropertyValue& value : values) {
        send(kCode, record(PropertyValue::dictionaryOf({
                        {"kSimFile_AD", value}
        })));
        EXPECT_EQ(display["EF-ADMINISTRATIVE DATA"], value) << value.description();
    }
}

TEST_F(SimInfoTest, OtherKeysAreNotShown)
{
    send(kCode, record(PropertyValue::dictionaryOf({
                    {"kSimFile_", "a"},
                    {"EF-ICCID",  "b"}
    })));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(SimInfoTest, ARecordThatIsNoPropertyListIsReportedAndThrows)
{
    send(kCode, record(allFiles()));
    const std::string before = display.description();
    EXPECT_THROW(send(kCode, PacketBuilder::withText(kCode, "nonsense")), UnknownDataException);
    EXPECT_THAT(services.log.errors(),
                ElementsAre("SIM File dictionary data could not be constructed"));
    EXPECT_EQ(display.description(), before);
}

TEST_F(SimInfoTest, ARecordOfOnlyTheHeaderThrows)
{
    for (std::size_t size = 0; size <= 13; ++size)
        EXPECT_THROW(sendCut(kCode, PacketBuilder(kCode, 13), size), UnknownDataException) << size;
    EXPECT_EQ(services.log.errors().size(), 14U);
}

TEST_F(SimInfoTest, ARootThatIsNoDictionaryHoldsNoFiles)
{
    send(kCode, record(PropertyValue::arrayOf({"kSimFile_ICCID"})));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(SimInfoTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, record(allFiles()));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(SimInfoTest, OtherCodesAreIgnoredSilently)
{
    send(0xFF0001, record(allFiles()));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "SimInfo"}));
}

} // namespace orvane
