#include "platform/ports/MessagePorts.h"

#include "doubles/LoopbackTransport.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

#include <stdexcept>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

struct Message {
    std::int32_t id;
    Bytes data;
    friend bool operator==(const Message&, const Message&) = default;
};

Bytes framed(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
             const Bytes& data)
{
    Bytes bytes;
    appendFrame(bytes, messageId, serial, wantsReply, isReply, data);
    return bytes;
}

// The program's ports on one side, another process's on the other.
class MessagePortsTest : public testing::Test
{
protected:
    // A port of the other process that keeps its messages and answers with `reply`.
    std::unique_ptr<LocalMessagePort> peerPort(const std::string& name)
    {
        auto port =
            peerPorts.createLocal(name, [this](LocalMessagePort&, std::int32_t id, ByteView data) {
                peerMessages.push_back({id, Bytes(data.begin(), data.end())});
                return reply;
            });
        port->setDispatchQueue(transport.peerQueue());
        return port;
    }

    // A listener of the other process whose connection the test answers by hand.
    void listenByHand(const std::string& name)
    {
        std::string error;
        listener = transport.peerSide().listen(name, error);
        listener->setConnectionCallback([this](auto connection) {
            byHand = std::move(connection);
            byHand->setFrameCallback([this](const FrameReader::View& frame) {
                requests.push_back({frame.messageId, Bytes(frame.data.begin(), frame.data.end())});
                serials.push_back(frame.serial);
                if (onRequest)
                    onRequest(frame);
            });
        });
    }

    // The program's own port, whose messages are kept.
    std::unique_ptr<LocalMessagePort> ownPort(const std::string& name)
    {
        return ports.createLocal(name, [this](LocalMessagePort&, std::int32_t id, ByteView data) {
            messages.push_back({id, Bytes(data.begin(), data.end())});
            return reply;
        });
    }

    std::unique_ptr<FrameConnection> connectByHand(const std::string& name)
    {
        std::string error;
        auto connection = transport.peerSide().connect(name, error);
        connection->setFrameCallback([this](const FrameReader::View& frame) {
            replies.push_back({frame.messageId, Bytes(frame.data.begin(), frame.data.end())});
            serials.push_back(frame.serial);
            EXPECT_TRUE(frame.isReply);
            EXPECT_FALSE(frame.wantsReply);
        });
        connection->setClosedCallback([this] { ++closes; });
        return connection;
    }

    static SendStatus send(RemoteMessagePort& port, std::int32_t id, const Bytes& data)
    {
        return port.send(id, data, 1s, 0s, nullptr);
    }

    SendStatus ask(RemoteMessagePort& port, std::int32_t id, const Bytes& data)
    {
        return port.send(id, data, 1s, 1s, &answer);
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    MessagePorts peerPorts{transport.peerSide(), transport.peerQueue()};

    std::vector<Message> peerMessages;
    std::vector<Message> messages;
    std::vector<Message> requests;
    std::vector<Message> replies;
    std::vector<std::uint32_t> serials;
    std::optional<Bytes> reply;
    Bytes answer{0xEE};
    int closes = 0;

    std::unique_ptr<FrameListener> listener;
    std::unique_ptr<FrameConnection> byHand;
    std::function<void(const FrameReader::View&)> onRequest;
};

// Making ports.

TEST_F(MessagePortsTest, UsablePortNamesHave1To64PlainBytes)
{
    for (const std::string name : {"a", "OrvaneApp.0123-AZ_z", "..."})
        EXPECT_TRUE(isUsablePortName(name)) << name;
    EXPECT_TRUE(isUsablePortName(std::string(64, 'x')));
    for (const std::string name : {"", ".", "..", "a/b", "a b", "\xC3\xA4"})
        EXPECT_FALSE(isUsablePortName(name)) << name;
    EXPECT_FALSE(isUsablePortName(std::string(65, 'x')));
    EXPECT_FALSE(isUsablePortName(std::string_view("a\0b", 3)));
}

TEST_F(MessagePortsTest, ALocalPortOfAnUnusableNameIsRefusedWithALine)
{
    EXPECT_EQ(ownPort("a/b"), nullptr);
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Could not create the port \"a/b\": a name has 1 to 64 letters, "
                            "digits, '.', '-' and '_'"));
}

