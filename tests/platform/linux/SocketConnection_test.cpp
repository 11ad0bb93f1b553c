#include "platform/linux/SocketConnection.h"

#include "platform/linux/QtMainQueue.h"
#include "platform/linux/TransportTest.h"

#include <csignal>
#include <functional>
#include <optional>
#include <sys/socket.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using SteadyClock = std::chrono::steady_clock;

class SocketConnectionTest : public TransportTest
{
protected:
    SocketConnectionTest()
    {
        int ends[2];
        EXPECT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0, ends), 0);
        plainHere = FileDescriptor(ends[0]);
        plainThere = FileDescriptor(ends[1]);
    }

    void makeHere()
    {
        here = std::make_unique<SocketConnection>(std::move(plainHere));
        here->setClosedCallback([this] { ++closed; });
    }
    void makeBoth()
    {
        makeHere();
        there = std::make_unique<SocketConnection>(std::move(plainThere));
        there->setFrameCallback(recordTo(atThere));
        here->setFrameCallback(recordTo(atHere));
    }

    static std::function<void(const FrameReader::View&)> recordTo(std::vector<ReceivedFrame>& to)
    {
        return [&to](const FrameReader::View& frame) {
            to.push_back({frame.messageId, frame.serial, frame.wantsReply, frame.isReply,
                          Bytes(frame.data.begin(), frame.data.end())});
        };
    }

    void writePlainly(ByteView bytes)
    {
        ASSERT_EQ(::send(plainThere.get(), bytes.data(), bytes.size(), MSG_NOSIGNAL),
                  static_cast<ssize_t>(bytes.size()));
    }
    static Bytes frameBytes(std::int32_t messageId, std::size_t dataBytes = 0)
    {
        Bytes bytes;
        appendFrame(bytes, messageId, 0, false, false, Bytes(dataBytes, 0x33));
        return bytes;
    }

    // Sends until the peer, which does not read, takes no more. Returns the number of frames.
    int sendUntilBlocked(FrameConnection& connection, std::size_t frameBytes)
    {
        int sent = 0;
        const Bytes data(frameBytes, 0x11);
        do {
            connection.send(sent++, 0, false, false, data);
            turnOnce();
        } while (connection.queuedBytes() == 0 && sent < 100000);
        return sent;
    }

    // The plain ends of the pair, for tests in which one side is a bare socket.
    FileDescriptor plainHere;
    FileDescriptor plainThere;
    std::unique_ptr<FrameConnection> here;
    std::unique_ptr<FrameConnection> there;
    std::vector<ReceivedFrame> atHere;
    std::vector<ReceivedFrame> atThere;
    int closed = 0;
};

TEST_F(SocketConnectionTest, FramesArriveInOrderWithAllTheirFields)
{
    makeBoth();
    const std::vector<ReceivedFrame> sent{
        {0,         0,          false, false,    {}          },
        {-1,        0xFFFFFFFF, true,  false,    {1, 2, 3}   },
        {INT32_MIN, 7,          false, true,     Bytes(100000, 0xAB)},
        {INT32_MAX,         8,           true,       true, {0}  },
    };
    for (const auto& frame : sent)
        EXPECT_TRUE(
            here->send(frame.messageId, frame.serial, frame.wantsReply, frame.isReply, frame.data));
    EXPECT_TRUE(runUntil([&] { return atThere.size() == sent.size(); }));
    EXPECT_EQ(atThere, sent);
    there->send(5, 6, false, false, {});
    EXPECT_TRUE(runUntil([&] { return atHere.size() == 1; }));
}

