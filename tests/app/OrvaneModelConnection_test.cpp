#include "app/OrvaneModel.h"

#include "LogGenerator/support/PacketBuilder.h"
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
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::SizeIs;
using ::testing::StartsWith;

using ChannelAnswer = ScriptedTelephonyServer::ChannelAnswer;
using TechnologyAnswer = ScriptedTelephonyServer::TechnologyAnswer;

class CountingObserver final : public ModelObserver
{
public:
    void updateViewControllerFromModel() override
    {
        ++updates;
        if (onUpdate)
            onUpdate();
    }
    void monitorStartEnded() override { ++startsEnded; }
    void modemPresenceChanged() override { ++presenceChanges; }

    int updates = 0;
    int startsEnded = 0;
    int presenceChanges = 0;
    std::function<void()> onUpdate;
};

// A template that gives a section a number where it needs a dictionary.
constexpr const char* kBadTemplate =
    "<plist><dict><key>bad</key><integer>1</integer></dict></plist>";

class UnreadableResources final : public Resources
{
public:
    [[nodiscard]] std::optional<Bytes> load(std::string_view, std::string_view) const override
    {
        throw std::runtime_error("the disk is gone");
    }
    [[nodiscard]] std::vector<std::string> pathsOfType(std::string_view) const override
    {
        throw std::runtime_error("the disk is gone");
    }
};

class ConnectionTest : public ::testing::Test
{
protected:
    ConnectionTest() { services.useShippedResources(); }

    std::shared_ptr<OrvaneModel> makeModel()
    {
        ModelEnvironment environment{
            queue, ports, client, 2s,
            [this]() -> std::optional<std::string> { return "UUID-" + std::to_string(++uuids); }};
        return std::make_shared<OrvaneModel>(environment, &observer);
    }
    // Starts the model as the shell does.
    void start(const std::shared_ptr<OrvaneModel>& started)
    {
        queue.async([started] { started->restartMonitor(); });
        queue.runPending();
    }
    void startConnected()
    {
        start(model);
        ASSERT_TRUE(model->isConnected());
    }
    static Bytes servingCellPacket(unsigned cellId)
    {
        return PacketBuilder(0xB0C2, 38).put16(14, cellId);
    }
    // Receives a message while there is no template; then provides a bad one for the refresh.
    void receiveBeforeABadTemplate()
    {
        Services::current().setResources(&services.memoryResources);
        startConnected();
        ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77)));
        queue.advance(1s);
        services.memoryResources.put("LTE.plist", kBadTemplate);
        observer.onUpdate = [this] { model->topLevelNodes(); };
        services.log.lines.clear();
    }
    // With a good template, the next session shows its messages.
    void expectRecovery()
    {
        services.useShippedResources();
        server.closeChannels();
        queue.advance(7s);
        ASSERT_TRUE(model->isConnected());
        ASSERT_TRUE(server.sendLogMessage(servingCellPacket(78)));
        queue.advance(2s);
        EXPECT_EQ(shownCellId(), "78");
    }
    [[nodiscard]] std::vector<std::string> errorsThatStart(const std::string& start) const
    {
        std::vector<std::string> found = services.log.errors();
        std::erase_if(found, [&](const std::string& line) { return !line.starts_with(start); });
        return found;
    }
    std::string shownCellId()
    {
        const NodePointer node = model->nodeAtPath("/Serving Cell Info/Physical Cell ID");
        return node ? *node->value() : "(no row)";
    }

    TestServices services;
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    CountingObserver observer;
    int uuids = 0;
    std::shared_ptr<OrvaneModel> model = makeModel();
};

// A fault of the server, and the log lines that it causes.
struct Failure {
    const char* name;
    void (*arrange)(ScriptedTelephonyServer& server, LoopbackTransport& transport);
    std::vector<std::string> lines;
};

void PrintTo(const Failure& failure, std::ostream* stream) { *stream << failure.name; }

class FailureTest : public ConnectionTest, public ::testing::WithParamInterface<Failure>
{
};

