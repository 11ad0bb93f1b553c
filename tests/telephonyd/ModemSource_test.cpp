#include "telephonyd/ModemSource.h"

#include "platform/base/TelephonyConstants.h"
#include "support/Recording.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/support/MemoryModem.h"
#include "telephonyd/support/TelephonyClient.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;
using testing::SizeIs;

// A server that serves a modem, and clients of it over the real frame format.
class ModemSourceTest : public testing::Test
{
protected:
    ModemSourceTest()
    {
        modem.setEvents({[this] { server.technologyChanged(); },
                         [this] {
                             server.setModemMissing(modem.presence() ==
                                                    DiagnosticModem::Presence::Missing);
                         }});
        EXPECT_FALSE(server.start());
        EXPECT_FALSE(modem.start());
        queue.runPending();
    }
    std::unique_ptr<TelephonyClient> clientWithChannel(const std::string& name)
    {
        auto client = std::make_unique<TelephonyClient>(transport, name);
        client->requestChannel();
        queue.runPending();
        client->connectToChannel();
        queue.runPending();
        return client;
    }
    std::unique_ptr<TelephonyClient> streamingClient(const std::string& name,
                                                     const std::set<std::uint32_t>& codes)
    {
        auto client = clientWithChannel(name);
        client->command(startCommand(codes, {0, 1, 2}));
        queue.runPending();
        return client;
    }
    // The reply's technology; empty for an empty reply.
    std::string ask(TelephonyClient& client)
    {
        client.command(PropertyValue::dictionaryOf({
                           {kGetTechnologyKey, kGetTechnologyKey}
        }),
                       true);
        queue.runPending();
        if (client.channelFrames.empty() || client.channelFrames.back().data.empty())
            return "";
        const PropertyValue answer = readPropertyList(client.channelFrames.back().data).value;
        return answer[kGetTechnologyKey].description();
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MemoryModem phone{queue};
    DiagnosticModem modem{
        queue, phone.opener(), {"/dev/modem", std::nullopt}
    };
    LogServer server{transport, queue, [this] { return std::make_unique<ModemSource>(modem); }};
};

TEST_F(ModemSourceTest, ItemsGoToTheChannelsThatAskedForThem)
{
    const auto first = streamingClient("first", {0xB0C2, 0x4005});
    const auto second = streamingClient("second", {0xB0C2});
    EXPECT_THAT(phone.codes, ElementsAre(0x4005, 0xB0C2));
    phone.logItem(0xB0C2);
    phone.logItem(0x4005);
    queue.runPending();
    EXPECT_THAT(first->messages, SizeIs(2));
    ASSERT_THAT(second->messages, SizeIs(1));
    const Bytes item = MemoryModem::item(0xB0C2);
    EXPECT_EQ(second->messages[0][0], 1);
    EXPECT_EQ(Bytes(second->messages[0].begin() + 1, second->messages[0].end()), item);
}

TEST_F(ModemSourceTest, TheLastChannelThatEndsSwitchesAllOff)
{
    auto first = streamingClient("first", {0xB0C2});
    auto second = streamingClient("second", {0x4005});
    first->closePort();
    queue.runPending();
    EXPECT_THAT(phone.codes, ElementsAre(0x4005));
    second->channel.reset();
    queue.runPending();
    EXPECT_THAT(phone.codes, IsEmpty());
}

TEST_F(ModemSourceTest, TheTechnologyQueryIsAnsweredEmptyUntilItIsKnown)
{
    const auto client = clientWithChannel("client");
    EXPECT_EQ(ask(*client), "");
    EXPECT_THAT(client->channelFrames, SizeIs(1));
    EXPECT_TRUE(client->channelFrames[0].isReply);
    phone.logItem(0xB17F);
    EXPECT_EQ(ask(*client), kTSLogChannelTechnology_Varnel_LTE);
}

TEST_F(ModemSourceTest, AnotherTechnologyClosesTheChannelsAndNotifiesOverTheConnectionsThatStay)
{
    const auto client = clientWithChannel("client");
    ask(*client);
    phone.logItem(0xB17F);
    client->command(startCommand({0xB0C2}));
    queue.runPending();
    phone.unplug();
    phone.plugIn();
    queue.advance(62s); // a minute of silence once it is back
    ASSERT_TRUE(phone.codes.contains(0xB17F));
    queue.advance(1s);
    ASSERT_TRUE(phone.logItem(0x4005));
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_FALSE(client->channel->isOpen());
    EXPECT_TRUE(client->server->isOpen());
    EXPECT_THAT(client->notifications(), Not(Contains("TechnologyChanged")));
    queue.advance(100ms);
    EXPECT_THAT(client->notifications(), Contains("TechnologyChanged"));
    EXPECT_THAT(phone.codes, IsEmpty());

    client->requestChannel();
    queue.runPending();
    client->connectToChannel();
    queue.runPending();
    EXPECT_EQ(ask(*client), kTSLogChannelTechnology_Varnel_GSM);
}

TEST_F(ModemSourceTest, ClientsAreToldOfAModemThatIsMissingAndThatIsBack)
{
    const auto early = clientWithChannel("early");
    EXPECT_THAT(early->notifications(), IsEmpty());
    phone.unplug();
    queue.runPending();
    EXPECT_THAT(early->notifications(), ElementsAre("ModemMissing"));
    const auto late = clientWithChannel("late");
    EXPECT_THAT(late->notifications(), ElementsAre("ModemMissing"));
    EXPECT_THAT(early->notifications(), SizeIs(1));
    phone.plugIn();
    queue.advance(2s);
    for (const auto* client : {early.get(), late.get()})
        EXPECT_THAT(client->notifications(), ElementsAre("ModemMissing", "ModemPresent"));
}

TEST_F(ModemSourceTest, ChannelsLiveOnWhileTheModemIsAway)
{
    const auto client = streamingClient("client", {0xB0C2});
    phone.unplug();
    queue.advance(1min);
    phone.plugIn();
    queue.advance(2s);
    ASSERT_TRUE(phone.logItem(0xB0C2));
    queue.runPending();
    EXPECT_THAT(client->messages, SizeIs(1));
    EXPECT_EQ(server.channelCount(), 1U);
}

} // namespace
} // namespace orvane