TEST_F(SocketConnectionTest, NoCallbackComesFromWithinACallOfTheOwner)
{
    makeHere();
    writePlainly(frameBytes(1));
    plainThere.reset();
    bool isCalling = true;
    int calls = 0;
    here->setFrameCallback([&](const FrameReader::View&) { calls += isCalling ? 100 : 1; });
    here->setClosedCallback([&] { calls += isCalling ? 100 : 1; });
    here->setDrainedCallback([&] { calls += isCalling ? 100 : 0; });
    here->send(1, 0, false, false, Bytes(500000));
    isCalling = false;
    EXPECT_TRUE(runUntil([&] { return calls >= 2; }));
    EXPECT_EQ(calls, 2);
}

TEST_F(SocketConnectionTest, FramesThatCameBeforeTheCloseAreDeliveredBeforeIt)
{
    makeHere();
    Bytes frames;
    for (int i = 0; i < 10000; ++i)
        appendFrame(frames, i, 0, false, false, {});
    writePlainly(frames);
    plainThere.reset();
    here->setFrameCallback([&](const FrameReader::View& frame) {
        EXPECT_EQ(closed, 0);
        here->send(frame.messageId, 0, false, true, Bytes(1000)); // nobody takes it
        atHere.push_back({frame.messageId, 0, false, false, {}});
    });
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    EXPECT_EQ(atHere.size(), 10000U);
    EXPECT_FALSE(here->isOpen());
    EXPECT_FALSE(here->send(1, 0, false, false, {}));
    EXPECT_EQ(here->queuedBytes(), 0U);
    turnOnce();
    EXPECT_EQ(closed, 1);
}

TEST_F(SocketConnectionTest, AFrameCutShortByTheCloseIsDropped)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    Bytes bytes = frameBytes(1, 10);
    const Bytes second = frameBytes(2, 10);
    bytes.insert(bytes.end(), second.begin(), second.end() - 1);
    writePlainly(bytes);
    plainThere.reset();
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    ASSERT_EQ(atHere.size(), 1U);
    EXPECT_EQ(atHere[0].messageId, 1);
}

TEST_F(SocketConnectionTest, AFrameMayComeByteByByte)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    const Bytes bytes = frameBytes(9, 5);
    for (const std::uint8_t byte : bytes) {
        EXPECT_TRUE(atHere.empty());
        writePlainly(Bytes{byte});
        turnOnce();
    }
    EXPECT_TRUE(runUntil([&] { return atHere.size() == 1; }));
    EXPECT_EQ(atHere[0].data, Bytes(5, 0x33));
}

TEST_F(SocketConnectionTest, NothingComesAfterClose)
{
    makeBoth();
    int closedThere = 0;
    there->setClosedCallback([&] { ++closedThere; });
    there->send(1, 0, false, false, {});
    here->send(2, 0, false, false, {});
    here->close();
    here->close();
    EXPECT_FALSE(here->isOpen());
    EXPECT_FALSE(here->send(3, 0, false, false, {}));
    EXPECT_TRUE(runUntil([&] { return closedThere == 1; }));
    EXPECT_EQ(atThere.size(), 1U) << "what was queued at the close was written";
    EXPECT_TRUE(atHere.empty());
    EXPECT_EQ(closed, 0);
}

TEST_F(SocketConnectionTest, AFrameOfTheLargestSizePasses)
{
    makeBoth();
    here->send(1, 0, false, false, Bytes(kFrameDataLimit, 0x77));
    here->send(2, 0, false, false, {});
    EXPECT_GT(here->queuedBytes(), 0U);
    EXPECT_TRUE(runUntil([&] { return atThere.size() == 2; }));
    EXPECT_EQ(atThere[0].data, Bytes(kFrameDataLimit, 0x77));
    EXPECT_EQ(here->queuedBytes(), 0U);
    EXPECT_THROW(here->send(3, 0, false, false, Bytes(kFrameDataLimit + 1)), std::length_error);
    EXPECT_TRUE(here->isOpen());
}

