#include "platform/linux/LineReader.h"

#include "platform/linux/FileDescriptor.h"
#include "platform/linux/QtTest.h"

#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <optional>
#include <string>
#include <unistd.h>
#include <vector>

namespace orvane
{
namespace
{

class LineReaderTest : public QtTest
{
protected:
    struct Line {
        std::string text;
        bool wasCut;
        friend bool operator==(const Line&, const Line&) = default;
    };

    void read(int descriptor)
    {
        reader.emplace(
            descriptor,
            [this](std::string_view text, bool wasCut) {
                lines.push_back({std::string(text), wasCut});
            },
            [this] { ++ends; });
    }

    void makePipe()
    {
        int both[2];
        ASSERT_EQ(::pipe2(both, O_CLOEXEC), 0);
        readEnd = FileDescriptor(both[0]);
        writeEnd = FileDescriptor(both[1]);
    }

    void write(std::string_view text)
    {
        ASSERT_EQ(::write(writeEnd.get(), text.data(), text.size()),
                  static_cast<ssize_t>(text.size()));
    }

    bool runToEnd()
    {
        const bool hasEnded = runUntil([this] { return ends > 0; });
        turnOnce();
        return hasEnded && ends == 1;
    }

    FileDescriptor readEnd;
    FileDescriptor writeEnd;
    std::optional<LineReader> reader;
    std::vector<Line> lines;
    int ends = 0;
};

TEST_F(LineReaderTest, ALineComesAsSoonAsItsNewlineDoes)
{
    makePipe();
    read(readEnd.get());
    write("save a");
    turnOnce();
    EXPECT_TRUE(lines.empty());
    write(" b\n\nqu");
    EXPECT_TRUE(runUntil([&] { return lines.size() == 2; }));
    EXPECT_EQ(lines, (std::vector<Line>{
                         {"save a b", false},
                         {"",         false}
    }));
    EXPECT_EQ(ends, 0);
}

TEST_F(LineReaderTest, ALastLineWithoutNewlineIsALine)
{
    makePipe();
    read(readEnd.get());
    write("save\nquit");
    writeEnd.reset();
    EXPECT_TRUE(runToEnd());
    EXPECT_EQ(lines, (std::vector<Line>{
                         {"save", false},
                         {"quit", false}
    }));
}

TEST_F(LineReaderTest, ANewlineAtTheEndBeginsNoFurtherLine)
{
    makePipe();
    read(readEnd.get());
    write("save\n");
    writeEnd.reset();
    EXPECT_TRUE(runToEnd());
    EXPECT_EQ(lines, (std::vector<Line>{
                         {"save", false}
    }));
}

TEST_F(LineReaderTest, LongLinesAreCutAndReported)
{
    std::FILE* file = std::tmpfile();
    ASSERT_TRUE(file);
    const std::string longest(LineReader::kLineLimit, 'a');
    const std::string content = longest + "\n" + longest + "b\nshort\n" + longest + "cc";
    ASSERT_EQ(std::fwrite(content.data(), 1, content.size(), file), content.size());
    std::rewind(file);
    read(::fileno(file));
    EXPECT_TRUE(runToEnd());
    EXPECT_EQ(lines, (std::vector<Line>{
                         {longest, false},
                         {longest, true },
                         {"short", false},
                         {longest, true }
    }));
    reader.reset();
    std::fclose(file);
}

TEST_F(LineReaderTest, NothingToReadIsJustTheEnd)
{
    const FileDescriptor null(::open("/dev/null", O_RDONLY | O_CLOEXEC));
    read(null.get());
    EXPECT_EQ(ends, 0);
    EXPECT_TRUE(runToEnd());
    EXPECT_TRUE(lines.empty());
}

TEST_F(LineReaderTest, WhatCannotBeReadIsAtItsEnd)
{
    makePipe();
    const int closed = ::dup(readEnd.get());
    ::close(closed);
    for (const int descriptor : {-1, closed, writeEnd.get()}) {
        ends = 0;
        read(descriptor);
        EXPECT_EQ(ends, 0);
        readEnd.reset(); // so that poll() reports an event for the writing end
        EXPECT_TRUE(runToEnd()) << descriptor;
    }
    EXPECT_TRUE(lines.empty());
}

TEST_F(LineReaderTest, LinesFromATerminalCome)
{
    const FileDescriptor terminal(::posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC));
    if (!terminal || ::grantpt(terminal.get()) != 0 || ::unlockpt(terminal.get()) != 0)
        GTEST_SKIP() << "no pseudo-terminals here";
    const FileDescriptor line(::open(::ptsname(terminal.get()), O_RDWR | O_NOCTTY | O_CLOEXEC));
    read(line.get());
    ASSERT_EQ(::write(terminal.get(), "quit\n\4", 6), 6);
    EXPECT_TRUE(runToEnd());
    EXPECT_EQ(lines, (std::vector<Line>{
                         {"quit", false}
    }));
}

TEST_F(LineReaderTest, ALineMayDestroyTheReader)
{
    makePipe();
    int calls = 0;
    reader.emplace(
        readEnd.get(),
        [&](std::string_view line, bool) {
            ++calls;
            reader.reset();
            EXPECT_EQ(line, "one");
        },
        [] { FAIL(); });
    write("one\ntwo\n");
    writeEnd.reset();
    EXPECT_TRUE(runUntil([&] { return calls > 0; }));
    turnOnce();
    EXPECT_EQ(calls, 1);
}

TEST_F(LineReaderTest, TheEndMayDestroyTheReader)
{
    makePipe();
    bool hasEnded = false;
    reader.emplace(
        readEnd.get(), [](std::string_view, bool) {},
        [&] {
            reader.reset();
            hasEnded = true;
        });
    writeEnd.reset();
    EXPECT_TRUE(runUntil([&] { return hasEnded; }));
}

} // namespace
} // namespace orvane
