#include "telephonyd/LogServer.h"

#include "platform/base/PropertyValue.h"

#include "support/Recording.h"
#include "telephonyd/LogChannel.h"
#include "telephonyd/support/HandSource.h"
#include "telephonyd/support/TelephonyClient.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class LogServerTest : public testing::Test
{
protected:
    LogServerTest() { EXPECT_FALSE(server.start()); }

    // A client that has a channel and has started it.
    std::unique_ptr<TelephonyClient> streamingClient(const std::string& name)
    {
        auto client = connectedClient(name);
        client->command(startCommand({1}));
        queue.runPending();
        return client;
    }
    std::unique_ptr<TelephonyClient> connectedClient(const std::string& name)
    {
        auto client = std::make_unique<TelephonyClient>(transport, name);
        client->requestChannel();
        queue.runPending();
        client->connectToChannel();
        queue.runPending();
        return client;
    }
    std::unique_ptr<LogSource> makeSource()
    {
        if (!hasSources)
            return nullptr;
        sources.push_back(std::make_shared<HandSourceState>());
        return std::make_unique<HandSource>(sources.back());
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    bool hasSources = true;
    std::vector<std::shared_ptr<HandSourceState>> sources;
    LogServer server{transport, queue, [this] { return makeSource(); }};
};

TEST_F(LogServerTest, ARequestIsAnsweredWithThePortOfANewChannel)
{
    TelephonyClient client(transport, "client");
    client.requestChannel();
    queue.runPending();
    ASSERT_EQ(client.serverFrames.size(), 1U);
    EXPECT_EQ(client.serverFrames[0].messageId, 1);
    EXPECT_EQ(client.serverFrames[0].serial, 5U);
    EXPECT_EQ(client.answer()["Error"].asInteger(), 0);
    EXPECT_EQ(client.channelPort(), "TelephonyServer.Channel.1");
    EXPECT_TRUE(transport.hasListener("TelephonyServer.Channel.1"));
    EXPECT_EQ(transport.openConnections("client"), 1U);
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LogServerTest, AnUnusableRequestIsAnsweredWithAnErrorAndLogged)
{
    const auto naming = [](const PropertyValue& port) {
        return xmlOf(PropertyValue::dictionaryOf({
            {"CreateLogChannel", port}
        }));
    };
    const struct {
        Bytes request;
        std::int32_t error;
        const char* line;
    } cases[] = {
        {bytesOf("garbage"),                    LogServer::kBadRequest,        "not a property list"},
        {{},                                    LogServer::kBadRequest,        "not a property list"},
        {xmlOf(PropertyValue::newDictionary()), LogServer::kBadRequest,        "names no port"      },
        {xmlOf("client"),                       LogServer::kBadRequest,        "names no port"      },
        {naming(PropertyValue::integer(1)),     LogServer::kBadRequest,        "names no port"      },
        {naming(""),                            LogServer::kBadRequest,        "names no port"      },
        {naming("../client"),                   LogServer::kBadRequest,        "names no port"      },
        {naming("TelephonyServer"),             LogServer::kBadRequest,        "names no port"      },
        {naming("TelephonyServer.Channel.1"),   LogServer::kBadRequest,        "names no port"      },
        {naming("nobody"),                      LogServer::kClientUnreachable,
         "No log channel for nobody: nothing accepts"                                               },
    };
    for (const auto& each : cases) {
        services.log.lines.clear();
        TelephonyClient client(transport, "client");
        client.request(each.request);
        queue.runPending();
        EXPECT_EQ(client.answer()["Error"].asInteger(), each.error);
        EXPECT_TRUE(client.answer()["Port"].isAbsent());
        ASSERT_EQ(services.log.errors().size(), 1U);
        EXPECT_THAT(services.log.errors()[0], HasSubstr(each.line));
        EXPECT_EQ(server.channelCount(), 0U);
    }
}

TEST_F(LogServerTest, WithoutASourceThereIsNoChannel)
{
    hasSources = false;
    TelephonyClient client(transport, "client");
    client.requestChannel();
    queue.runPending();
    EXPECT_EQ(client.answer()["Error"].asInteger(), LogServer::kNoChannel);
    EXPECT_FALSE(transport.hasListener("TelephonyServer.Channel.1"));
    EXPECT_EQ(transport.openConnections("client"), 0U);
    EXPECT_THAT(services.log.errors(),
                ElementsAre("No log channel for client: there is no source of messages"));
}

TEST_F(LogServerTest, ThereIsALimitToChannels)
{
    TelephonyClient client(transport, "client");
    for (std::size_t i = 0; i <= LogServer::kMostChannels; ++i) {
        client.requestChannel();
        queue.runPending();
    }
    EXPECT_EQ(server.channelCount(), LogServer::kMostChannels);
    EXPECT_EQ(client.answer()["Error"].asInteger(), LogServer::kNoChannel);
}

TEST_F(LogServerTest, OnlyRequestsAreAnswered)
{
    TelephonyClient client(transport, "client");
    const Bytes request = xmlOf(PropertyValue::dictionaryOf({
        {"CreateLogChannel", "client"}
    }));
    client.server->send(1, 1, false, false, request); // no reply wanted
    client.server->send(1, 2, true, true, request);   // a reply itself
    queue.runPending();
    EXPECT_THAT(client.serverFrames, IsEmpty());
    EXPECT_EQ(server.channelCount(), 0U);

    client.server->send(77, 3, true, false, request);
    queue.runPending();
    ASSERT_EQ(client.serverFrames.size(), 1U);
    EXPECT_EQ(client.serverFrames[0].serial, 3U);
    EXPECT_TRUE(client.serverFrames[0].isReply);
    EXPECT_THAT(client.serverFrames[0].data, IsEmpty());
}

TEST_F(LogServerTest, TheTechnologyIsTheSources)
{
    const auto client = connectedClient("client");
    client->command(PropertyValue::dictionaryOf({
                        {"GetTechnology", "GetTechnology"}
    }),
                    true);
    queue.runPending();
    ASSERT_EQ(client->channelFrames.size(), 1U);
    EXPECT_EQ(client->channelFrames[0].serial, 9U);
    EXPECT_EQ(readPropertyList(client->channelFrames[0].data).value["GetTechnology"],
              PropertyValue("technology of a test"));
    EXPECT_FALSE(sources[0]->selection);
}

TEST_F(LogServerTest, TheStartCommandStartsTheSourceWithJustWhatWasAsked)
{
    const auto client = connectedClient("client");
    client->command(startCommand({0xB0C2, 0xB179}, {0, 2}));
    queue.runPending();
    ASSERT_TRUE(sources[0]->selection);
    EXPECT_THAT(sources[0]->selection->modemCodes, ElementsAre(0xB0C2, 0xB179));
    EXPECT_THAT(sources[0]->selection->extraCodes, ElementsAre(0, 2));
    EXPECT_THAT(client->channelFrames, IsEmpty());
}

TEST_F(LogServerTest, AStartCommandWithoutCodesLeavesTheSelectionEmpty)
{
    const auto client = connectedClient("client");
    client->command(PropertyValue::dictionaryOf({
        {"SetState", "Streaming"}
    }));
    queue.runPending();
    ASSERT_TRUE(sources[0]->selection);
    EXPECT_THAT(sources[0]->selection->modemCodes, IsEmpty());
    EXPECT_THAT(sources[0]->selection->extraCodes, IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LogServerTest, ASecondStartCommandChangesNothing)
{
    const auto client = connectedClient("client");
    client->command(startCommand({1}));
    client->command(startCommand({2}), true);
    queue.runPending();
    EXPECT_THAT(sources[0]->selection->modemCodes, ElementsAre(1));
    EXPECT_EQ(sources.size(), 1U);
    ASSERT_EQ(client->channelFrames.size(), 1U); // the reply that was asked for, without data
    EXPECT_THAT(client->channelFrames[0].data, IsEmpty());
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("TelephonyServer.Channel.1: ignoring a second start command"));
}

TEST_F(LogServerTest, AnUnusableCommandIsLoggedAndAnsweredWithoutData)
{
    const struct {
        Bytes data;
        const char* line;
    } cases[] = {
        {bytesOf("garbage"),                                                            "is not a property list"},
        {xmlOf(PropertyValue::newArray()),                                              "unknown command"       },
        {xmlOf(PropertyValue::newDictionary()),                                         "unknown command"       },
        {xmlOf(PropertyValue::dictionaryOf({{"SetState", "Stopped"}})),                 "unknown command"       },
        {xmlOf(PropertyValue::dictionaryOf({{"SetState", PropertyValue::integer(1)}})),
         "unknown command"                                                                                      },
    };
    const auto client = connectedClient("client");
    for (const auto& each : cases) {
        services.log.lines.clear();
        client->channelFrames.clear();
        client->channel->send(0, 3, true, false, each.data);
        queue.runPending();
        ASSERT_EQ(client->channelFrames.size(), 1U);
        EXPECT_THAT(client->channelFrames[0].data, IsEmpty());
        ASSERT_EQ(services.log.errors().size(), 1U);
        EXPECT_THAT(services.log.errors()[0], HasSubstr(each.line));
    }
    EXPECT_FALSE(sources[0]->selection);
    EXPECT_EQ(server.channelCount(), 1U);
}

TEST_F(LogServerTest, MessagesOfOtherIdsOnTheChannelDoNothing)
{
    const auto client = connectedClient("client");
    client->channel->send(1, 3, true, false, xmlOf(startCommand({1})));
    queue.runPending();
    EXPECT_FALSE(sources[0]->selection);
    ASSERT_EQ(client->channelFrames.size(), 1U);
    EXPECT_THAT(client->channelFrames[0].data, IsEmpty());
}

TEST_F(LogServerTest, LogMessagesGoToTheClientsPortInOrder)
{
    const auto client = streamingClient("client");
    for (std::uint8_t i = 0; i < 3; ++i)
        EXPECT_TRUE(sources[0]->send(Bytes{1, i}));
    queue.runPending();
    EXPECT_THAT(client->messages, ElementsAre(Bytes{1, 0}, Bytes{1, 1}, Bytes{1, 2}));
}

TEST_F(LogServerTest, EachClientHasAChannelOfItsOwn)
{
    const auto one = streamingClient("one");
    const auto two = streamingClient("two");
    const auto three = streamingClient("three");
    EXPECT_THAT((std::vector{one->channelPort(), two->channelPort(), three->channelPort()}),
                ElementsAre("TelephonyServer.Channel.1", "TelephonyServer.Channel.2",
                            "TelephonyServer.Channel.3"));
    sources[0]->send(Bytes{1});
    sources[2]->send(Bytes{3});
    queue.runPending();
    EXPECT_THAT(one->messages, ElementsAre(Bytes{1}));
    EXPECT_THAT(two->messages, IsEmpty());
    EXPECT_THAT(three->messages, ElementsAre(Bytes{3}));
}

TEST_F(LogServerTest, TheClientIsToldOnceThatItsChannelStreams)
{
    const auto client = streamingClient("client");
    const auto other = streamingClient("other");
    queue.advance(10s);
    EXPECT_THAT(client->notifications(), IsEmpty());
    sources[0]->send(Bytes{1});
    queue.advance(99ms);
    EXPECT_THAT(client->notifications(), IsEmpty());
    queue.advance(1ms);
    EXPECT_THAT(client->notifications(), ElementsAre("ChannelStreaming"));
    sources[0]->send(Bytes{2});
    queue.advance(10s);
    EXPECT_THAT(client->notifications(), ElementsAre("ChannelStreaming"));
    EXPECT_THAT(other->notifications(), IsEmpty());
}

TEST_F(LogServerTest, AClientThatLeftTheServersPortKeepsItsChannel)
{
    const auto client = streamingClient("client");
    client->server.reset();
    queue.runPending();
    EXPECT_EQ(server.clientCount(), 0U);
    sources[0]->send(Bytes{1});
    queue.advance(1s);
    EXPECT_THAT(client->messages, ElementsAre(Bytes{1}));
}

TEST_F(LogServerTest, AChannelEndsWithEitherConnection)
{
    const auto leaves = std::vector<std::function<void(TelephonyClient&)>>{
        [](TelephonyClient& client) { client.closePort(); },
        [](TelephonyClient& client) { client.channel.reset(); },
    };
    for (const auto& leave : leaves) {
        const auto client = streamingClient("client");
        const std::string port = client->channelPort();
        leave(*client);
        queue.runPending();
        EXPECT_FALSE(transport.hasListener(port));
        EXPECT_FALSE(sources.back()->isAlive);
        EXPECT_EQ(server.channelCount(), 0U);
        EXPECT_EQ(transport.openConnections("client"), 0U);
        EXPECT_EQ(transport.openConnections(port), 0U);
        EXPECT_TRUE(client->server->isOpen());
    }
}

TEST_F(LogServerTest, AnotherConnectionToAChannelIsClosed)
{
    const auto client = connectedClient("client");
    std::vector<TelephonyClient::Frame> frames;
    const auto intruder = client->connect(client->channelPort(), frames);
    intruder->send(0, 1, false, false, xmlOf(startCommand({1})));
    queue.runPending();
    EXPECT_FALSE(intruder->isOpen());
    EXPECT_TRUE(client->channel->isOpen());
    EXPECT_FALSE(sources[0]->selection);
}

TEST_F(LogServerTest, ASourceLearnsThatItsClientIsBehindAndWhenItHasCaughtUp)
{
    const auto client = streamingClient("client");
    transport.stopReading("client");
    const Bytes message(LogChannel::kBehindBytes / 4);
    EXPECT_TRUE(sources[0]->send(message));
    EXPECT_TRUE(sources[0]->send(message));
    EXPECT_TRUE(sources[0]->send(message));
    EXPECT_FALSE(sources[0]->send(message)); // with its header it is too large
    queue.runPending();
    EXPECT_EQ(sources[0]->resumes, 0);
    transport.stopReading("client", LogChannel::kBehindBytes / 4); // a little is taken
    queue.runPending();
    EXPECT_EQ(sources[0]->resumes, 0);
    transport.resumeReading("client");
    queue.runPending();
    EXPECT_EQ(sources[0]->resumes, 1);
    EXPECT_EQ(client->messages.size(), 4U);
    EXPECT_TRUE(sources[0]->send(message));
}

TEST_F(LogServerTest, AClientThatDoesNotReadLosesItsChannelAt64MiBAndNobodyElse)
{
    const auto slow = streamingClient("slow");
    const auto other = streamingClient("other");
    transport.stopReading("slow");
    const std::size_t wholeMessages = 64;
    const Bytes message(1024 * 1024 - 16); // 1 MiB with its header
    for (std::size_t i = 0; i < wholeMessages; ++i)
        sources[0]->send(message);
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 2U);
    EXPECT_THAT(services.log.errors(), IsEmpty());

    EXPECT_FALSE(sources[0]->send(Bytes{1}));
    EXPECT_FALSE(sources[0]->send(Bytes{2})); // no second line
    queue.runPending();
    EXPECT_THAT(services.log.errors(),
                ElementsAre("TelephonyServer.Channel.1: its client leaves more than 67108864 bytes "
                            "of log messages unread; closing the channel"));
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_FALSE(sources[0]->isAlive);
    EXPECT_FALSE(slow->channel->isOpen());
    EXPECT_TRUE(sources[1]->send(Bytes{3}));
    queue.runPending();
    EXPECT_THAT(other->messages, ElementsAre(Bytes{3}));
}

