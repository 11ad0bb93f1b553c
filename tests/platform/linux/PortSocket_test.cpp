#include "platform/linux/PortSocket.h"

#include "platform/linux/PortsDirectory.h"
#include "platform/linux/UnixSocket.h"

#include <gtest/gtest.h>

#include <array>
#include <barrier>
#include <memory>
#include <sys/socket.h>
#include <thread>

namespace orvane
{
namespace
{

class PortSocketTest : public testing::Test
{
protected:
    void leaveStaleSocket()
    {
        std::string error;
        const auto address = socketAddress(directory.path() + "/Port", error);
        const FileDescriptor socket = newStreamSocket();
        ASSERT_EQ(
            ::bind(socket.get(), reinterpret_cast<const sockaddr*>(&*address), sizeof *address), 0);
    }

    bool isServed()
    {
        std::string error;
        const FileDescriptor caller = newStreamSocket();
        return connectTo(caller.get(), *socketAddress(directory.path() + "/Port", error)) == 0;
    }

    PrivatePortsDirectory directory;
};

TEST_F(PortSocketTest, OneOfManyThatFindTheSameStaleSocketGetsIt)
{
    constexpr int kRounds = 500; // without the lock it goes wrong once in some 300
    constexpr std::size_t kClaimants = 4;
    for (int round = 0; round < kRounds; ++round) {
        leaveStaleSocket();
        std::barrier start(kClaimants);
        std::array<std::unique_ptr<PortSocket>, kClaimants> claimed;
        std::array<std::thread, kClaimants> threads;
        for (std::size_t i = 0; i < kClaimants; ++i)
            threads[i] = std::thread([&, i] {
                std::string error;
                start.arrive_and_wait();
                if (auto socket = PortSocket::claim(directory.path(), "Port", error))
                    claimed[i] = std::make_unique<PortSocket>(std::move(*socket));
            });
        std::size_t winners = 0;
        for (std::size_t i = 0; i < kClaimants; ++i) {
            threads[i].join();
            winners += claimed[i] ? 1 : 0;
        }
        ASSERT_EQ(winners, 1U) << round;
        ASSERT_TRUE(isServed()) << round;
    }
}

TEST_F(PortSocketTest, ASocketThatIsMovedFromLeavesTheFileToTheOther)
{
    std::string error;
    auto first = PortSocket::claim(directory.path(), "Port", error);
    ASSERT_TRUE(first) << error;
    const PortSocket second = std::move(*first);
    first.reset();
    EXPECT_TRUE(isServed());
}

} // namespace
} // namespace orvane
