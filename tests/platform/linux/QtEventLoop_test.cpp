#include "platform/linux/QtEventLoop.h"

#include "platform/linux/QtMainQueue.h"
#include "platform/linux/QtTest.h"

#include <clocale>
#include <string>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

class QtEventLoopTest : public QtTest
{
protected:
    QtMainQueue queue;
};

TEST_F(QtEventLoopTest, RunReturnsTheCodeOfQuit)
{
    queue.async([&] { loop.quit(3); });
    EXPECT_EQ(loop.run(), 3);
    queue.async([&] { loop.quit(); });
    EXPECT_EQ(loop.run(), 0);
}

TEST_F(QtEventLoopTest, QuitBeforeRunEndsThatRunAtOnce)
{
    loop.quit(4);
    EXPECT_EQ(loop.run(), 4);
    queue.async([&] { loop.quit(5); });
    EXPECT_EQ(loop.run(), 5);
}

TEST_F(QtEventLoopTest, RunUntilSaysWhatTheConditionSaysInTheEnd)
{
    EXPECT_TRUE(loop.runUntil([] { return true; }, 0ms));
    EXPECT_FALSE(loop.runUntil([] { return false; }, 5ms));
    bool isDone = false;
    queue.async([&] { isDone = true; });
    EXPECT_TRUE(loop.runUntil([&] { return isDone; }, 30s));
}

TEST_F(QtEventLoopTest, PrintfKeepsItsDecimalPoint)
{
    EXPECT_STREQ(std::setlocale(LC_NUMERIC, nullptr), "C");
}

} // namespace
} // namespace orvane