TEST_F(LogServerTest, ALogMessageBeyondAFramesLimitIsLeftOut)
{
    const auto client = streamingClient("client");
    EXPECT_TRUE(sources[0]->send(Bytes(kFrameDataLimit + 1)));
    EXPECT_TRUE(sources[0]->send(Bytes{1}));
    queue.runPending();
    EXPECT_THAT(client->messages, ElementsAre(Bytes{1}));
    EXPECT_EQ(services.log.errors().size(), 1U);
}

TEST_F(LogServerTest, AnOversizedFrameEndsItsConnectionAlone)
{
    const auto client = streamingClient("client");
    const auto other = streamingClient("other");
    const Bytes header = {1, 0, 0, 1, 1, 0, 0, 0, 0, 0, 0, 0, 1, 0, 0, 0}; // 16 MiB and a byte
    transport.injectToPort(client->channelPort(), header);
    queue.runPending();
    EXPECT_FALSE(client->channel->isOpen());
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_TRUE(other->channel->isOpen());

    transport.injectToPort("TelephonyServer", header);
    queue.runPending();
    EXPECT_EQ(server.clientCount(), 0U);
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_EQ(services.log.errors().size(), 3U); // one a connection
}

TEST_F(LogServerTest, AServerThatStopsClosesEverything)
{
    const auto client = streamingClient("client");
    sources[0]->send(Bytes{1});
    server.stop();
    queue.advance(1s);
    EXPECT_FALSE(transport.hasListener("TelephonyServer"));
    EXPECT_FALSE(transport.hasListener("TelephonyServer.Channel.1"));
    EXPECT_FALSE(client->server->isOpen());
    EXPECT_FALSE(client->channel->isOpen());
    EXPECT_FALSE(client->fromServer.back()->isOpen());
    EXPECT_FALSE(sources[0]->isAlive);
    EXPECT_FALSE(server.start()); // and may start again
}