const Failure kFailures[] = {
    {"ServerAbsent",
     [](auto& server, auto&) { server.die(); },
     {"Could not create TSServerConnection", "Could not create the ports necessary"}                                                                    },
    {"ErrorCode",
     [](auto& server, auto&) { server.channelError = 7; },
     {"_TSServerConnectionNetworkMonitorCreateLogChannel returns error: 7!",
      "Could not create the ports necessary"}                                                                                                           },
    {"NegativeErrorCode",
     [](auto& server, auto&) { server.channelError = -17; },
     {"_TSServerConnectionNetworkMonitorCreateLogChannel returns error: -17!",
      "Could not create the ports necessary"}                                                                                                           },
    {"ChannelUnanswered",
     [](auto& server, auto&) { server.channelAnswer = ChannelAnswer::None; },
     {"_TSServerConnectionNetworkMonitorCreateLogChannel returns error: -2!",
      "Could not create the ports necessary"}                                                                                                           },
    {"ChannelGarbage",
     [](auto& server, auto&) { server.channelAnswer = ChannelAnswer::Garbage; },
     {"_TSServerConnectionNetworkMonitorCreateLogChannel returns error: -4!",
      "Could not create the ports necessary"}                                                                                                           },
    {"EmptyPortName",
     [](auto& server, auto&) { server.channelAnswer = ChannelAnswer::EmptyPort; },
     {"Could not create a log channel (TS returned null port)!",
      "Could not create the ports necessary"}                                                                                                           },
    {"NoPortName",
     [](auto& server, auto&) { server.channelAnswer = ChannelAnswer::NoPort; },
     {"Could not create a log channel (TS returned null port)!",
      "Could not create the ports necessary"}                                                                                                           },
    {"PortNotThere",
     [](auto& server, auto&) { server.channelPortExists = false; },
     {"Could not create the remote port!", "Could not create the ports necessary"}                                                                      },
    {"QueryUnanswered",
     [](auto& server, auto&) { server.technologyAnswer = TechnologyAnswer::None; },
     {" ***** Could not send the GetTechnology command (got error=-2)",
      "No log generator technology works"}                                                                                                              },
    {"QueryAnsweredEmpty",
     [](auto& server, auto&) { server.technologyAnswer = TechnologyAnswer::Empty; },
     {" ***** No response to GetTechnology; cannot configure",
      "No log generator technology works"}                                                                                                              },
    {"QueryAnsweredWithGarbage",
     [](auto& server, auto&) { server.technologyAnswer = TechnologyAnswer::Garbage; },
     {" ***** Could not parse reply to GetTechnology; cannot configure",
      "No log generator technology works"}                                                                                                              },
    {"ReplyWithoutTheKey",
     [](auto& server, auto&) { server.technologyAnswer = TechnologyAnswer::NoKey; },
     {" ***** Reply to GetTechnology had no answer; cannot configure",
      "No log generator technology works"}                                                                                                              },
    {"UnknownTechnology",
     [](auto& server, auto&) { server.technology = "kTSSomethingElse"; },
     {"No log generator technology works"}                                                                                                              },
    {"TechnologyOfNoText",
     [](auto& server, auto&) { server.technology = PropertyValue::integer(4); },
     {"No log generator technology works"}                                                                                                              },
    {"StartCommandNotTaken",
     [](auto& server, auto& transport) {
         server.afterTechnologyAnswer = [&server, &transport] {
             transport.stopReading(server.channelPort());
         };
     },                                                                  {" ***** Could not send the START command (got error=-1)"}},
    {"ServerGoneBeforeTheStartCommand",
     [](auto& server, auto&) { server.afterTechnologyAnswer = [&server] { server.die(); }; },
     {" ***** Could not send the START command (got error=-4)"}                                                                                         },
};

} // namespace

TEST_P(FailureTest, TearsThePortsDownAndTriesAgainFiveSecondsLater)
{
    GetParam().arrange(server, transport);
    start(model);

    for (const std::string& line : GetParam().lines)
        EXPECT_THAT(services.log.errors(), Contains(line));
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(observer.startsEnded, 1);
    EXPECT_EQ(services.log.count("Starting the display update timer"), 0U);
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);

    const int attempts = uuids;
    queue.advance(4999ms);
    EXPECT_EQ(uuids, attempts);
    queue.advance(1ms);
    EXPECT_EQ(uuids, attempts + 1);
    queue.advance(20s);
    EXPECT_GE(uuids, attempts + 3) << "without limit";
    EXPECT_THAT(services.log.errors(), ::testing::Not(Contains(HasSubstr("INVALIDATED"))));
}

