#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

using CellChangeCountersTest = SectionTest<CellChangeCounters>;

} // namespace

TEST_F(CellChangeCountersTest, ListsItsNameAndNoCodes)
{
    EXPECT_EQ(section.getSectionName(), "Cell Change Counters");
    EXPECT_THAT(section.getLogCodeArray(), IsEmpty());
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Dictionary);
}

TEST_F(CellChangeCountersTest, OnlyLogsItsName)
{
    const PropertyValue before = display.deepCopy();
    send(0x4005, PacketBuilder(0x4005, 64));
    EXPECT_EQ(display, before);
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "CellChangeCounters"}));
}

} // namespace orvane