TEST_F(MessagePortsTest, ALocalPortOfALivePortsNameIsRefusedWithALine)
{
    auto first = ownPort("name");
    EXPECT_EQ(ownPort("name"), nullptr);
    EXPECT_THAT(services.log.errors(), ElementsAre(HasSubstr("a live port has the name")));
    first.reset();
    EXPECT_NE(ownPort("name"), nullptr);
}

TEST_F(MessagePortsTest, ThereIsNoRemotePortWhereNothingListens)
{
    EXPECT_EQ(ports.createRemote("nobody"), nullptr);
    EXPECT_EQ(ports.createRemote("a/b"), nullptr);
    const auto peer = peerPort("somebody");
    transport.refuseConnections("somebody");
    EXPECT_EQ(ports.createRemote("somebody"), nullptr);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

// Sending.

TEST_F(MessagePortsTest, AMessageWithoutAReplyArrivesAndGetsNoFrameBack)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(send(*remote, -3, {1, 2}), SendStatus::Success);
    EXPECT_THAT(peerMessages, IsEmpty());
    queue.runPending();
    EXPECT_THAT(peerMessages, ElementsAre(Message{
                                  -3, {1, 2}
    }));
    EXPECT_EQ(queue.now(), 0s);
}

TEST_F(MessagePortsTest, ARequestWaitsForItsReplyWhileOwnTasksWait)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    bool ran = false;
    queue.async([&] { ran = true; });
    reply = Bytes{7, 8};
    EXPECT_EQ(ask(*remote, 0, {1}), SendStatus::Success);
    EXPECT_EQ(answer, (Bytes{7, 8}));
    EXPECT_FALSE(ran);
    EXPECT_EQ(queue.now(), 0s);
}

TEST_F(MessagePortsTest, AReceiverWithoutReplyDataIsAnEmptyReply)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(ask(*remote, 0, {1}), SendStatus::Success);
    EXPECT_THAT(answer, IsEmpty());
}

TEST_F(MessagePortsTest, EveryMessageHasASerialOfItsOwn)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    send(*remote, 0, {});
    send(*remote, 0, {});
    ask(*remote, 0, {});
    EXPECT_THAT(serials, ElementsAre(1U, 2U, 3U));
}

TEST_F(MessagePortsTest, RepliesArePickedOutByTheirSerial)
{
    listenByHand("peer");
    onRequest = [this](const FrameReader::View& frame) {
        byHand->send(0, frame.serial + 1, false, true, Bytes{1}); // of no request
        byHand->send(0, frame.serial, false, false, Bytes{2});    // no reply
        byHand->send(0, frame.serial, false, true, Bytes{3});
        byHand->send(0, frame.serial, false, true, Bytes{4}); // one too many
    };
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
    EXPECT_EQ(answer, Bytes{3});
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
    EXPECT_EQ(answer, Bytes{3});
}

TEST_F(MessagePortsTest, ARequestToARemotePortIsAnsweredWithNoData)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    byHand->send(5, 77, true, false, Bytes{1});
    queue.runPending();
    EXPECT_THAT(requests, ElementsAre(Message{5, {}}));
    EXPECT_THAT(serials, ElementsAre(77U));
}

TEST_F(MessagePortsTest, NoReplyInTimeIsMinus2AndThePortStaysValid)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::ReceiveTimeout);
    EXPECT_EQ(queue.now(), 1s);
    EXPECT_EQ(answer, Bytes{0xEE});
    EXPECT_TRUE(remote->isValid());
    EXPECT_EQ(static_cast<int>(SendStatus::ReceiveTimeout), -2);
}

TEST_F(MessagePortsTest, ALateReplyIsNotTakenForTheNextRequests)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    ASSERT_EQ(ask(*remote, 0, {}), SendStatus::ReceiveTimeout);
    onRequest = [this](const FrameReader::View& frame) {
        byHand->send(0, serials.front(), false, true, Bytes{1}); // the first request's, late
        byHand->send(0, frame.serial, false, true, Bytes{2});
    };
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
    EXPECT_EQ(answer, Bytes{2});
}