TEST_F(SocketConnectionTest, AnAnnouncedLengthAboveTheLimitEndsTheConnection)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    Bytes bytes = frameBytes(1);
    const std::uint32_t length = kFrameDataLimit + 1;
    for (unsigned shift = 0; shift < 32; shift += 8)
        bytes.push_back(static_cast<std::uint8_t>(length >> shift));
    writePlainly(bytes);
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    EXPECT_EQ(atHere.size(), 1U) << "the frame before it counts";
    ASSERT_EQ(log.errors().size(), 1U);
    EXPECT_NE(log.errors()[0].find("16777217"), std::string::npos) << log.errors()[0];
    char byte = 0;
    EXPECT_EQ(::recv(plainThere.get(), &byte, 1, 0), 0) << "the peer sees the end";
}

TEST_F(SocketConnectionTest, WhatThePeerDoesNotTakeIsQueuedAndSentAsItReads)
{
    makeHere();
    const int blockedAt = sendUntilBlocked(*here, 10000);
    for (int i = 0; i < 50; ++i)
        here->send(blockedAt + i, 0, false, false, Bytes(10000, 0x11));
    turnOnce();
    std::size_t lastQueued = here->queuedBytes();
    EXPECT_GE(lastQueued, 50U * 10000);
    int drained = 0;
    here->setDrainedCallback([&] {
        ++drained;
        EXPECT_LT(here->queuedBytes(), lastQueued);
        lastQueued = here->queuedBytes();
    });

    there = std::make_unique<SocketConnection>(std::move(plainThere));
    std::int32_t expected = 0;
    there->setFrameCallback([&](const FrameReader::View& frame) {
        EXPECT_EQ(frame.messageId, expected);
        EXPECT_EQ(frame.data.size(), 10000U);
        ++expected;
    });
    EXPECT_TRUE(runUntil([&] { return expected == blockedAt + 50; }));
    EXPECT_TRUE(runUntil([&] { return here->queuedBytes() == 0; }));
    EXPECT_GT(drained, 0);
    EXPECT_EQ(lastQueued, 0U);
}

TEST_F(SocketConnectionTest, TheLastFrameCanBeWithdrawnWhileNoneOfItIsWritten)
{
    makeHere();
    EXPECT_FALSE(here->withdrawLast());
    sendUntilBlocked(*here, 10000);
    const std::size_t queued = here->queuedBytes();
    here->send(77, 0, false, false, Bytes(5));
    EXPECT_EQ(here->queuedBytes(), queued + kFrameHeaderBytes + 5);
    EXPECT_TRUE(here->withdrawLast());
    EXPECT_EQ(here->queuedBytes(), queued);
    EXPECT_FALSE(here->withdrawLast());

    there = std::make_unique<SocketConnection>(std::move(plainThere));
    there->setFrameCallback(recordTo(atThere));
    here->send(78, 0, false, false, {});
    EXPECT_TRUE(runUntil([&] { return !atThere.empty() && atThere.back().messageId == 78; }));
    for (const auto& frame : atThere)
        EXPECT_NE(frame.messageId, 77);
    EXPECT_FALSE(here->withdrawLast()) << "it is written";
}

TEST_F(SocketConnectionTest, AFrameOfWhichSomeIsWrittenCannotBeWithdrawn)
{
    makeHere();
    here->send(1, 0, false, false, Bytes(4000000));
    turnOnce();
    ASSERT_LT(here->queuedBytes(), 4000000U);
    ASSERT_GT(here->queuedBytes(), 0U);
    EXPECT_FALSE(here->withdrawLast());
}

TEST_F(SocketConnectionTest, AFloodLeavesTimersTheirTurn)
{
    makeBoth();
    bool isOver = false;
    std::size_t received = 0;
    there->setFrameCallback([&](const FrameReader::View&) { ++received; });
    const Bytes data(60);
    const auto fill = [&] {
        while (!isOver && here->queuedBytes() < 1024 * 1024)
            here->send(0, 0, false, false, data);
    };
    here->setDrainedCallback(fill);
    fill();
    QtMainQueue queue;
    int ticks = 0;
    const auto timer =
        queue.repeatingTimer(2ms, [&] { isOver = ++ticks >= 10 && received > 1000; });
    EXPECT_TRUE(runUntil([&] { return isOver; })) << ticks << " ticks, " << received << " frames";
    timer->invalidate();
}

