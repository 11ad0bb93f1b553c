#include "platform/ports/TelephonyServer.h"

#include "doubles/LoopbackTransport.h"
#include "doubles/ScriptedTelephonyServer.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

struct Notification {
    std::string name;
    PropertyValue info;
    friend bool operator==(const Notification&, const Notification&) = default;
};

class TelephonyServerTest : public testing::Test
{
protected:
    std::unique_ptr<TelephonyServerConnection> connect()
    {
        return client.createConnection([this](const std::string& name, const PropertyValue& info) {
            notifications.push_back({name, info});
        });
    }

    std::unique_ptr<LocalMessagePort> localPort(const std::string& name)
    {
        auto port = ports.createLocal(name, [this](LocalMessagePort&, std::int32_t id, ByteView) {
            messageIds.push_back(id);
            return std::optional<Bytes>();
        });
        port->setDispatchQueue(queue);
        return port;
    }

    // An answer to a request for a channel; absent parts are left out.
    static PropertyValue answerOf(const PropertyValue& error, const PropertyValue& port)
    {
        PropertyValue answer = PropertyValue::newDictionary();
        if (error)
            answer.asDictionary()->set("Error", error);
        if (port)
            answer.asDictionary()->set("Port", port);
        return answer;
    }

    // The result of a request for a channel that the server answers like this.
    LogChannelResult resultOf(const PropertyValue& answer)
    {
        const auto text = writeXmlPropertyList(answer);
        return text ? resultOf(Bytes(text->begin(), text->end())) : LogChannelResult{99, {}};
    }
    LogChannelResult resultOf(const Bytes& answer)
    {
        server.die();
        queue.runPending();
        std::string error;
        std::unique_ptr<FrameConnection> byHand;
        const auto listener = transport.peerSide().listen(kTelephonyServerPort, error);
        listener->setConnectionCallback([&](auto connection) {
            byHand = std::move(connection);
            byHand->setFrameCallback([&](const FrameReader::View& frame) {
                byHand->send(frame.messageId, frame.serial, false, true, answer);
            });
        });
        return connect()->createNetworkMonitorLogChannel("client");
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    std::vector<Notification> notifications;
    std::vector<std::int32_t> messageIds;
};

// Asking for a channel.

TEST_F(TelephonyServerTest, ThereIsNoConnectionWithoutAServer)
{
    server.die();
    EXPECT_EQ(connect(), nullptr);
    EXPECT_TRUE(server.restart());
    EXPECT_NE(connect(), nullptr);
}

TEST_F(TelephonyServerTest, AChannelIsAskedForByTheLocalPortsName)
{
    const LogChannelResult result = connect()->createNetworkMonitorLogChannel("client");
    EXPECT_EQ(result.error, 0);
    EXPECT_EQ(result.port, server.channelPort());
    EXPECT_THAT(server.requestedPorts(), ElementsAre("client"));
    EXPECT_NE(ports.createRemote(*result.port), nullptr);
    EXPECT_EQ(queue.now(), 0s);
}

TEST_F(TelephonyServerTest, TheRequestIsMessage1WithAnXmlPropertyListThatWantsAReply)
{
    server.die();
    std::string error;
    std::unique_ptr<FrameConnection> byHand;
    std::int32_t messageId = 0;
    bool wantsReply = false;
    std::string text;
    const auto listener = transport.peerSide().listen(kTelephonyServerPort, error);
    listener->setConnectionCallback([&](auto connection) {
        byHand = std::move(connection);
        byHand->setFrameCallback([&](const FrameReader::View& frame) {
            messageId = frame.messageId;
            wantsReply = frame.wantsReply;
            text.assign(frame.data.begin(), frame.data.end());
        });
    });
    (void)connect()->createNetworkMonitorLogChannel("client & co");
    EXPECT_EQ(messageId, 1);
    EXPECT_TRUE(wantsReply);
    EXPECT_THAT(text, testing::StartsWith("<?xml"));
    EXPECT_EQ(readPropertyList(Bytes(text.begin(), text.end())).value,
              PropertyValue::dictionaryOf({
                  {"CreateLogChannel", "client & co"}
    }));
}

TEST_F(TelephonyServerTest, TheServersErrorIsPassedOn)
{
    for (const std::int32_t error : {1, -7, INT32_MAX, INT32_MIN}) {
        server.channelError = error;
        const LogChannelResult result = connect()->createNetworkMonitorLogChannel("client");
        EXPECT_EQ(result.error, error);
        EXPECT_FALSE(result.port);
    }
}

TEST_F(TelephonyServerTest, AnEmptyPortAndNoneAreToldApart)
{
    server.channelAnswer = ScriptedTelephonyServer::ChannelAnswer::EmptyPort;
    LogChannelResult result = connect()->createNetworkMonitorLogChannel("client");
    EXPECT_EQ(result.error, 0);
    EXPECT_EQ(result.port, "");
    server.channelAnswer = ScriptedTelephonyServer::ChannelAnswer::NoPort;
    result = connect()->createNetworkMonitorLogChannel("client");
    EXPECT_EQ(result.error, 0);
    EXPECT_FALSE(result.port);
}

TEST_F(TelephonyServerTest, NoAnswerWithinASecondIsMinus2)
{
    server.channelAnswer = ScriptedTelephonyServer::ChannelAnswer::None;
    const LogChannelResult result = connect()->createNetworkMonitorLogChannel("client");
    EXPECT_EQ(result.error, -2);
    EXPECT_FALSE(result.port);
    EXPECT_EQ(queue.now(), 1s);
}

TEST_F(TelephonyServerTest, AnAnswerJustInTimeCountsAndALaterOneDoesNot)
{
    server.answerDelay = 1000ms;
    EXPECT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    server.answerDelay = 1001ms;
    EXPECT_EQ(connect()->createNetworkMonitorLogChannel("client").error, -2);
}

TEST_F(TelephonyServerTest, ALateAnswerIsNotTakenForTheNextRequests)
{
    server.answerDelay = 1500ms;
    server.channelError = 3;
    const auto connection = connect();
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("client").error, -2);
    server.answerDelay = 600ms; // 100 ms after the late one
    server.channelError = 4;
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("client").error, 4);
}