TEST_F(MessagePortsTest, ALateReplyAloneIsDropped)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    ASSERT_EQ(ask(*remote, 0, {}), SendStatus::ReceiveTimeout);
    byHand->send(0, serials.front(), false, true, Bytes{1});
    queue.runPending();
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::ReceiveTimeout);
    EXPECT_EQ(answer, Bytes{0xEE});
}

TEST_F(MessagePortsTest, NothingTakenInTimeIsMinus1AndThePortStaysValid)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    transport.stopReading("peer");
    EXPECT_EQ(send(*remote, 1, {1}), SendStatus::SendTimeout);
    EXPECT_EQ(ask(*remote, 2, {2}), SendStatus::SendTimeout);
    EXPECT_EQ(queue.now(), 2s);
    EXPECT_TRUE(remote->isValid());
    EXPECT_EQ(static_cast<int>(SendStatus::SendTimeout), -1);

    // A request that was given up never arrives.
    transport.resumeReading("peer");
    EXPECT_EQ(send(*remote, 3, {3}), SendStatus::Success);
    queue.runPending();
    EXPECT_THAT(peerMessages, ElementsAre(Message{3, {3}}));
}

TEST_F(MessagePortsTest, AFrameCutShortIsMinus1AndLeavesThePortInvalid)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    int invalidations = 0;
    remote->setInvalidationCallback([&](MessagePort& port) {
        EXPECT_EQ(&port, remote.get());
        ++invalidations;
    });
    queue.runPending();
    transport.stopReading("peer", 1); // of the header's 16 bytes
    EXPECT_EQ(send(*remote, 1, {1}), SendStatus::SendTimeout);
    EXPECT_FALSE(remote->isValid());
    EXPECT_EQ(invalidations, 0);
    EXPECT_EQ(send(*remote, 1, {1}), SendStatus::NotValid);
    transport.resumeReading("peer");
    queue.runPending();
    EXPECT_EQ(invalidations, 1);
    EXPECT_THAT(peerMessages, IsEmpty());
}

TEST_F(MessagePortsTest, AMessageIsTakenLateButInTime)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    transport.stopReading("peer", 20);
    transport.peerQueue().after(900ms, [this] { transport.resumeReading("peer"); });
    EXPECT_EQ(send(*remote, 1, Bytes(100)), SendStatus::Success);
    EXPECT_EQ(queue.now(), 900ms);
    queue.runPending();
    EXPECT_THAT(peerMessages, ElementsAre(Message{1, Bytes(100)}));
}

TEST_F(MessagePortsTest, SendingOnAnInvalidPortIsMinus3)
{
    auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    peer.reset();
    queue.runPending();
    EXPECT_FALSE(remote->isValid());
    EXPECT_EQ(send(*remote, 0, {}), SendStatus::NotValid);
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::NotValid);
    EXPECT_EQ(static_cast<int>(SendStatus::NotValid), -3);
}

TEST_F(MessagePortsTest, AConnectionThatBreaksWhileSendingIsMinus4)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    transport.stopReading("peer");
    transport.peerQueue().after(500ms, [this] { transport.cutConnections("peer"); });
    EXPECT_EQ(send(*remote, 0, {1}), SendStatus::TransportError);
    EXPECT_EQ(queue.now(), 500ms);
    EXPECT_FALSE(remote->isValid());
    EXPECT_EQ(static_cast<int>(SendStatus::TransportError), -4);
}

TEST_F(MessagePortsTest, BecomingInvalidWhileWaitingForTheReplyIsMinus5)
{
    listenByHand("peer");
    onRequest = [this](const FrameReader::View&) { byHand.reset(); };
    const auto remote = ports.createRemote("peer");
    bool invalidated = false;
    remote->setInvalidationCallback([&](MessagePort&) { invalidated = true; });
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::BecameInvalid);
    EXPECT_EQ(queue.now(), 0s);
    EXPECT_FALSE(remote->isValid());
    EXPECT_FALSE(invalidated) << "never from within a call";
    queue.runPending();
    EXPECT_TRUE(invalidated);
    EXPECT_EQ(static_cast<int>(SendStatus::BecameInvalid), -5);
}

