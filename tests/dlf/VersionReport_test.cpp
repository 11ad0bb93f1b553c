#include "dlf/VersionReport.h"

#include "support/Recording.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <string>
#include <vector>

namespace orvane
{
namespace
{

class VersionReportTest : public testing::Test
{
protected:
    int write(std::size_t size = kDlfVersionReportBytes)
    {
        bytes.assign(size, 0xAA);
        return VRTDLFAddVersionReport(bytes.data(), static_cast<std::uint32_t>(size), &written,
                                      firstVersion, secondVersion, version, program, built, time,
                                      zoneMinutes, isDaylightSaving);
    }
    [[nodiscard]] std::vector<std::uint8_t> at(std::size_t offset, std::size_t count) const
    {
        const auto first = bytes.begin() + static_cast<std::ptrdiff_t>(offset);
        return {first, first + static_cast<std::ptrdiff_t>(count)};
    }
    [[nodiscard]] std::string textAt(std::size_t offset, std::size_t width) const
    {
        const auto field = at(offset, width);
        return {field.begin(), field.end()};
    }

    std::vector<std::uint8_t> bytes;
    std::uint32_t written = 99;
    std::uint16_t firstVersion = 1;
    std::uint16_t secondVersion = 1;
    const char* version = "Orvane 2.5";
    const char* program = "EXECUTABLE_NAME";
    const char* built = "Jun 13 2017 22:04:20";
    std::uint32_t time = 0x6B016EE0;
    std::int16_t zoneMinutes = 330;
    std::uint8_t isDaylightSaving = 1;
};

std::string field(const std::string& text, std::size_t width)
{
    std::string padded = text;
    padded.resize(width, '\0');
    return padded;
}

TEST_F(VersionReportTest, ABufferThatIsTooSmallForTheHeaderIsLoggedAndLeft)
{
    const TestServices services;
    bytes.assign(kDlfVersionReportBytes - 1, 0xAA);
    EXPECT_FALSE(writeVersionReport(bytes));
    EXPECT_THAT(services.log.errors(),
                testing::ElementsAre("Could not write DLF header (result=3)"));
    EXPECT_THAT(bytes, testing::Each(0xAA));
    bytes.push_back(0xAA);
    EXPECT_TRUE(writeVersionReport(bytes));
    EXPECT_EQ(services.log.errors().size(), 1U);
}

TEST_F(VersionReportTest, EveryByteOfTheReportIsInItsPlace)
{
    ASSERT_EQ(write(), 0);
    EXPECT_EQ(written, 161U);

    const std::vector<std::uint8_t> header = {161, 0, 0xFD, 0x1F, 0, 0, 0, 0,
                                              0,   0, 0,    0,    1, 0, 1, 0};
    std::string expected(header.begin(), header.end());
    expected += field("Orvane", 7);
    expected += field("EXECUTABLE_NAME", 16);
    expected += field("", 24);
    expected += field("Jun 13 2017 22:04", 18);
    expected += std::string("\xE0\x6E\x01\x6B", 4); // time
    expected += std::string("\x4A\x01", 2);         // 330 minutes
    expected += std::string("\x01\x00", 2);         // daylight saving
    expected += field("", 72);
    ASSERT_EQ(expected.size(), 161U);
    EXPECT_EQ(textAt(0, 161), expected);
}

TEST_F(VersionReportTest, VersionTextIsCutToSixCharacters)
{
    write();
    EXPECT_EQ(textAt(16, 7), field("Orvane", 7));
    version = "(none)";
    write();
    EXPECT_EQ(textAt(16, 7), field("(none)", 7));
    version = "Or";
    write();
    EXPECT_EQ(textAt(16, 7), field("Or", 7));
}

TEST_F(VersionReportTest, LongTextsAreCutAndEndInANul)
{
    program = "EXECUTABLE_NAME_AND_MORE";
    built = "Jun 13 2017 22:04:20 and more";
    write();
    EXPECT_EQ(textAt(23, 17), field("EXECUTABLE_NAME", 17));
    EXPECT_EQ(textAt(63, 18), field("Jun 13 2017 22:04", 18));
}

TEST_F(VersionReportTest, ZoneIsTwosComplementMinutes)
{
    struct Case {
        std::int16_t minutes;
        std::vector<std::uint8_t> stored;
    };
    const Case cases[] = {
        {0,    {0, 0}      },
        {330,  {0x4A, 0x01}},
        {-210, {0x2E, 0xFF}},
        {-1,   {0xFF, 0xFF}},
    };
    for (const Case& each : cases) {
        zoneMinutes = each.minutes;
        write();
        EXPECT_EQ(at(85, 2), each.stored) << each.minutes;
    }
}

TEST_F(VersionReportTest, VersionsTimeAndFlagAreStoredWhole)
{
    firstVersion = 0x1234;
    secondVersion = 0xFEDC;
    time = 0xFFFFFFFF;
    isDaylightSaving = 0;
    write();
    EXPECT_EQ(at(12, 4), (std::vector<std::uint8_t>{0x34, 0x12, 0xDC, 0xFE}));
    EXPECT_EQ(at(81, 4), (std::vector<std::uint8_t>{0xFF, 0xFF, 0xFF, 0xFF}));
    EXPECT_EQ(at(87, 2), (std::vector<std::uint8_t>{0, 0}));
    isDaylightSaving = 0x80;
    write();
    EXPECT_EQ(at(87, 2), (std::vector<std::uint8_t>{1, 0}));
}

TEST_F(VersionReportTest, ShortBufferGivesThreeAndIsLeftAlone)
{
    for (std::size_t size = 0; size < kDlfVersionReportBytes; ++size) {
        written = 99;
        ASSERT_EQ(write(size), 3) << size;
        ASSERT_EQ(written, 0U) << size;
        ASSERT_EQ(std::count(bytes.begin(), bytes.end(), 0xAA), static_cast<long>(size));
    }
}

TEST_F(VersionReportTest, LongBufferIsLeftAloneBehindTheReport)
{
    ASSERT_EQ(write(170), 0);
    EXPECT_EQ(written, 161U);
    EXPECT_EQ(at(160, 10),
              (std::vector<std::uint8_t>{0, 0xAA, 0xAA, 0xAA, 0xAA, 0xAA, 0xAA, 0xAA, 0xAA, 0xAA}));
}

TEST_F(VersionReportTest, AbsentTextsAreStoredEmptyAndAnAbsentCountIsNotWritten)
{
    version = program = built = nullptr;
    ASSERT_EQ(write(), 0);
    EXPECT_EQ(textAt(16, 65), field("", 65));

    EXPECT_EQ(VRTDLFAddVersionReport(bytes.data(), 161, nullptr, 1, 1, "a", "b", "c", 0, 0, 0), 0);
    EXPECT_EQ(bytes[16], 'a');
    EXPECT_EQ(VRTDLFAddVersionReport(bytes.data(), 160, nullptr, 1, 1, "a", "b", "c", 0, 0, 0), 3);
}

TEST_F(VersionReportTest, AbsentBufferCountsAsTooShort)
{
    EXPECT_EQ(VRTDLFAddVersionReport(nullptr, 161, &written, 1, 1, "a", "b", "c", 0, 0, 0), 3);
    EXPECT_EQ(written, 0U);
}

} // namespace
} // namespace orvane
