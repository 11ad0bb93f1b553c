#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xFF0002;

using PDPContextListTest = SectionTest<PDPContextList>;

Bytes record(const PropertyValue& root) { return PacketBuilder::withPropertyList(kCode, root); }

PropertyValue twoContexts()
{
    return PropertyValue::arrayOf({
        PropertyValue::dictionaryOf({{"APN", "internet"}, {"CID", PropertyValue::integer(1)}}
        ),
        "text",
    });
}

} // namespace

TEST_F(PDPContextListTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "PDP Context Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(PDPContextListTest, ShowsTheServersArrayAsItCameAndLogsTheCall)
{
    send(kCode, record(twoContexts()));
    EXPECT_EQ(display, twoContexts());
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "PDPContextList"}));
}

TEST_F(PDPContextListTest, ALaterRecordReplacesTheList)
{
    send(kCode, record(twoContexts()));
    send(kCode, record(PropertyValue::newArray()));
    EXPECT_EQ(display, PropertyValue::newArray());
}

TEST_F(PDPContextListTest, ARecordWithoutAnArrayKeepsTheListAndSaysNothing)
{
    send(kCode, record(twoContexts()));
    services.log.lines.clear();
    send(kCode, record(PropertyValue::dictionaryOf({
                    {"Contexts", twoContexts()}
    })));
    send(kCode, PacketBuilder::withText(kCode, "nonsense"));
    for (std::size_t size = 0; size <= 13; ++size)
        sendCut(kCode, PacketBuilder(kCode, 13), size);
    EXPECT_EQ(display, twoContexts());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(PDPContextListTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, record(twoContexts()));
    EXPECT_EQ(display, PropertyValue::newArray());
}

TEST_F(PDPContextListTest, OtherCodesAreReportedAndKeepTheList)
{
    send(kCode, record(twoContexts()));
    expectReported(0xFF0001);
}

} // namespace orvane
