#include "platform/services/ProgressLine.h"

#include <gtest/gtest.h>

#include <optional>
#include <utility>

namespace orvane
{
namespace
{

class ProgressLineTest : public ::testing::Test
{
protected:
    std::string written;
    std::optional<ProgressLine> line{std::in_place, "Reading",
                                     [this](std::string_view text) { written += text; }};
};

TEST_F(ProgressLineTest, IsWrittenAnewForEachWholePercent)
{
    line->show(0.01);
    line->show(0.019);
    line->show(0.5);
    EXPECT_EQ(written, "\rReading: 1 %\rReading: 50 %");
}

TEST_F(ProgressLineTest, IsWipedOnceAllIsDone)
{
    line->show(0.5);
    written.clear();
    line->show(1);
    EXPECT_EQ(written, "\r             \r");
    line.reset();
    EXPECT_EQ(written, "\r             \r");
}

TEST_F(ProgressLineTest, IsWipedAtTheEndOfAnUnfinishedTask)
{
    line->show(0.5);
    written.clear();
    line.reset();
    EXPECT_EQ(written, "\r             \r");
}

TEST_F(ProgressLineTest, TheTaskMayNameAnyFile)
{
    ProgressLine evil("Reading a\x1b[2J\u009b.dlf",
                      [this](std::string_view text) { written += text; });
    evil.show(0.5);
    EXPECT_EQ(written, "\rReading a\uFFFD[2J\uFFFD.dlf: 50 %");
}

TEST_F(ProgressLineTest, ATaskDoneAtOnceShowsNothing)
{
    line->show(1);
    line.reset();
    EXPECT_EQ(written, "");
}

} // namespace
} // namespace orvane