TEST_F(SocketConnectionTest, FramesWaitForACallbackAndThePeerWithTheRest)
{
    makeHere();
    there = std::make_unique<SocketConnection>(std::move(plainThere));
    int sent = sendUntilBlocked(*there, 10000);
    for (int i = 0; i < 100; ++i)
        there->send(sent++, 0, false, false, Bytes(10000));
    for (int turn = 0; turn < 100; ++turn)
        turnOnce();
    EXPECT_GT(there->queuedBytes(), 0U) << "frames were read without end";
    std::int32_t expected = 0;
    here->setFrameCallback(
        [&](const FrameReader::View& frame) { EXPECT_EQ(frame.messageId, expected++); });
    EXPECT_TRUE(runUntil([&] { return expected == sent; }));
}

TEST_F(SocketConnectionTest, FramesThatWaitForACallbackOutlastTheClose)
{
    makeHere();
    writePlainly(frameBytes(1));
    plainThere.reset();
    turnOnce();
    turnOnce();
    EXPECT_EQ(closed, 0);
    here->setFrameCallback(recordTo(atHere));
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    EXPECT_EQ(atHere.size(), 1U);
}

TEST_F(SocketConnectionTest, AClosedCallbackThatComesLateIsStillCalled)
{
    makeHere();
    here->setClosedCallback({});
    plainThere.reset();
    EXPECT_TRUE(runUntil([&] { return !here->isOpen(); }));
    here->setClosedCallback([&] { ++closed; });
    EXPECT_EQ(closed, 0);
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
}

TEST_F(SocketConnectionTest, EveryCallbackMayDestroyTheConnection)
{
    for (const std::string which : {"frame", "closed", "drained", "waiting", "closed waiting"}) {
        int ends[2];
        ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0, ends), 0);
        here = std::make_unique<SocketConnection>(FileDescriptor(ends[0]));
        plainThere = FileDescriptor(ends[1]);
        int calls = 0;
        const auto destroy = [&, captured = std::string(100, 'x')] {
            here.reset();
            calls += captured.size() == 100 ? 1 : 0;
        };
        if (which == "frame" || which == "waiting")
            here->setFrameCallback([destroy](const FrameReader::View& frame) {
                const Bytes before(frame.data.begin(), frame.data.end());
                destroy();
                EXPECT_EQ(before, Bytes(frame.data.begin(), frame.data.end()));
            });
        else
            here->setFrameCallback([](const FrameReader::View&) {});
        if (which.starts_with("closed"))
            here->setClosedCallback(destroy);
        if (which == "drained")
            here->setDrainedCallback(destroy);

        writePlainly(frameBytes(1, 10));
        writePlainly(frameBytes(2, 10));
        if (which == "drained")
            here->send(1, 0, false, false, Bytes(10));
        if (which.starts_with("closed"))
            plainThere.reset();
        if (which.ends_with("waiting")) {
            EXPECT_FALSE(here->waitUntil([] { return false; }, 30s));
        }
        EXPECT_TRUE(runUntil([&] { return calls == 1; })) << which;
        turnOnce();
        EXPECT_EQ(calls, 1) << which;
    }
}

TEST_F(SocketConnectionTest, APeerThatIsGoneRaisesNoSignal)
{
    makeHere();
    here->setFrameCallback([](const FrameReader::View&) {});
    const auto before = std::signal(SIGPIPE, SIG_DFL); // would end the test
    plainThere.reset();
    here->send(1, 0, false, false, Bytes(100000));
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    std::signal(SIGPIPE, before);
}

