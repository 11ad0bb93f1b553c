#include "platform/services/SystemLog.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

TEST(LogPriorityTest, NamesLeadBackToTheirPriorities)
{
    for (const LogPriority priority :
         {LogPriority::Error, LogPriority::Warning, LogPriority::Notice, LogPriority::Info})
        EXPECT_EQ(logPriorityNamed(logPriorityName(priority)), priority);
}

TEST(LogPriorityTest, OtherTextsAreNoPriority)
{
    for (const char* text : {"", "Error", "debug", "warn", "3"})
        EXPECT_FALSE(logPriorityNamed(text)) << text;
}

} // namespace
} // namespace orvane