INSTANTIATE_TEST_SUITE_P(Connection, FailureTest, ::testing::ValuesIn(kFailures),
                         [](const auto& test) { return std::string(test.param.name); });

TEST_F(ConnectionTest, ConnectsAsksForTheTechnologyAndSendsTheStartCommand)
{
    startConnected();
    queue.runPending();
    EXPECT_THAT(server.requestedPorts(), ElementsAre("OrvaneApp.UUID-1"));
    EXPECT_THAT(server.technologyQueries(), ElementsAre(PropertyValue::dictionaryOf({
                                                {"GetTechnology", "GetTechnology"}
    })));
    ASSERT_THAT(server.startCommands(), SizeIs(1));
    EXPECT_EQ(server.startCommands()[0]["SetState"], PropertyValue("Streaming"));
    EXPECT_THAT(server.startCommands()[0]["SetVarnelLogCodes"].asArray()->elements(),
                Contains(PropertyValue::integer(0xB0C2)));
    EXPECT_THAT(services.log.errors(), Contains(StartsWith(" ***** Created ports (send=0x")));
    EXPECT_THAT(services.log.errors(), Contains(StartsWith("Got log generated: 0x")));
    EXPECT_THAT(services.log.errors(), Contains("Starting the display update timer"));
    EXPECT_EQ(observer.startsEnded, 1);
}

TEST_F(ConnectionTest, TheLineOfCreatedPortsNamesTheSendingPortFirst)
{
    startConnected();
    server.closeChannels();
    queue.advance(2s);
    // The health check invalidates the local port.
    const auto invalidated = errorsThatStart(" ***** INVALIDATED ");
    ASSERT_THAT(invalidated, SizeIs(1));
    const std::string receiving = invalidated[0].substr(19, invalidated[0].rfind(" *****") - 19);
    const auto created = errorsThatStart(" ***** Created ports ");
    ASSERT_THAT(created, SizeIs(2));
    EXPECT_THAT(created[0], HasSubstr(", recv=" + receiving + ")"));
    EXPECT_THAT(created[0], ::testing::Not(HasSubstr("(send=" + receiving + ",")));
}

TEST_F(ConnectionTest, ALocalPortThatCannotBeMadeIsTriedAgain)
{
    transport.refuseListener("OrvaneApp.UUID-1");
    start(model);
    EXPECT_FALSE(model->isConnected());
    // The other steps still ran, and the line shows which port is missing.
    EXPECT_THAT(services.log.errors(), Contains(HasSubstr(", recv=(nil))")));
    EXPECT_THAT(services.log.errors(), Contains("Could not create the ports necessary"));
    EXPECT_EQ(services.log.count("Starting the display update timer"), 0U);
    EXPECT_EQ(transport.openConnections(kTelephonyServerPort), 0U);
    EXPECT_EQ(server.channelPort(), "") << "the sending port is closed as well";

    queue.advance(5s);
    EXPECT_TRUE(model->isConnected());
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "77");
}

TEST_F(ConnectionTest, TheTechnologyQueryWaitsOneSecondForItsAnswer)
{
    server.technologyAnswer = TechnologyAnswer::None;
    start(model);
    EXPECT_EQ(queue.now(), 1s);
    EXPECT_THAT(services.log.errors(),
                Contains(" ***** Could not send the GetTechnology command (got error=-2)"));
}

TEST_F(ConnectionTest, TheTechnologyQueryWaitsOneSecondToBeTaken)
{
    transport.stopReading("TelephonyServer.channel-1");
    start(model);
    EXPECT_EQ(queue.now(), 1s);
    EXPECT_THAT(services.log.errors(),
                Contains(" ***** Could not send the GetTechnology command (got error=-1)"));
}

