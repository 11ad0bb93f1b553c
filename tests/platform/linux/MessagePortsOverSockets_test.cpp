#include "platform/linux/EventThread.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/TransportTest.h"
#include "platform/ports/MessagePorts.h"

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

// A local port in a thread of its own that answers with what it is sent, reversed. Message 9 is
// left without reply data; message 10 ends the port.
struct Reverser {
    Reverser(const PortsDirectory& directory, MainQueue& queue)
        : transport(directory), ports(transport, queue)
    {
        port = ports.createLocal("Reverser",
                                 [](LocalMessagePort& own, std::int32_t messageId,
                                    ByteView data) -> std::optional<Bytes> {
                                     if (messageId == 9)
                                         return std::nullopt;
                                     if (messageId == 10)
                                         own.invalidate();
                                     return Bytes(data.rbegin(), data.rend());
                                 });
        if (port)
            port->setDispatchQueue(queue);
    }
    SocketTransport transport;
    MessagePorts ports;
    std::unique_ptr<LocalMessagePort> port;
};

class MessagePortsOverSocketsTest : public TransportTest
{
protected:
    QtMainQueue queue;
    MessagePorts ports{transport, queue};
    EventThread thread{[this](MainQueue& threadQueue) {
        return std::make_shared<Reverser>(directory.directory(), threadQueue);
    }};
};

TEST_F(MessagePortsOverSocketsTest, RequestsOfAllSizesAreAnswered)
{
    const auto remote = ports.createRemote("Reverser");
    ASSERT_TRUE(remote);
    for (const std::size_t size : {std::size_t{0}, std::size_t{1}, std::size_t{65536},
                                   std::size_t{1000000}, kFrameDataLimit}) {
        Bytes sent(size);
        for (std::size_t i = 0; i < size; ++i)
            sent[i] = static_cast<std::uint8_t>(i * 31);
        Bytes reply;
        ASSERT_EQ(remote->send(1, sent, 30s, 30s, &reply), SendStatus::Success) << size;
        EXPECT_TRUE(std::equal(sent.rbegin(), sent.rend(), reply.begin(), reply.end())) << size;
    }
}

TEST_F(MessagePortsOverSocketsTest, AReceiverWithoutReplyDataAnswersWithNone)
{
    const auto remote = ports.createRemote("Reverser");
    ASSERT_TRUE(remote);
    Bytes reply{1, 2, 3};
    EXPECT_EQ(remote->send(9, Bytes{4}, 30s, 30s, &reply), SendStatus::Success);
    EXPECT_TRUE(reply.empty());
}

TEST_F(MessagePortsOverSocketsTest, TheEndOfTheLocalPortInvalidatesTheRemoteOne)
{
    const auto remote = ports.createRemote("Reverser");
    ASSERT_TRUE(remote);
    int invalidations = 0;
    remote->setInvalidationCallback([&](MessagePort&) { ++invalidations; });
    EXPECT_EQ(remote->send(1, Bytes{4}, 30s, 0s, nullptr), SendStatus::Success);
    EXPECT_EQ(remote->send(10, Bytes{4}, 30s, 0s, nullptr), SendStatus::Success);
    EXPECT_TRUE(runUntil([&] { return invalidations == 1; }));
    EXPECT_FALSE(remote->isValid());
    EXPECT_EQ(remote->send(1, {}, 30s, 30s, nullptr), SendStatus::NotValid);
    EXPECT_FALSE(ports.createRemote("Reverser"));
}

TEST_F(MessagePortsOverSocketsTest, TheEndOfTheOtherThreadInvalidatesTheRemotePort)
{
    const auto remote = ports.createRemote("Reverser");
    ASSERT_TRUE(remote);
    int invalidations = 0;
    remote->setInvalidationCallback([&](MessagePort&) { ++invalidations; });
    thread.stop();
    EXPECT_TRUE(runUntil([&] { return invalidations == 1; }));
}

} // namespace
} // namespace orvane
