#include "platform/base/DecimalNumber.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

TEST(DecimalNumberTest, NumbersAreTakenWholeOrNotAtAll)
{
    EXPECT_EQ(decimalNumber("-2.5e3"), -2500.0);
    EXPECT_EQ(decimalNumber("7"), 7.0);
    for (const char* text : {"", "+1", "1 ", "0x10", "1e999", "infinity"})
        EXPECT_FALSE(decimalNumber(text)) << text;
}

} // namespace
} // namespace orvane