TEST_F(MessagePortsTest, AReplyThatCameBeforeTheCloseCounts)
{
    listenByHand("peer");
    onRequest = [this](const FrameReader::View& frame) {
        byHand->send(0, frame.serial, false, true, Bytes{1});
        byHand->close();
    };
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
    EXPECT_EQ(answer, Bytes{1});
    queue.runPending();
    EXPECT_FALSE(remote->isValid());
}

TEST_F(MessagePortsTest, AMessageBeyondTheLimitIsRefusedAndThePortGoesOn)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    EXPECT_EQ(send(*remote, 0, Bytes(kFrameDataLimit + 1)), SendStatus::TransportError);
    EXPECT_THAT(services.log.errors(), ElementsAre("Message of 16777217 bytes is larger than the "
                                                   "limit of 16777216; not sent"));
    EXPECT_EQ(send(*remote, 0, {1}), SendStatus::Success);
    queue.runPending();
    EXPECT_THAT(peerMessages, ElementsAre(Message{0, {1}}));
}

TEST_F(MessagePortsTest, RepliesArriveWholeHoweverTheStreamIsSplit)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    reply = Bytes{1, 2, 3, 4, 5};
    for (std::size_t segment = 1; segment <= kFrameHeaderBytes + 6; ++segment) {
        transport.setSegmentBytes(segment);
        EXPECT_EQ(ask(*remote, 1, {6, 7, 8}), SendStatus::Success) << segment;
        EXPECT_EQ(answer, *reply) << segment;
        EXPECT_EQ(peerMessages.back(), (Message{
                                           1, {6, 7, 8}
        }))
            << segment;
    }
}

// Receiving.

TEST_F(MessagePortsTest, MessagesWaitForADispatchQueue)
{
    const auto port = ownPort("own");
    const auto sender = connectByHand("own");
    sender->send(1, 0, false, false, Bytes{1});
    sender->send(2, 9, true, false, Bytes{2});
    queue.runPending();
    EXPECT_THAT(messages, IsEmpty());
    EXPECT_THAT(replies, IsEmpty());

    port->setDispatchQueue(queue);
    EXPECT_THAT(messages, IsEmpty()) << "never from within a call";
    queue.runPending();
    EXPECT_THAT(messages, ElementsAre(Message{1, {1}}, Message{2, {2}}));
    EXPECT_THAT(replies, ElementsAre(Message{2, {}}));
}

TEST_F(MessagePortsTest, MessagesAreDeliveredOnTheDispatchQueue)
{
    const auto port = ownPort("own");
    ManualMainQueue elsewhere; // with a clock of its own, which the others do not turn
    port->setDispatchQueue(elsewhere);
    const auto sender = connectByHand("own");
    sender->send(1, 0, false, false, Bytes{1});
    queue.runPending();
    EXPECT_THAT(messages, IsEmpty());
    elsewhere.runPending();
    EXPECT_THAT(messages, ElementsAre(Message{1, {1}}));
}

TEST_F(MessagePortsTest, MessagesOfSeveralConnectionsKeepTheirOrderAndReplies)
{
    const auto port = ownPort("own");
    port->setDispatchQueue(queue);
    const auto first = connectByHand("own");
    const auto second = connectByHand("own");
    reply = Bytes{9};
    first->send(1, 11, true, false, Bytes{1});
    second->send(2, 22, true, false, Bytes{2});
    first->send(3, 0, false, false, Bytes{3});
    second->send(4, 44, true, false, Bytes{4});
    queue.runPending();
    EXPECT_THAT(messages, testing::UnorderedElementsAre(Message{1, {1}}, Message{2, {2}},
                                                        Message{3, {3}}, Message{4, {4}}));
    EXPECT_THAT(serials, testing::UnorderedElementsAre(11U, 22U, 44U)) << "one reply a request";
}

TEST_F(MessagePortsTest, AFrameMarkedAsAReplyIsNoMessage)
{
    const auto port = ownPort("own");
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    sender->send(1, 1, false, true, Bytes{1});
    sender->send(2, 2, true, true, Bytes{2});
    sender->send(3, 3, false, false, Bytes{3});
    queue.runPending();
    EXPECT_THAT(messages, ElementsAre(Message{3, {3}}));
    EXPECT_THAT(replies, IsEmpty());
}

