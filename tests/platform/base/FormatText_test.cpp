#include "platform/base/FormatText.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

[[gnu::format(printf, 1, 2)]] std::optional<std::string> formatted(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    auto text = formatText(format, arguments);
    va_end(arguments);
    return text;
}

TEST(FormatTextTest, FollowsTheFormat)
{
    EXPECT_EQ(formatted("%s", ""), "");
    EXPECT_EQ(formatted("%4.2f dB, %d of %s", -3.125, -1, "two"), "-3.12 dB, -1 of two");
}

TEST(FormatTextTest, TextsOfAnyLengthComeWhole)
{
    for (const std::size_t length : {254U, 255U, 256U, 257U, 100000U}) {
        const std::string text(length, 'x');
        EXPECT_EQ(formatted("%s!", text.c_str()), text + "!") << length;
    }
}

TEST(FormatTextTest, WhatCannotBePrintedGivesNothing)
{
    const wchar_t unprintable[] = {static_cast<wchar_t>(0xDC00), 0};
    EXPECT_EQ(formatted("%ls", unprintable), std::nullopt);
}

} // namespace
} // namespace orvane
