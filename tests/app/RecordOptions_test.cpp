#include "app/AppOptions.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using ::testing::HasSubstr;

AppOptions parsed(std::vector<std::string> arguments) { return parseAppOptions(arguments, {}); }

TEST(RecordOptionsTest, NothingIsRecordedUnlessAskedFor)
{
    EXPECT_FALSE(parsed({}).record);
    EXPECT_FALSE(parsed({}).overwritesRecord);
}

TEST(RecordOptionsTest, AFileIsOverwrittenOnlyByForce)
{
    EXPECT_EQ(parsed({"--record", "a.dlf"}).record, "a.dlf");
    EXPECT_FALSE(parsed({"--record", "a.dlf"}).overwritesRecord);
    EXPECT_TRUE(parsed({"--force", "--record=a.dlf"}).overwritesRecord);
}

TEST(RecordOptionsTest, UnusableArgumentsSayWhatToDo)
{
    EXPECT_THAT(parsed({"--record", ""}).error.value_or(""), HasSubstr("the name of a file"));
    EXPECT_THAT(parsed({"--force"}).error.value_or(""), HasSubstr("--record FILE"));
}

} // namespace
} // namespace orvane