TEST_F(ConnectionTest, TheStartCommandWaitsOneSecondToBeTaken)
{
    server.afterTechnologyAnswer = [this] { transport.stopReading(server.channelPort()); };
    start(model);
    EXPECT_EQ(queue.now(), 1s);
    EXPECT_THAT(services.log.errors(),
                Contains(" ***** Could not send the START command (got error=-1)"));
}

TEST_F(ConnectionTest, ALogMessageThatWantsAReplyGetsOneWithoutData)
{
    startConnected();
    std::string error;
    const auto sender = transport.peerSide().connect(server.clientPort(), error);
    ASSERT_NE(sender, nullptr) << error;
    std::vector<std::size_t> replySizes;
    sender->setFrameCallback([&](const FrameReader::View& frame) {
        EXPECT_TRUE(frame.isReply);
        replySizes.push_back(frame.data.size());
    });
    sender->send(0, 1, true, false, servingCellPacket(77));
    sender->send(5, 2, true, false, servingCellPacket(78));
    queue.runPending();
    EXPECT_THAT(replySizes, ElementsAre(0U, 0U));
}

TEST_F(ConnectionTest, AnUnknownTechnologyIsStoredAsNoGenerator)
{
    server.technology = "kTSSomethingElse";
    start(model);
    EXPECT_THAT(services.log.errors(), Contains("Got log generated: (nil)"));
}

TEST_F(ConnectionTest, AFreshPortNameIsUsedForEveryAttempt)
{
    server.channelError = 1;
    start(model);
    queue.advance(5s);
    EXPECT_THAT(server.requestedPorts(), ElementsAre("OrvaneApp.UUID-1", "OrvaneApp.UUID-2"));
}

TEST_F(ConnectionTest, WithoutAUuidTheAttemptFailsAndIsRepeated)
{
    int asked = 0;
    ModelEnvironment environment{queue, ports, client, 2s,
                                 [&asked]() -> std::optional<std::string> {
                                     ++asked;
                                     return std::nullopt;
                                 }};
    const auto other = std::make_shared<OrvaneModel>(environment, nullptr);
    start(other);
    queue.advance(5s);
    EXPECT_EQ(asked, 2);
    EXPECT_EQ(services.log.count("Could not create the ports necessary"), 2U);
    EXPECT_THAT(server.requestedPorts(), IsEmpty());
}

TEST_F(ConnectionTest, StartingWhileRunningDoesNothing)
{
    startConnected();
    model->startMonitor();
    EXPECT_EQ(uuids, 1);
    EXPECT_EQ(observer.startsEnded, 1);
    EXPECT_THAT(server.requestedPorts(), SizeIs(1));
}

TEST_F(ConnectionTest, DestroyingThePortsOfAModelWithoutAnyDoesNothing)
{
    model->destroyPorts();
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(ConnectionTest, DestroyingThePortsNeverRestarts)
{
    startConnected();
    services.log.lines.clear();
    model->destroyPorts();
    queue.advance(60s);
    EXPECT_EQ(uuids, 1);
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_FALSE(model->isConnected());
}

TEST_F(ConnectionTest, AMessageReachesTheDisplay)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77)));
    queue.advance(2s);
    EXPECT_EQ(observer.updates, 1);
    EXPECT_EQ(shownCellId(), "77");
}

TEST_F(ConnectionTest, AMessageWithAnotherIdIsDroppedWithoutALine)
{
    startConnected();
    services.log.lines.clear();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77), 1));
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77), -1));
    queue.advance(2s);
    EXPECT_THAT(services.log.lines, IsEmpty());
    EXPECT_EQ(observer.updates, 0);
}

TEST_F(ConnectionTest, AMessageThatIsThrownOutIsReportedOnceAndTheNextOneDecoded)
{
    services.memoryResources.put("LTE.plist", kBadTemplate);
    Services::current().setResources(&services.memoryResources);
    startConnected();
    services.log.lines.clear();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77)));
    queue.advance(2s);
    EXPECT_EQ(observer.updates, 0) << "nothing is marked as updated";
    EXPECT_THAT(services.log.errors(), Contains(StartsWith("Dropping a message of 38 bytes: ")));
    EXPECT_EQ(services.log.errors().size(), 2U);

    services.useShippedResources();
    // The template that was loaded stays cached until the next generator.
    server.closeChannels();
    queue.advance(4s);
    ASSERT_TRUE(model->isConnected());
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(78)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "78");
}