TEST_F(TelephonyServerTest, ARequestThatIsNotTakenWithinASecondIsMinus1)
{
    transport.stopReading(kTelephonyServerPort);
    EXPECT_EQ(connect()->createNetworkMonitorLogChannel("client").error, -1);
    EXPECT_EQ(queue.now(), 1s);
}

TEST_F(TelephonyServerTest, AServerThatDiesDuringTheRequestIsMinus5)
{
    server.channelAnswer = ScriptedTelephonyServer::ChannelAnswer::None;
    transport.peerQueue().after(500ms, [this] { server.die(); });
    const auto connection = connect();
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("client").error, -5);
    EXPECT_EQ(queue.now(), 500ms);
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("client").error, -3);
}

TEST_F(TelephonyServerTest, AnAnswerThatCannotBeUsedIsMinus4)
{
    std::vector<PropertyValue> unusable;
    unusable.push_back("text");
    unusable.push_back(PropertyValue::newArray());
    unusable.push_back(answerOf({}, {}));
    unusable.push_back(answerOf({}, "port"));
    unusable.push_back(answerOf("0", "port"));
    unusable.push_back(answerOf(PropertyValue::real(0), "port"));
    unusable.push_back(answerOf(PropertyValue::boolean(false), "port"));
    unusable.push_back(answerOf(PropertyValue::integer(1LL << 32), {}));
    unusable.push_back(answerOf(PropertyValue::integer(0), PropertyValue::integer(1)));
    for (const PropertyValue& answer : unusable) {
        const LogChannelResult result = resultOf(answer);
        EXPECT_EQ(result.error, -4) << answer.description();
        EXPECT_FALSE(result.port);
    }
    EXPECT_EQ(resultOf(Bytes()).error, -4);
    EXPECT_EQ(resultOf(Bytes{'x'}).error, -4);
    EXPECT_EQ(resultOf(answerOf(PropertyValue::integer(0), "port")).error, 0);
}

TEST_F(TelephonyServerTest, ANameThatIsNoTextIsMinus4WithoutARequest)
{
    EXPECT_EQ(connect()->createNetworkMonitorLogChannel("\xFF").error, -4);
    queue.runPending();
    EXPECT_THAT(server.requestedPorts(), IsEmpty());
}

// Notifications.

TEST_F(TelephonyServerTest, NotificationsComeAfterTheConnectionObjectIsReleased)
{
    const auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    queue.advance(60s);
    EXPECT_EQ(server.clientCount(), 1U);
    server.notify("ChannelStreaming");
    server.notify("Other", PropertyValue::arrayOf({"info"}));
    EXPECT_THAT(notifications, IsEmpty());
    queue.runPending();
    EXPECT_THAT(notifications,
                ElementsAre(Notification{"ChannelStreaming", {}},
                            Notification{"Other", PropertyValue::arrayOf({"info"})}));
}

TEST_F(TelephonyServerTest, ANotificationDuringTheRequestWaitsForTheMainQueue)
{
    const auto port = localPort("client");
    server.answerDelay = 200ms;
    transport.peerQueue().after(100ms, [this] { server.notify("Early"); });
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    EXPECT_THAT(notifications, IsEmpty());
    queue.runPending();
    EXPECT_THAT(notifications, ElementsAre(Notification{"Early", {}}));
}