TEST_F(LogServerTest, WhatWasPutOffIsDroppedWithTheServer)
{
    auto second = std::make_unique<LogServer>(transport.peerSide(), transport.peerQueue(),
                                              [] { return nullptr; });
    EXPECT_THAT(second->start().value_or(""), HasSubstr("live port"));

    server.stop();
    auto third = std::make_unique<LogServer>(transport, queue, [this] { return makeSource(); });
    EXPECT_FALSE(third->start());
    const auto client = streamingClient("client");
    sources[0]->send(Bytes{1}); // queues the notification
    client->channel.reset();    // and soon the channel's end
    third.reset();
    queue.advance(1s);
    EXPECT_FALSE(client->server->isOpen());
    EXPECT_THAT(client->notifications(), IsEmpty());
}

TEST_F(LogServerTest, AChannelThatIsNotStartedIsClosedAfterThirtySeconds)
{
    const auto streaming = streamingClient("streaming");
    std::vector<std::unique_ptr<TelephonyClient>> idle;
    while (server.channelCount() < LogServer::kMostChannels)
        idle.push_back(connectedClient("idle" + std::to_string(idle.size())));
    queue.advance(29s);
    EXPECT_EQ(server.channelCount(), LogServer::kMostChannels);
    const auto refused = connectedClient("refused");
    EXPECT_EQ(refused->answer()["Error"].asInteger(), LogServer::kNoChannel);

    queue.advance(7s);
    EXPECT_EQ(server.channelCount(), 1U) << "the one that was started";
    EXPECT_FALSE(idle.front()->channel->isOpen());
    sources.front()->send(Bytes{1, 2});
    queue.runPending();
    EXPECT_EQ(streaming->messages.size(), 1U);
    const auto served = connectedClient("served");
    EXPECT_EQ(served->answer()["Error"].asInteger(), 0);
}

