#include "LogGenerator/Silence.h"

#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;
using testing::IsEmpty;

TEST(SilenceTest, NothingIsTakenUntilItEnds)
{
    TestServices services;
    {
        const Silence silence;
        logError("an error");
        logWarning("a warning");
        consoleLine("a line");
    }
    EXPECT_THAT(services.log.lines, IsEmpty());
    EXPECT_THAT(services.console.lines, IsEmpty());
    logWarning("afterwards");
    consoleLine("afterwards");
    EXPECT_THAT(services.log.warnings(), ElementsAre("afterwards"));
    EXPECT_THAT(services.console.lines, ElementsAre("afterwards"));
}

TEST(SilenceTest, ErrorsPassWhereTheyShallAndTheLogTakesThem)
{
    TestServices services;
    const Silence silence(Silence::Of::AllButErrors);
    logError("an error");
    logWarning("a warning");
    EXPECT_EQ(services.log.lines.size(), 1U);
    {
        const Silence deeper;
        logError("another");
    }
    EXPECT_THAT(services.log.errors(), ElementsAre("an error"));
}

} // namespace
} // namespace orvane