TEST_F(TelephonyServerTest, NoNotificationComesOnceThePortIsDestroyed)
{
    auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    server.notify("Under way");
    port.reset();
    queue.runPending();
    EXPECT_THAT(notifications, IsEmpty());
    EXPECT_EQ(server.clientCount(), 0U);
}

TEST_F(TelephonyServerTest, NoNotificationComesOnceThePortIsInvalidated)
{
    const auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    server.notify("Under way");
    port->invalidate();
    queue.runPending();
    EXPECT_THAT(notifications, IsEmpty());
    EXPECT_EQ(server.clientCount(), 0U);
}

TEST_F(TelephonyServerTest, ANotificationThatIsQueuedAlreadyDoesNotOutliveThePort)
{
    auto port = localPort("client");
    server.answerDelay = 200ms;
    transport.peerQueue().after(100ms, [this] { server.notify("Queued"); });
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    port.reset(); // the notification was read during the request
    queue.runPending();
    EXPECT_THAT(notifications, IsEmpty());
}

TEST_F(TelephonyServerTest, ANotificationMayTearThePortDown)
{
    auto port = localPort("client");
    int calls = 0;
    ASSERT_EQ(client
                  .createConnection([&](const std::string&, const PropertyValue&) {
                      port.reset();
                      ++calls; // what it captured still exists
                  })
                  ->createNetworkMonitorLogChannel("client")
                  .error,
              0);
    server.notify("First");
    server.notify("Second");
    queue.runPending();
    EXPECT_EQ(calls, 1);
}

TEST_F(TelephonyServerTest, WithoutAChannelReleasingTheConnectionClosesIt)
{
    const auto port = localPort("client");
    server.channelError = 1;
    auto connection = connect();
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("client").error, 1);
    EXPECT_EQ(server.clientCount(), 1U);
    connection.reset();
    queue.runPending();
    EXPECT_EQ(server.clientCount(), 0U);
}

TEST_F(TelephonyServerTest, WithoutALocalPortReleasingTheConnectionClosesIt)
{
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    queue.runPending();
    EXPECT_EQ(server.clientCount(), 0U);
}

TEST_F(TelephonyServerTest, IllFormedNotificationsAreIgnoredWithOneLineEach)
{
    const auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    PropertyValue nameIsNoText = PropertyValue::newDictionary();
    nameIsNoText.asDictionary()->set("Name", PropertyValue::integer(1));
    const std::vector<PropertyValue> illFormed = {PropertyValue::newDictionary(), nameIsNoText,
                                                  PropertyValue::newArray()};
    server.sendToClients(kNotificationMessage, Bytes());
    server.sendToClients(kNotificationMessage, Bytes{'x'});
    for (const PropertyValue& each : illFormed) {
        const auto text = writeXmlPropertyList(each);
        server.sendToClients(kNotificationMessage, Bytes(text->begin(), text->end()));
    }
    server.notify("Well formed");
    queue.runPending();
    EXPECT_THAT(services.log.errors(), testing::SizeIs(5));
    EXPECT_THAT(services.log.errors(),
                testing::Each("Ignoring an ill-formed notification of the telephony server"));
    EXPECT_THAT(notifications, ElementsAre(Notification{"Well formed", {}}));
}

