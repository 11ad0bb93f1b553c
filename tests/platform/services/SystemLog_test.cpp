#include "platform/services/SystemLog.h"

#include "support/Recording.h"

#include <cerrno>
#include <gtest/gtest.h>
#include <string>

namespace orvane
{
namespace
{

constexpr LogPriority kPriorities[] = {LogPriority::Error, LogPriority::Warning,
                                       LogPriority::Notice, LogPriority::Info};

TEST(SystemLogTest, PriorityUpToTheLowestIsAccepted)
{
    for (const LogPriority lowest : kPriorities) {
        const StandardErrorLog log(lowest);
        for (const LogPriority priority : kPriorities)
            EXPECT_EQ(log.accepts(priority), static_cast<int>(priority) <= static_cast<int>(lowest))
                << logPriorityName(lowest) << ' ' << logPriorityName(priority);
    }
}

TEST(SystemLogTest, WarningIsTheLowestUnlessGiven)
{
    EXPECT_TRUE(StandardErrorLog().accepts(LogPriority::Warning));
    EXPECT_FALSE(StandardErrorLog().accepts(LogPriority::Notice));
}

TEST(SystemLogTest, NullLogAcceptsNothing)
{
    for (const LogPriority priority : kPriorities)
        EXPECT_FALSE(NullLog().accepts(priority));
}

std::string writtenToStandardError(LogPriority priority, std::string_view text)
{
    StandardErrorLog log(LogPriority::Info);
    testing::internal::CaptureStderr();
    log.write(priority, text);
    return testing::internal::GetCapturedStderr();
}

TEST(SystemLogTest, StandardErrorHasOneLineOfPriorityAndText)
{
    EXPECT_EQ(writtenToStandardError(LogPriority::Error, "text"), "error: text\n");
    EXPECT_EQ(writtenToStandardError(LogPriority::Warning, "text"), "warning: text\n");
    EXPECT_EQ(writtenToStandardError(LogPriority::Notice, "text"), "notice: text\n");
    EXPECT_EQ(writtenToStandardError(LogPriority::Info, "text"), "info: text\n");
}

TEST(SystemLogTest, NewlineAtTheEndOfTheTextIsNotPartOfTheLine)
{
    EXPECT_EQ(writtenToStandardError(LogPriority::Error, "Failed to get Cell Array\n"),
              "error: Failed to get Cell Array\n");
    EXPECT_EQ(writtenToStandardError(LogPriority::Error, ""), "error: \n");
    EXPECT_EQ(writtenToStandardError(LogPriority::Error, "\n"), "error: \n");
}

TEST(SystemLogTest, NothingOnStandardErrorActsOnATerminal)
{
    EXPECT_EQ(writtenToStandardError(LogPriority::Error, "a\x1b[2J\u009b\u202e\xff"),
              "error: a\uFFFD[2J\uFFFD\uFFFD\n");
}

TEST(SystemLogTest, LinesAreFormattedAsPrintfDoes)
{
    const TestServices services;
    logError("%s %d 0x%04X %.1f", "text", -1, 255U, 2.25);
    logWarning("a line with its newline\n");
    logLine(LogPriority::Notice, "%%");
    logLine(LogPriority::Info, "%s", "");
    EXPECT_EQ(services.log.lines, (std::vector<RecordingLog::Line>{
                                      {LogPriority::Error,   "text -1 0x00FF 2.2"       },
                                      {LogPriority::Warning, "a line with its newline\n"},
                                      {LogPriority::Notice,  "%"                        },
                                      {LogPriority::Info,    ""                         },
    }));
}

TEST(SystemLogTest, LongLinesArePassedOnWhole)
{
    const TestServices services;
    for (const std::size_t length : {254U, 255U, 256U, 257U, 100000U}) {
        const std::string text(length, 'x');
        logError("%s", text.c_str());
        EXPECT_EQ(services.log.lines.back().text, text);
    }
}

// Passes warnings on, and counts the lines that it is given.
class CountingLog final : public SystemLog
{
public:
    explicit CountingLog(LogPriority lowest) : SystemLog(lowest) {}
    void write(LogPriority, std::string_view) override { ++written; }
    int written = 0;
};

// A wide character that has no form in the locale makes formatting fail, which shows in errno.
TEST(SystemLogTest, LineThatIsNotAcceptedIsNotFormatted)
{
    const wchar_t unprintable[] = {static_cast<wchar_t>(0xDC00), 0};
    CountingLog log(LogPriority::Warning);
    Services::current().setLog(&log);

    errno = 0;
    logLine(LogPriority::Notice, "%ls", unprintable);
    EXPECT_EQ(errno, 0);
    logLine(LogPriority::Warning, "%ls", unprintable);
    EXPECT_EQ(errno, EILSEQ);
    EXPECT_EQ(log.written, 0);
    logLine(LogPriority::Notice, "text");
    EXPECT_EQ(log.written, 0);
    logLine(LogPriority::Warning, "text");
    EXPECT_EQ(log.written, 1);

    Services::current().setLog(nullptr);
}

TEST(SystemLogTest, WithoutALogLinesGoNowhere)
{
    testing::internal::CaptureStderr();
    testing::internal::CaptureStdout();
    logError("text");
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    EXPECT_FALSE(Services::current().log().accepts(LogPriority::Error));
}

} // namespace
} // namespace orvane