TEST_F(LogServerTest, AConnectionWithHalfAFrameIsClosedAfterThirtySeconds)
{
    Bytes half;
    appendFrame(half, 1, 1, true, false, Bytes(1000));
    half.resize(500);
    const auto idle = streamingClient("idle");
    std::string error;
    std::vector<TelephonyClient::Frame> frames;
    const auto unfinished = idle->connect(kTelephonyServerPort, frames);
    queue.runPending();
    transport.injectToPort(kTelephonyServerPort, half);
    transport.injectToPort("TelephonyServer.Channel.1", half);
    queue.advance(29s);
    EXPECT_EQ(server.clientCount(), 2U);
    EXPECT_EQ(server.channelCount(), 1U);
    queue.advance(7s);
    EXPECT_EQ(server.clientCount(), 0U);
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_FALSE(unfinished->isOpen());
    EXPECT_EQ(services.log.count("A client does not finish a frame; closing its connection"), 2U);
}

TEST_F(LogServerTest, APortThatAnswersWithHalfAFrameEndsItsChannel)
{
    const auto client = streamingClient("client");
    transport.injectFromPort("client", Bytes(15));
    queue.advance(36s);
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_EQ(server.clientCount(), 1U);
}

TEST_F(LogServerTest, FramesThatEachComeInPartsButInTimeAreServed)
{
    const auto client = streamingClient("client");
    Bytes frame;
    appendFrame(frame, 99, 1, true, false, Bytes(1000));
    const ByteView start = ByteView(frame).first(400);
    const ByteView rest = ByteView(frame).subspan(400);
    transport.injectToPort(kTelephonyServerPort, start);
    for (int i = 0; i < 10; ++i) {
        queue.advance(20s);
        transport.injectToPort(kTelephonyServerPort, rest);
        transport.injectToPort(kTelephonyServerPort, start);
    }
    queue.runPending();
    EXPECT_EQ(server.clientCount(), 1U);
    EXPECT_EQ(client->serverFrames.size(), 11U) << "with the answer to the request for the channel";
}

TEST_F(LogServerTest, WithoutClientsNothingWakesTheServer)
{
    {
        const auto client = streamingClient("client");
        EXPECT_NE(queue.waitingTasks(), 0U);
    }
    queue.advance(10s);
    EXPECT_EQ(queue.waitingTasks(), 0U);
}

} // namespace
} // namespace orvane