TEST_F(MessagePortsTest, AMessageOfASenderThatHasClosedStillArrives)
{
    const auto port = ownPort("own");
    auto sender = connectByHand("own");
    sender->send(1, 1, true, false, Bytes{1});
    sender.reset();
    queue.runPending();
    port->setDispatchQueue(queue);
    queue.runPending();
    EXPECT_THAT(messages, ElementsAre(Message{1, {1}}));
}

TEST_F(MessagePortsTest, AnOversizedFrameEndsItsConnectionAlone)
{
    const auto port = ownPort("own");
    port->setDispatchQueue(queue);
    const auto bad = connectByHand("own");
    queue.runPending();
    Bytes stream = framed(1, 1, false, false, {1});
    const Bytes oversized = {1, 0, 0, 1, 0, 0, 0, 0};
    stream.insert(stream.end(), oversized.begin(), oversized.end());
    transport.injectToPort("own", stream);
    const auto good = connectByHand("own");
    good->send(2, 2, false, false, Bytes{2});
    queue.runPending();
    EXPECT_THAT(messages, ElementsAre(Message{1, {1}}, Message{2, {2}}));
    EXPECT_THAT(services.log.errors(), ElementsAre("Message of 16777217 bytes is larger than the "
                                                   "limit of 16777216; closing the connection"));
    EXPECT_FALSE(bad->isOpen());
    EXPECT_TRUE(good->isOpen());
    EXPECT_TRUE(port->isValid());
    EXPECT_EQ(closes, 1);
}

TEST_F(MessagePortsTest, MoreThanItHoldsWithoutAQueueEndsTheConnectionThatBringsIt)
{
    const auto port = ownPort("own");
    const auto sender = connectByHand("own");
    const Bytes large(kFrameDataLimit / 2);
    for (int i = 0; i < 4; ++i)
        sender->send(i, 0, false, false, large);
    const auto other = connectByHand("own");
    queue.runPending();
    EXPECT_FALSE(sender->isOpen());
    EXPECT_TRUE(other->isOpen());
    EXPECT_THAT(services.log.errors(),
                ElementsAre("More than 33554432 bytes of messages wait to be taken; closing the "
                            "connection"));
    port->setDispatchQueue(queue);
    queue.runPending();
    EXPECT_EQ(messages.size(), 3U);
    // Once they are taken there is room again.
    other->send(7, 0, false, false, large);
    queue.runPending();
    EXPECT_EQ(messages.size(), 4U);
}

TEST_F(MessagePortsTest, APeerThatReadsNoRepliesLosesItsConnection)
{
    const auto port = ownPort("own");
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    transport.stopReadingFromPort("own");
    reply = Bytes(kFrameDataLimit / 2);
    for (int i = 0; i < 3; ++i)
        sender->send(i, 0, true, false, Bytes{1});
    queue.runPending();
    EXPECT_THAT(services.log.errors(), IsEmpty());
    sender->send(3, 0, true, false, Bytes{1});
    queue.runPending();
    EXPECT_THAT(services.log.errors(),
                ElementsAre(HasSubstr("bytes of replies unread; closing the connection")));
    EXPECT_EQ(messages.size(), 4U);
    EXPECT_TRUE(port->isValid());
    transport.resumeReadingFromPort("own");
    queue.runPending();
    EXPECT_FALSE(sender->isOpen());
    EXPECT_THAT(replies, IsEmpty());
}

TEST_F(MessagePortsTest, AReplyBeyondTheLimitIsAnEmptyOneWithALine)
{
    const auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    reply = Bytes(kFrameDataLimit + 1);
    EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
    EXPECT_THAT(answer, IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre(HasSubstr("Reply of 16777217 bytes")));
}

TEST_F(MessagePortsTest, AMessageCallbackMayDestroyItsPort)
{
    std::unique_ptr<LocalMessagePort> port;
    std::vector<std::int32_t> seen;
    port = ports.createLocal("own", [&](LocalMessagePort&, std::int32_t id, ByteView) {
        port.reset();
        seen.push_back(id); // what it captured still exists
        return std::optional<Bytes>(Bytes{1});
    });
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    sender->send(1, 1, true, false, Bytes{1});
    sender->send(2, 2, true, false, Bytes{2});
    queue.runPending();
    EXPECT_THAT(seen, ElementsAre(1));
    EXPECT_FALSE(sender->isOpen());
    EXPECT_THAT(replies, IsEmpty());
}