TEST_F(TelephonyServerTest, MessagesThatAreNoNotificationsAreIgnoredInSilence)
{
    const auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    for (const std::int32_t id : {0, 1, 3, -2})
        server.sendToClients(id, Bytes{'x'});
    queue.runPending();
    EXPECT_THAT(notifications, IsEmpty());
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(TelephonyServerTest, AFloodOfNotificationsDuringTheRequestIsCut)
{
    const auto port = localPort("client");
    server.answerDelay = 200ms;
    transport.peerQueue().after(100ms, [this] {
        for (int i = 0; i < 1001; ++i)
            server.notify("Many");
    });
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    queue.runPending();
    EXPECT_EQ(notifications.size(), 1000U);
    EXPECT_EQ(services.log.errors().size(), 1U);
    server.notify("Later");
    queue.runPending();
    EXPECT_EQ(notifications.back().name, "Later");
}

// The scripted server itself, as app tests rely on it.

TEST_F(TelephonyServerTest, TheScriptedServersChannelPortAnswersTheTechnologyQuery)
{
    using Answer = ScriptedTelephonyServer::TechnologyAnswer;
    const auto port = localPort("client");
    const auto channel = connect()->createNetworkMonitorLogChannel("client");
    const auto remote = ports.createRemote(*channel.port);
    const PropertyValue query = PropertyValue::dictionaryOf({
        {"GetTechnology", "GetTechnology"}
    });
    const auto text = writeXmlPropertyList(query);
    const Bytes bytes(text->begin(), text->end());
    Bytes reply;
    const auto ask = [&] { return remote->send(0, bytes, 1s, 1s, &reply); };

    ASSERT_EQ(ask(), SendStatus::Success);
    EXPECT_EQ(readPropertyList(reply).value,
              PropertyValue::dictionaryOf({
                  {"GetTechnology", kTSLogChannelTechnology_Varnel_LTE}
    }));
    server.technology = PropertyValue::integer(3);
    ASSERT_EQ(ask(), SendStatus::Success);
    EXPECT_EQ(readPropertyList(reply).value["GetTechnology"], PropertyValue::integer(3));
    server.technologyAnswer = Answer::NoKey;
    ASSERT_EQ(ask(), SendStatus::Success);
    EXPECT_EQ(readPropertyList(reply).value, PropertyValue::newDictionary());
    server.technologyAnswer = Answer::Garbage;
    ASSERT_EQ(ask(), SendStatus::Success);
    EXPECT_TRUE(readPropertyList(reply).value.isAbsent());
    EXPECT_FALSE(reply.empty());
    server.technologyAnswer = Answer::Empty;
    ASSERT_EQ(ask(), SendStatus::Success);
    EXPECT_THAT(reply, IsEmpty());
    server.technologyAnswer = Answer::None;
    EXPECT_EQ(ask(), SendStatus::ReceiveTimeout);
    EXPECT_THAT(server.technologyQueries(), ElementsAre(query, query, query, query, query, query));
    EXPECT_THAT(server.startCommands(), IsEmpty());

    EXPECT_EQ(remote->send(0, bytes, 1s, 0s, nullptr), SendStatus::Success);
    queue.runPending();
    EXPECT_THAT(server.startCommands(), ElementsAre(query));
}

TEST_F(TelephonyServerTest, TheScriptedServerCanFailTheCommandAfterTheQuery)
{
    const auto channel = connect()->createNetworkMonitorLogChannel("client");
    const auto remote = ports.createRemote(*channel.port);
    Bytes reply;
    server.afterTechnologyAnswer = [this] { transport.stopReading(server.channelPort()); };
    ASSERT_EQ(remote->send(0, {}, 1s, 1s, &reply), SendStatus::Success);
    EXPECT_EQ(remote->send(0, {}, 1s, 0s, nullptr), SendStatus::SendTimeout);
    transport.resumeReading(server.channelPort());
    server.afterTechnologyAnswer = [this] { server.die(); };
    EXPECT_EQ(remote->send(0, {}, 1s, 1s, &reply), SendStatus::Success);
    queue.runPending();
    EXPECT_EQ(remote->send(0, {}, 1s, 0s, nullptr), SendStatus::NotValid);
}

TEST_F(TelephonyServerTest, TheScriptedServerSendsMessagesOfAnyIdToTheClientsPort)
{
    EXPECT_FALSE(server.sendLogMessage(Bytes{1})) << "no channel";
    auto port = localPort("client");
    ASSERT_EQ(connect()->createNetworkMonitorLogChannel("client").error, 0);
    EXPECT_TRUE(server.sendLogMessage(Bytes{1}));
    EXPECT_TRUE(server.sendLogMessage(Bytes{1}, 5));
    queue.runPending();
    EXPECT_THAT(messageIds, ElementsAre(0, 5));
    port.reset();
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 0U) << "a channel ends with the connection to the client";
}

TEST_F(TelephonyServerTest, TheScriptedServersDeathInvalidatesWhatLeadsToIt)
{
    const auto port = localPort("client");
    const auto channel = connect()->createNetworkMonitorLogChannel("client");
    const auto remote = ports.createRemote(*channel.port);
    queue.runPending();
    ASSERT_TRUE(remote->isValid());
    server.die();
    queue.runPending();
    EXPECT_FALSE(remote->isValid());
    EXPECT_TRUE(port->isValid());
    EXPECT_EQ(ports.createRemote(*channel.port), nullptr);
}

TEST_F(TelephonyServerTest, TheScriptedServerCanNameAPortThatIsNotThere)
{
    server.channelPortExists = false;
    const auto channel = connect()->createNetworkMonitorLogChannel("client");
    ASSERT_TRUE(channel.port);
    EXPECT_FALSE(channel.port->empty());
    EXPECT_EQ(ports.createRemote(*channel.port), nullptr);
}

} // namespace
} // namespace orvane
