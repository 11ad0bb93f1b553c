#include "app/RecordingNotice.h"

#include "doubles/FakeScreen.h"
#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{

TEST(RecordingNoticeTest, IsOnTheConsoleAndOnTheScreen)
{
    TestServices services;
    FakeScreen screen;
    showRecordingNotice("Recording has ended.");
    EXPECT_EQ(services.console.lines, std::vector<std::string>{"Recording has ended."});
    ASSERT_TRUE(screen.alert());
    EXPECT_EQ(screen.alert()->title(), "Recording");
    EXPECT_EQ(screen.alert()->message(), "Recording has ended.");
}

} // namespace orvane
