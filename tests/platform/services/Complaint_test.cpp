#include "platform/services/Complaint.h"

#include "platform/services/Console.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

TEST(ComplaintTest, IsOneLineThatNamesTheProgram)
{
    testing::internal::CaptureStderr();
    printComplaint("orvane", "cannot read \"a\nb\"");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "orvane: cannot read \"a b\"\n");
}

TEST(ComplaintTest, NothingInItActsOnATerminal)
{
    testing::internal::CaptureStderr();
    printComplaint("orvane", "cannot read \"\x1b]0;title\x07\u009b2J\u202e\xff\"");
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              "orvane: cannot read \"\uFFFD]0;title\uFFFD\uFFFD2J\uFFFD\"\n");
}

TEST(StreamConsoleTest, NothingInALineActsOnATerminal)
{
    testing::internal::CaptureStderr();
    StreamConsole(stderr).writeLine("a\x1b[2J\u009b");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "a\uFFFD[2J\uFFFD\n");
}

} // namespace
} // namespace orvane
