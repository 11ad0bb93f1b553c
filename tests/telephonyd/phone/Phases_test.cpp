#include "telephonyd/phone/Phases.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

TEST(PhasesTest, EachPhaseLastsAsLongAsItsKindMay)
{
    Phases phases({1, 2}, {5, 8}, true, 1);
    std::chrono::milliseconds since{0};
    int turns = 0;
    for (auto now = 0ms; now < 200s; now += 1ms) {
        const bool before = phases.isOn();
        if (!phases.advance(now))
            continue;
        EXPECT_NE(phases.isOn(), before);
        const auto lasted = now - since;
        EXPECT_GE(lasted, before ? 1s : 5s);
        EXPECT_LE(lasted, (before ? 2s : 8s) + 1ms);
        since = now;
        ++turns;
    }
    EXPECT_GT(turns, 20);
}

TEST(PhasesTest, ALeapOverSeveralPhasesTellsOnlyOfTheOutcome)
{
    Phases small({1, 2}, {1, 2}, false, 7);
    Phases large({1, 2}, {1, 2}, false, 7);
    for (auto now = 0ms; now <= 100s; now += 10ms)
        small.advance(now);
    EXPECT_EQ(large.advance(100s), large.isOn());
    EXPECT_EQ(large.isOn(), small.isOn());
}

} // namespace
} // namespace orvane
