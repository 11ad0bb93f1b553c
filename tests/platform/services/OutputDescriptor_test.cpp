#include "platform/services/OutputDescriptor.h"

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <csignal>
#include <fcntl.h>
#include <string>
#include <thread>
#include <unistd.h>

namespace orvane
{

namespace
{

using State = OutputDescriptor::State;

class OutputDescriptorTest : public ::testing::Test
{
protected:
    OutputDescriptorTest()
    {
        EXPECT_EQ(::pipe2(ends.data(), O_CLOEXEC), 0);
        std::signal(SIGPIPE, SIG_IGN);
    }
    ~OutputDescriptorTest() override
    {
        ::close(ends[0]);
        ::close(ends[1]);
        std::signal(SIGPIPE, SIG_DFL);
    }

    std::array<int, 2> ends{};
};

} // namespace

TEST_F(OutputDescriptorTest, WritesMoreThanAPipeHoldsWhileItsReaderFollows)
{
    const std::string sent(1000000, 'x');
    std::string received;
    std::thread reader([this, &received, &sent] {
        std::array<char, 5000> block{};
        while (received.size() < sent.size()) {
            const ssize_t count = ::read(ends[0], block.data(), block.size());
            ASSERT_GT(count, 0);
            received.append(block.data(), static_cast<std::size_t>(count));
        }
    });
    OutputDescriptor output(ends[1]);
    EXPECT_EQ(output.write(sent), State::Open);
    reader.join();
    EXPECT_EQ(received, sent);
}

TEST_F(OutputDescriptorTest, AReaderThatLeftClosesIt)
{
    ::close(ends[0]);
    OutputDescriptor output(ends[1]);
    EXPECT_EQ(output.write("x"), State::Closed);
    EXPECT_EQ(output.write("y"), State::Closed);
    ends[0] = ::dup(ends[1]);
}

TEST(OutputDescriptorFailureTest, AFullDiskIsToldInTheSystemsWords)
{
    const int full = ::open("/dev/full", O_WRONLY | O_CLOEXEC);
    ASSERT_GE(full, 0);
    OutputDescriptor output(full);
    EXPECT_EQ(output.write("x"), State::Failed);
    EXPECT_STREQ(output.failure(), "No space left on device");
    ::close(full);
}

TEST_F(OutputDescriptorTest, ASignalThatIsHandledEndsTheWait)
{
    struct sigaction action {
    };
    action.sa_handler = [](int) {};
    action.sa_flags = SA_RESTART;
    struct sigaction before {
    };
    ASSERT_EQ(::sigaction(SIGUSR1, &action, &before), 0);
    const pthread_t writer = ::pthread_self();
    std::atomic<bool> done = false;
    std::thread sender([&] {
        // Sent until one arrives during the wait. A signal before the wait would be lost.
        while (!done) {
            ::pthread_kill(writer, SIGUSR1);
            std::this_thread::yield();
        }
    });
    OutputDescriptor output(ends[1]);
    EXPECT_EQ(output.write(std::string(1000000, 'x')), State::Interrupted);
    done = true;
    sender.join();
    ::sigaction(SIGUSR1, &before, nullptr);
}

} // namespace orvane