TEST_F(MessagePortsTest, AMessageCallbackMayInvalidateItsPort)
{
    std::vector<std::int32_t> seen;
    const auto port =
        ports.createLocal("own", [&](LocalMessagePort& self, std::int32_t id, ByteView) {
            self.invalidate();
            seen.push_back(id);
            return std::optional<Bytes>();
        });
    int invalidations = 0;
    port->setInvalidationCallback([&](MessagePort&) { ++invalidations; });
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    sender->send(1, 1, true, false, Bytes{1});
    sender->send(2, 2, true, false, Bytes{2});
    queue.runPending();
    EXPECT_THAT(seen, ElementsAre(1));
    EXPECT_EQ(invalidations, 1);
}

TEST_F(MessagePortsTest, AMessageCallbackThatThrowsLosesNoOtherMessage)
{
    std::vector<std::int32_t> seen;
    const auto port = ports.createLocal("own", [&](LocalMessagePort&, std::int32_t id, ByteView) {
        seen.push_back(id);
        if (id == 1)
            throw std::runtime_error("no");
        return std::optional<Bytes>();
    });
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    sender->send(1, 1, false, false, Bytes{1});
    sender->send(2, 2, false, false, Bytes{2});
    EXPECT_THROW(queue.runPending(), std::runtime_error);
    queue.runPending();
    EXPECT_THAT(seen, ElementsAre(1, 2));
}

TEST_F(MessagePortsTest, AMessageCallbackMayAskAPortOfItsOwn)
{
    const auto peer = peerPort("peer");
    reply = Bytes{4};
    std::unique_ptr<RemoteMessagePort> remote = ports.createRemote("peer");
    const auto port = ports.createLocal("own", [&](LocalMessagePort&, std::int32_t, ByteView) {
        EXPECT_EQ(ask(*remote, 0, {}), SendStatus::Success);
        return std::optional<Bytes>(answer);
    });
    port->setDispatchQueue(queue);
    const auto sender = connectByHand("own");
    sender->send(1, 1, true, false, Bytes{1});
    queue.runPending();
    EXPECT_THAT(replies, ElementsAre(Message{1, {4}}));
}

// Invalidation.

TEST_F(MessagePortsTest, InvalidatingQueuesTheCallbackOnce)
{
    const auto port = ownPort("own");
    int calls = 0;
    port->setInvalidationCallback([&](MessagePort& invalid) {
        EXPECT_EQ(&invalid, port.get());
        EXPECT_FALSE(invalid.isValid());
        ++calls;
    });
    EXPECT_TRUE(port->isValid());
    port->invalidate();
    port->invalidate();
    EXPECT_FALSE(port->isValid());
    EXPECT_EQ(calls, 0) << "never from within a call";
    queue.runPending();
    port->invalidate();
    queue.runPending();
    EXPECT_EQ(calls, 1);
}

TEST_F(MessagePortsTest, InvalidatingALocalPortRemovesItsNameAndClosesItsConnections)
{
    const auto port = ownPort("own");
    const auto sender = connectByHand("own");
    queue.runPending();
    port->invalidate();
    queue.runPending();
    EXPECT_FALSE(transport.hasListener("own"));
    EXPECT_EQ(closes, 1);
    EXPECT_NE(ownPort("own"), nullptr);
}

TEST_F(MessagePortsTest, AQueuedCallOfAClearedCallbackDoesNotCome)
{
    const auto peer = peerPort("peer");
    const auto local = ownPort("own");
    const auto remote = ports.createRemote("peer");
    int calls = 0;
    for (MessagePort* port :
         {static_cast<MessagePort*>(local.get()), static_cast<MessagePort*>(remote.get())}) {
        port->setInvalidationCallback([&](MessagePort&) { ++calls; });
        port->invalidate();
        port->setInvalidationCallback({});
    }
    queue.runPending();
    EXPECT_EQ(calls, 0);
}

