#include "LogGenerator/support/PacketBuilder.h"
#include "app/OrvaneModel.h"
#include "doubles/LoopbackTransport.h"
#include "doubles/ScriptedTelephonyServer.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;

class Observer final : public LogChannelObserver
{
public:
    void channelOpened(const PropertyValue& technology) override
    {
        technologies.push_back(technology);
    }
    void messageReceived(ByteView message) override
    {
        messages.emplace_back(message.begin(), message.end());
    }

    std::vector<PropertyValue> technologies;
    std::vector<Bytes> messages;
};

class ChannelObserverTest : public ::testing::Test
{
protected:
    ChannelObserverTest() { services.useShippedResources(); }
    void start()
    {
        queue.async([this] { model->restartMonitor(); });
        queue.runPending();
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    Observer observer;
    std::shared_ptr<OrvaneModel> model = std::make_shared<OrvaneModel>(
        ModelEnvironment{queue, ports, client, 2s, [] { return std::optional<std::string>("1"); },
                         &observer},
        nullptr);
};

TEST_F(ChannelObserverTest, SeesEveryMessageAsItCameEvenWhereItsDecoderFails)
{
    services.memoryResources.put("LTE.plist",
                                 "<plist><dict><key>bad</key><integer>1</integer></dict></plist>");
    Services::current().setResources(&services.memoryResources);
    start();
    const Bytes wrapped = {0x81, 0, 1, 12, 0};
    const Bytes item = PacketBuilder(0xB0C2, 38);
    server.sendLogMessage(wrapped);
    server.sendLogMessage(item);
    queue.runPending();
    EXPECT_THAT(services.log.errors(), Contains(StartsWith("Dropping a message of 38 bytes: ")));
    EXPECT_THAT(observer.messages, ElementsAre(wrapped, item));
}

TEST_F(ChannelObserverTest, ReadingsCarryTheTimeAtWhichTheirMessageArrived)
{
    start();
    services.clock.now = 1795255200.25;
    const Bytes item = PacketBuilder(0xB0C2, 38);
    server.sendLogMessage(item);
    queue.runPending();
    services.clock.now += 1;
    ASSERT_TRUE(model->topLevelNodes());
    const NodePointer row = model->nodeAtPath("/Serving Cell Info/Physical Cell ID");
    ASSERT_TRUE(row);
    const PropertyValue reading = row->reading();
    ASSERT_TRUE(reading.asReading());
    EXPECT_EQ(reading.asReading()->time, 1795255200250);
}

TEST_F(ChannelObserverTest, IsToldTheTechnologyOfEachChannel)
{
    start();
    server.technology = kTSLogChannelTechnology_IFX;
    server.closeChannels();
    queue.advance(6s);
    EXPECT_THAT(observer.technologies,
                ElementsAre(PropertyValue(kTSLogChannelTechnology_Varnel_LTE),
                            PropertyValue(kTSLogChannelTechnology_IFX)));
}

TEST_F(ChannelObserverTest, IsNotToldOfAChannelThatNobodyDecodes)
{
    server.technology = "kTSSomethingElse";
    start();
    EXPECT_THAT(observer.technologies, IsEmpty());
}

} // namespace
} // namespace orvane