TEST_F(ConnectionTest, ABadTemplateInARefreshGivesOneErrorLineAndTheProgramGoesOn)
{
    receiveBeforeABadTemplate();
    queue.advance(1s);
    EXPECT_EQ(observer.updates, 1);
    EXPECT_THAT(errorsThatStart("The "), ElementsAre(StartsWith("The display cannot be shown: ")));
    expectRecovery();
}

TEST_F(ConnectionTest, ABadTemplateInAStartGivesOneErrorLineAndTheProgramGoesOn)
{
    receiveBeforeABadTemplate();
    observer.onUpdate = {};
    // The restart comes before the view update and makes the old generator's tree once more.
    server.closeChannels();
    queue.advance(1s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_THAT(errorsThatStart("The "), ElementsAre(StartsWith("The display cannot be shown: ")));
    expectRecovery();
}

TEST_F(ConnectionTest, AStartWhoseTemplatesCannotBeReadGivesOneErrorLineAndIsTriedAgain)
{
    UnreadableResources unreadable;
    Services::current().setResources(&unreadable);
    server.technology = kTSLogChannelTechnology_Varnel_UTRAN2;
    start(model);
    EXPECT_FALSE(model->isConnected());
    EXPECT_THAT(errorsThatStart("The "),
                ElementsAre("The monitor could not be started: the disk is gone"));
    services.useShippedResources();
    queue.advance(5s);
    EXPECT_TRUE(model->isConnected());
}

TEST_F(ConnectionTest, AnyNotificationRefreshesAtOnce)
{
    startConnected();
    unsigned cellId = 0;
    for (const char* name : {"ChannelStreaming", "TechnologyChanged", "Unheard of", ""}) {
        ASSERT_TRUE(server.sendLogMessage(servingCellPacket(++cellId)));
        server.notify(name);
        queue.advance(10ms);
        EXPECT_EQ(shownCellId(), std::to_string(cellId)) << name;
    }
    EXPECT_EQ(observer.updates, 4);
}

TEST_F(ConnectionTest, AModemThatIsMissingIsKnownUntilItIsBackOrTheChannelEnds)
{
    startConnected();
    EXPECT_FALSE(model->isModemMissing());
    server.notify("ModemMissing");
    server.notify("ModemMissing");
    queue.advance(10ms);
    EXPECT_TRUE(model->isModemMissing());
    EXPECT_EQ(observer.presenceChanges, 1);
    server.notify("ModemPresent");
    queue.advance(10ms);
    EXPECT_FALSE(model->isModemMissing());
    EXPECT_EQ(observer.presenceChanges, 2);
    server.notify("ModemMissing");
    queue.advance(10ms);
    server.closeChannels();
    queue.advance(10s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_FALSE(model->isModemMissing());
}

TEST_F(ConnectionTest, ANotificationFindsADeadChannelAtOnce)
{
    startConnected();
    server.closeChannels();
    server.notify("TechnologyChanged");
    queue.advance(10ms);
    EXPECT_THAT(services.log.errors(), Contains(StartsWith(" ***** INVALIDATED 0x")));
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(uuids, 2);
}

TEST_F(ConnectionTest, WithoutDataARefreshLeavesTheTreeAndTheViewAlone)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(77)));
    queue.advance(2s);
    const NodePointer tree = model->topLevelNodes();
    queue.advance(20s);
    EXPECT_EQ(observer.updates, 1);
    EXPECT_EQ(model->topLevelNodes(), tree);
}

TEST_F(ConnectionTest, ADeadChannelIsFoundWithinAPeriodAndBuiltAnew)
{
    startConnected();
    services.log.lines.clear();
    server.closeChannels();
    queue.advance(2s);
    EXPECT_THAT(services.log.errors(), Contains(StartsWith(" ***** INVALIDATED 0x")));
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(uuids, 2);
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(5)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "5");
}

