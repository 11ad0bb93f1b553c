#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

using NonRankedGSMSetTest = SectionTest<NonRankedGSMSet>;

} // namespace

TEST_F(NonRankedGSMSetTest, ListsItsNameAndNoCodes)
{
    EXPECT_EQ(section.getSectionName(), "Non-Ranked GSM Set");
    EXPECT_THAT(section.getLogCodeArray(), IsEmpty());
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(NonRankedGSMSetTest, OnlyLogsItsName)
{
    const PropertyValue before = display.deepCopy();
    send(0x4005, PacketBuilder(0x4005, 64));
    EXPECT_EQ(display, before);
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "NonRankedGSMSet"}));
}

} // namespace orvane