TEST_F(SocketConnectionTest, APeerThatOnlyStopsReadingCountsAsClosed)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    ASSERT_EQ(::shutdown(plainThere.get(), SHUT_RD), 0);
    writePlainly(frameBytes(4));
    here->send(1, 0, false, false, {});
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    EXPECT_EQ(atHere.size(), 1U);
}

class SocketConnectionWaitTest : public SocketConnectionTest
{
};

TEST_F(SocketConnectionWaitTest, WaitingServesThisConnectionAlone)
{
    makeBoth();
    QtMainQueue queue;
    bool otherRan = false;
    queue.async([&] { otherRan = true; });
    here->send(1, 0, true, false, {});
    there->send(2, 0, false, true, {});
    EXPECT_TRUE(there->waitUntil([&] { return there->queuedBytes() == 0; }, 30s));
    EXPECT_TRUE(here->waitUntil([&] { return atHere.size() == 1; }, 30s));
    EXPECT_TRUE(atThere.empty());
    EXPECT_FALSE(otherRan);
    EXPECT_TRUE(runUntil([&] { return atThere.size() == 1; })) << "the wait has sent the request";
}

TEST_F(SocketConnectionWaitTest, WaitingEndsWithTheTime)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    for (const auto timeout : {-1000ms, 0ms, 20ms}) {
        const auto start = SteadyClock::now();
        EXPECT_FALSE(here->waitUntil([] { return false; }, timeout));
        EXPECT_GE(SteadyClock::now() - start, timeout);
    }
    writePlainly(frameBytes(1));
    EXPECT_TRUE(here->waitUntil([&] { return atHere.size() == 1; }, 0ms))
        << "what is there already counts";
    EXPECT_TRUE(here->isOpen());
}

TEST_F(SocketConnectionWaitTest, WaitingEndsWithTheTimeWhateverThePeerSends)
{
    makeHere();
    std::size_t received = 0;
    here->setFrameCallback([&](const FrameReader::View&) {
        ++received;
        writePlainly(frameBytes(1)); // one comes for each that is taken
    });
    writePlainly(frameBytes(1));
    EXPECT_TRUE(eventually([&] {
        EXPECT_FALSE(here->waitUntil([] { return false; }, 20ms));
        return received > 1;
    }));
}

TEST_F(SocketConnectionWaitTest, WaitingStopsAtTheFrameThatWasWaitedFor)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    for (int i = 0; i < 5; ++i)
        writePlainly(frameBytes(i));
    EXPECT_TRUE(here->waitUntil([&] { return atHere.size() == 2; }, 30s));
    EXPECT_EQ(atHere.size(), 2U);
    EXPECT_TRUE(runUntil([&] { return atHere.size() == 5; })) << "the others come from the loop";
}

TEST_F(SocketConnectionWaitTest, WaitingEndsWhenThePeerClosesAndTheCallbackComesAfterwards)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    writePlainly(frameBytes(1));
    plainThere.reset();
    EXPECT_FALSE(here->waitUntil([] { return false; }, std::chrono::milliseconds::max()));
    EXPECT_EQ(atHere.size(), 1U);
    EXPECT_FALSE(here->isOpen());
    EXPECT_EQ(closed, 0);
    EXPECT_TRUE(runUntil([&] { return closed == 1; }));
    EXPECT_TRUE(here->waitUntil([] { return true; }, 30s));
    EXPECT_FALSE(here->waitUntil([] { return false; }, 30s));
}

TEST_F(SocketConnectionWaitTest, AReplyThatCameBeforeThePeerWentCounts)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    writePlainly(frameBytes(1));
    plainThere.reset();
    here->send(2, 0, true, false, Bytes(100000));
    EXPECT_TRUE(here->waitUntil([&] { return atHere.size() == 1; }, 30s));
}