TEST_F(ConnectionTest, AServerKilledAndStartedAgainWhileStreamingComesBack)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "1");

    server.die();
    queue.advance(2s);
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(shownCellId(), "1") << "rows stay";
    queue.advance(11s);
    ASSERT_TRUE(server.restart());
    queue.advance(5s);
    ASSERT_TRUE(model->isConnected());
    EXPECT_EQ(shownCellId(), "1") << "the tree stays until the new generator has taken a message";

    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(2)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "2");
}

TEST_F(ConnectionTest, AServerThatDiesWithNewsUnshownStillShowsThem)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.advance(1s);
    server.closeChannels();
    observer.onUpdate = [this] { model->topLevelNodes(); };
    // The refresh drops the tree, finds the channel dead and queues the restart before the update.
    queue.advance(1s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(uuids, 2);
    EXPECT_EQ(shownCellId(), "1");
}

TEST_F(ConnectionTest, AnUnknownTechnologyOnReconnectionKeepsTheTreeAndTheHistory)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.advance(1s);
    server.technology = "kTSSomethingElse";
    server.closeChannels();
    observer.onUpdate = [this] { model->topLevelNodes(); };
    queue.advance(1s);
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(shownCellId(), "1");
    EXPECT_EQ(model->getSaveContents().asArray()->size(), 1U);
}

TEST_F(ConnectionTest, ARefreshWithAnArgumentIgnoresIt)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.runPending();
    model->refresh(this);
    queue.runPending();
    EXPECT_EQ(observer.updates, 1);
}

TEST_F(ConnectionTest, TheHistoryGoesOverToAGeneratorOfTheSameClassOnly)
{
    const auto snapshots = [this] { return model->getSaveContents().asArray()->size() - 1; };
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.advance(2s);
    model->topLevelNodes();
    EXPECT_EQ(snapshots(), 1U);

    server.closeChannels();
    queue.advance(2s);
    EXPECT_EQ(snapshots(), 1U) << "the same class";

    server.technology = kTSLogChannelTechnology_Varnel_UTRAN2;
    server.closeChannels();
    queue.advance(2s);
    ASSERT_TRUE(model->isConnected());
    EXPECT_EQ(snapshots(), 0U) << "another technology";
}

TEST_F(ConnectionTest, AFailedQueryKeepsTheOldGeneratorItsStateAndItsStartCommand)
{
    startConnected();
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(1)));
    queue.advance(2s);
    model->topLevelNodes();

    server.technologyAnswer = TechnologyAnswer::NoKey;
    server.closeChannels();
    queue.advance(2s);
    queue.runPending();
    EXPECT_TRUE(model->isConnected());
    ASSERT_THAT(server.startCommands(), SizeIs(2));
    EXPECT_EQ(server.startCommands()[0], server.startCommands()[1]);
    EXPECT_EQ(model->getSaveContents().asArray()->size(), 2U);
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(2)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "2");
}

TEST_F(ConnectionTest, RetriesEndWithTheModel)
{
    server.die();
    start(model);
    EXPECT_EQ(uuids, 1);
    model.reset();
    queue.advance(60s);
    EXPECT_EQ(uuids, 1);
}

TEST_F(ConnectionTest, WithoutAGeneratorThereIsNoTreeAndSavingHasNothing)
{
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    EXPECT_EQ(model->nodeAtPath("/"), nullptr);
    EXPECT_EQ(model->getSaveContents(), PropertyValue::newArray());
}

TEST_F(ConnectionTest, ANodeAskedForBeforeAnyTreeBuildsItFirst)
{
    startConnected();
    const NodePointer root = model->nodeAtPath("/");
    ASSERT_NE(root, nullptr);
    EXPECT_EQ(*root->value(), "(unknown)") << "the first generation gives no display yet";
    EXPECT_EQ(model->topLevelNodes(), root);
    ASSERT_TRUE(server.sendLogMessage(servingCellPacket(4)));
    queue.advance(2s);
    EXPECT_EQ(shownCellId(), "4");
}

} // namespace orvane
