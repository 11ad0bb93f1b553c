#include "platform/services/Uuid.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

TEST(UuidTest, IsUpperCaseWithHyphensVersionFourAndNewEachTime)
{
    const auto first = makeUuid();
    ASSERT_TRUE(first);
    EXPECT_THAT(*first, ::testing::MatchesRegex("[0-9A-F]{8}-[0-9A-F]{4}-4[0-9A-F]{3}-"
                                                "[89AB][0-9A-F]{3}-[0-9A-F]{12}"));
    EXPECT_NE(first, makeUuid());
}

} // namespace orvane