TEST_F(SocketConnectionWaitTest, WaitingSendsWhatIsQueued)
{
    makeHere();
    int drained = 0;
    here->setDrainedCallback([&] { ++drained; });
    here->setFrameCallback([&](const FrameReader::View&) {});
    here->send(1, 0, false, false, Bytes(2000000));
    const auto isSent = [&] { return here->queuedBytes() == 0; };
    EXPECT_FALSE(here->waitUntil(isSent, 10ms)) << "nobody reads";
    std::size_t read = 0;
    Bytes block(100000);
    const auto readAndLook = [&] {
        const auto count = ::recv(plainThere.get(), block.data(), block.size(), 0);
        read += count > 0 ? static_cast<std::size_t>(count) : 0;
        writePlainly(frameBytes(1)); // so that it looks again
        return isSent();
    };
    EXPECT_TRUE(here->waitUntil(readAndLook, 30s));
    EXPECT_GT(read, 1000000U);
    EXPECT_EQ(drained, 0) << "not from within the wait";
    EXPECT_TRUE(runUntil([&] { return drained > 0; }));
}

TEST_F(SocketConnectionWaitTest, FramesThatCallbacksSendLeaveDuringTheWait)
{
    makeHere();
    here->setFrameCallback([&](const FrameReader::View& frame) {
        here->send(frame.messageId + 1, 0, false, true, {});
    });
    writePlainly(frameBytes(1));
    Bytes reply(kFrameHeaderBytes);
    std::ptrdiff_t got = 0;
    int more = 5; // frames, so that it looks again
    EXPECT_TRUE(here->waitUntil(
        [&] {
            got = std::max(got, ::recv(plainThere.get(), reply.data(), reply.size(), 0));
            if (got <= 0 && more-- > 0)
                writePlainly(frameBytes(1));
            return got > 0;
        },
        10s));
    EXPECT_EQ(got, static_cast<std::ptrdiff_t>(kFrameHeaderBytes));
    EXPECT_EQ(reply[4], 2);
}

TEST_F(SocketConnectionWaitTest, AFrameStaysValidWhileItsCallbackWaitsForAnother)
{
    makeHere();
    here->setFrameCallback([&](const FrameReader::View& frame) {
        if (frame.messageId == 1) {
            writePlainly(frameBytes(2, 100000));
            EXPECT_TRUE(here->waitUntil([&] { return atHere.size() == 2; }, 30s));
        }
        atHere.push_back(
            {frame.messageId, 0, false, false, Bytes(frame.data.begin(), frame.data.end())});
    });
    writePlainly(frameBytes(1, 20));
    writePlainly(frameBytes(3, 30));
    EXPECT_TRUE(runUntil([&] { return atHere.size() == 3; }));
    EXPECT_EQ(atHere[0], (ReceivedFrame{3, 0, false, false, Bytes(30, 0x33)}));
    EXPECT_EQ(atHere[1], (ReceivedFrame{2, 0, false, false, Bytes(100000, 0x33)}));
    EXPECT_EQ(atHere[2], (ReceivedFrame{1, 0, false, false, Bytes(20, 0x33)}));
}

TEST_F(SocketConnectionTest, AFrameThatHasArrivedInPartIsToldFromTheNext)
{
    makeHere();
    here->setFrameCallback(recordTo(atHere));
    EXPECT_EQ(here->unfinishedFrame(), std::nullopt);
    const Bytes frame = frameBytes(1, 100);
    writePlainly(ByteView(frame).first(50));
    EXPECT_TRUE(runUntil([&] { return here->unfinishedFrame() == 0U; }));
    writePlainly(ByteView(frame).subspan(50));
    writePlainly(ByteView(frame).first(50));
    EXPECT_TRUE(runUntil([&] { return here->unfinishedFrame() == 1U; }));
    EXPECT_EQ(atHere.size(), 1U);
    here->close();
    EXPECT_EQ(here->unfinishedFrame(), std::nullopt);
}

} // namespace
} // namespace orvane