TEST_F(MessagePortsTest, AQueuedCallOfADestroyedPortDoesNotCome)
{
    const auto peer = peerPort("peer");
    auto local = ownPort("own");
    auto remote = ports.createRemote("peer");
    int calls = 0;
    for (MessagePort* port :
         {static_cast<MessagePort*>(local.get()), static_cast<MessagePort*>(remote.get())}) {
        port->setInvalidationCallback([&](MessagePort&) { ++calls; });
        port->invalidate();
    }
    local.reset();
    remote.reset();
    queue.runPending();
    EXPECT_EQ(calls, 0);
}

TEST_F(MessagePortsTest, DestroyingAPortIsNoInvalidation)
{
    auto local = ownPort("own");
    int calls = 0;
    local->setInvalidationCallback([&](MessagePort&) { ++calls; });
    local.reset();
    queue.runPending();
    EXPECT_EQ(calls, 0);
}

TEST_F(MessagePortsTest, AnInvalidationCallbackMayDestroyItsPort)
{
    const auto peer = peerPort("peer");
    auto remote = ports.createRemote("peer");
    int calls = 0;
    remote->setInvalidationCallback([&](MessagePort&) {
        remote.reset();
        ++calls; // what it captured still exists
    });
    queue.runPending();
    transport.cutConnections("peer");
    queue.runPending();
    EXPECT_EQ(calls, 1);
}

TEST_F(MessagePortsTest, ACallbackSetOnAnInvalidPortIsCalled)
{
    const auto port = ownPort("own");
    port->invalidate();
    queue.runPending();
    int calls = 0;
    port->setInvalidationCallback([&](MessagePort&) { ++calls; });
    EXPECT_EQ(calls, 0);
    queue.runPending();
    EXPECT_EQ(calls, 1);
}

TEST_F(MessagePortsTest, ARemotePortIsValidUntilItsPeerCloses)
{
    auto peer = peerPort("peer");
    const auto remote = ports.createRemote("peer");
    int calls = 0;
    remote->setInvalidationCallback([&](MessagePort&) { ++calls; });
    queue.advance(60s);
    EXPECT_TRUE(remote->isValid());
    peer->invalidate();
    queue.runPending();
    EXPECT_FALSE(remote->isValid());
    EXPECT_EQ(calls, 1);
}

TEST_F(MessagePortsTest, ARemotePortsOwnInvalidationClosesTheConnection)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    remote->invalidate();
    EXPECT_FALSE(remote->isValid());
    queue.runPending();
    EXPECT_FALSE(byHand->isOpen());
    EXPECT_EQ(send(*remote, 0, {}), SendStatus::NotValid);
}

TEST_F(MessagePortsTest, GarbageFromThePeerInvalidatesARemotePort)
{
    listenByHand("peer");
    const auto remote = ports.createRemote("peer");
    queue.runPending();
    transport.injectFromPort("peer", Bytes{0xFF, 0xFF, 0xFF, 0xFF});
    queue.runPending();
    EXPECT_FALSE(remote->isValid());
    EXPECT_THAT(services.log.errors(), ElementsAre(HasSubstr("Message of 4294967295 bytes")));
}

// Keeping objects for a port.

TEST_F(MessagePortsTest, AnObjectIsKeptUntilThePortIsInvalidatedOrDestroyed)
{
    const auto object = std::make_shared<int>(0);
    const auto invalidated = ownPort("one");
    auto destroyed = ownPort("two");
    EXPECT_TRUE(ports.keepWhileValid("one", object));
    EXPECT_TRUE(ports.keepWhileValid("two", object));
    EXPECT_EQ(object.use_count(), 3);
    invalidated->invalidate();
    EXPECT_EQ(object.use_count(), 2);
    destroyed.reset();
    EXPECT_EQ(object.use_count(), 1);
}

TEST_F(MessagePortsTest, NothingIsKeptWithoutAValidPortOfTheName)
{
    const auto object = std::make_shared<int>(0);
    EXPECT_FALSE(ports.keepWhileValid("none", object));
    const auto invalid = ownPort("one");
    invalid->invalidate();
    EXPECT_FALSE(ports.keepWhileValid("one", object));
    const auto successor = ownPort("one");
    EXPECT_TRUE(ports.keepWhileValid("one", object));
    EXPECT_EQ(object.use_count(), 2);
}

} // namespace
} // namespace orvane
