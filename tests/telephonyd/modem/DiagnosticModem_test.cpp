#include "telephonyd/modem/DiagnosticModem.h"

#include "doubles/ManualMainQueue.h"
#include "platform/base/TelephonyConstants.h"
#include "support/Recording.h"
#include "telephonyd/support/MemoryModem.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using Manner = MemoryModem::Manner;
using Presence = DiagnosticModem::Presence;

constexpr std::uint32_t kSetMask = 3;

class DiagnosticModemTest : public testing::Test
{
protected:
    // What a listener was given, and the listener.
    struct Ear {
        std::vector<Bytes> messages;
        std::unique_ptr<DiagnosticModem::Listener> listener;
    };

    void make(std::optional<std::string> technology)
    {
        modem = std::make_unique<DiagnosticModem>(
            queue, phone.opener(), DiagnosticModem::Settings{"/dev/modem", std::move(technology)});
        modem->setEvents(
            {[this] { ++changes; }, [this] { presences.push_back(modem->presence()); }});
    }
    // A modem of a named technology that has answered.
    void startLte()
    {
        make(kTSLogChannelTechnology_Varnel_LTE);
        EXPECT_FALSE(modem->start());
        queue.runPending();
    }
    // One whose technology is not named.
    void startUnknown()
    {
        make(std::nullopt);
        EXPECT_FALSE(modem->start());
        queue.runPending();
    }
    std::unique_ptr<Ear> listen(LogCodes codes)
    {
        auto ear = std::make_unique<Ear>();
        ear->listener = modem->listen(std::move(codes), [heard = ear.get()](ByteView message) {
            heard->messages.emplace_back(message.begin(), message.end());
        });
        queue.runPending();
        return ear;
    }
    static Bytes messageOf(std::uint16_t code)
    {
        Bytes message = {1};
        const Bytes item = MemoryModem::item(code);
        message.insert(message.end(), item.begin(), item.end());
        return message;
    }
    // Asks for the technology as a viewer does, every five seconds, while the modem logs items of
    // one code every 100 ms, until there is an answer.
    std::string technologyWhileLogging(std::uint16_t code)
    {
        for (int step = 0; step < 600; ++step) {
            if (step % 50 == 0) {
                std::string technology = modem->technology();
                if (!technology.empty())
                    return technology;
            }
            queue.advance(100ms);
            phone.logItem(code);
        }
        return "";
    }

    TestServices services;
    ManualMainQueue queue;
    MemoryModem phone{queue};
    std::unique_ptr<DiagnosticModem> modem;
    int changes = 0;
    std::vector<Presence> presences;
};

TEST_F(DiagnosticModemTest, TheCodesOfAllListenersAreSwitchedOnAndNoOthers)
{
    startLte();
    EXPECT_THAT(phone.codes, IsEmpty());
    const auto first = listen({0xB0C2, 0xB17F});
    auto second = listen({0xB17F, 0x4005});
    EXPECT_THAT(phone.codes, ElementsAre(0x4005, 0xB0C2, 0xB17F));
    second.reset();
    queue.runPending();
    EXPECT_THAT(phone.codes, ElementsAre(0xB0C2, 0xB17F));
}

TEST_F(DiagnosticModemTest, TheLastListenerThatGoesSwitchesAllOff)
{
    startLte();
    auto first = listen({0xB0C2});
    auto second = listen({0x4005});
    first.reset();
    second.reset();
    queue.runPending();
    EXPECT_THAT(phone.codes, IsEmpty());
    EXPECT_EQ(phone.requests.back(), (Bytes{0x73, 0, 0, 0, 0, 0, 0, 0}));
}

TEST_F(DiagnosticModemTest, ItemsGoToThoseWhoAskedForThemAsMessagesOfTypeOne)
{
    startLte();
    const auto first = listen({0xB0C2});
    const auto second = listen({0xB0C2, 0x4005});
    phone.logItem(0xB0C2);
    phone.logItem(0x4005);
    EXPECT_THAT(first->messages, ElementsAre(messageOf(0xB0C2)));
    EXPECT_THAT(second->messages, ElementsAre(messageOf(0xB0C2), messageOf(0x4005)));
}

TEST_F(DiagnosticModemTest, ItemsThatNobodyAskedForGoNowhere)
{
    startLte();
    const auto ear = listen({0xB0C2});
    phone.sendItem(0x4005);
    EXPECT_THAT(ear->messages, IsEmpty());
}

TEST_F(DiagnosticModemTest, AListenerMayEndAnotherOneFromWithinItsCall)
{
    startLte();
    std::unique_ptr<Ear> second;
    const auto first = modem->listen({0xB0C2}, [&](ByteView) { second.reset(); });
    second = listen({0xB0C2});
    const auto third = listen({0xB0C2});
    phone.logItem(0xB0C2);
    queue.runPending();
    EXPECT_THAT(third->messages, SizeIs(1));
}

TEST_F(DiagnosticModemTest, ACodeThatTheModemLacksIsToldOnce)
{
    phone.ranges[4] = 0;
    startLte();
    auto ear = listen({0xB0C2, 0x4005, 0x4031});
    ear = listen({0x4005, 0x4116});
    phone.unplug();
    phone.plugIn();
    queue.advance(2s);
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("The modem at /dev/modem does not have the log codes 0x4005, 0x4031; "
                            "their rows stay empty",
                            "The modem at /dev/modem does not have the log codes 0x4116; their "
                            "rows stay empty",
                            HasSubstr("No modem at /dev/modem: it was unplugged")));
}

TEST_F(DiagnosticModemTest, ARefusalIsToldOnce)
{
    phone.manners[kSetMask] = Manner::FailedStatus;
    startLte();
    auto ear = listen({0x4005});
    ear = listen({0x4005, 0x4031});
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("The modem at /dev/modem refuses the log codes 0x4000 to 0x4FFF"));
}

TEST_F(DiagnosticModemTest, APortThatCannotBeOpenedAtTheStartIsAnError)
{
    phone.isPluggedIn = false;
    make(kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(modem->start(), "cannot open the port: it is absent");
    phone.plugIn();
    queue.advance(10s);
    EXPECT_EQ(phone.openings, 1);
}

TEST_F(DiagnosticModemTest, AModemThatWasUnpluggedIsLookedForEveryTwoSecondsAndListenersLiveOn)
{
    startLte();
    const auto ear = listen({0xB0C2, 0x4005});
    phone.unplug();
    EXPECT_THAT(presences, ElementsAre(Presence::Present, Presence::Missing));
    queue.advance(10s);
    EXPECT_EQ(phone.openings, 6);
    phone.plugIn();
    queue.advance(1999ms);
    EXPECT_FALSE(phone.isOpen());
    queue.advance(1ms);
    EXPECT_EQ(presences.back(), Presence::Present);
    EXPECT_THAT(phone.codes, ElementsAre(0x4005, 0xB0C2));
    phone.logItem(0xB0C2);
    EXPECT_THAT(ear->messages, SizeIs(1));
    // The absence is logged once, not at every attempt.
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("No modem at /dev/modem: it was unplugged; looking for it every 2 "
                            "seconds",
                            "cannot open the port: it is absent"));
}

TEST_F(DiagnosticModemTest, AModemThatDoesNotAnswerIsMissingUntilItDoes)
{
    phone.greeting = Manner::Ignore;
    startLte();
    EXPECT_EQ(modem->presence(), Presence::Unknown);
    queue.advance(3s);
    EXPECT_EQ(modem->presence(), Presence::Missing);
    queue.advance(20s);
    EXPECT_THAT(services.log.warnings(), SizeIs(1));
    phone.greeting = Manner::Answer;
    queue.advance(5s);
    EXPECT_EQ(modem->presence(), Presence::Present);
}

TEST_F(DiagnosticModemTest, StoppingSwitchesAllOffAndClosesTheDevice)
{
    startLte();
    const auto ear = listen({0xB0C2});
    bool isDone = false;
    modem->stop([&] { isDone = true; });
    EXPECT_FALSE(isDone);
    queue.runPending();
    EXPECT_TRUE(isDone);
    EXPECT_THAT(phone.codes, IsEmpty());
    EXPECT_FALSE(phone.isOpen());
}

TEST_F(DiagnosticModemTest, StoppingWhileTheModemIsAwayEndsTheSearch)
{
    startLte();
    phone.unplug();
    bool isDone = false;
    modem->stop([&] { isDone = true; });
    queue.runPending();
    EXPECT_TRUE(isDone);
    phone.plugIn();
    queue.advance(10s);
    EXPECT_EQ(phone.openings, 1);
}

TEST_F(DiagnosticModemTest, DamageIsToldWhenTheDeviceIsClosed)
{
    startLte();
    phone.send(Bytes{'R', 'D', 'Y', 0x7E});
    phone.unplug();
    EXPECT_THAT(services.log.texts(LogPriority::Notice),
                Contains("/dev/modem: 0 log items came; 1 frames and 0 log items were damaged and "
                         "dropped"));
}

TEST_F(DiagnosticModemTest, ATechnologyThatWasNamedIsAnsweredWithoutProbing)
{
    startLte();
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
    queue.advance(10s);
    EXPECT_THAT(phone.requests, SizeIs(3));
}

TEST_F(DiagnosticModemTest, ProbingFindsEachTechnologyAndLeavesNoCodeSwitchedOn)
{
    const struct {
        std::uint16_t code;
        const char* technology;
    } cases[] = {
        {0xB179, kTSLogChannelTechnology_Varnel_LTE   },
        {0xB17F, kTSLogChannelTechnology_Varnel_LTE   },
        {0x4005, kTSLogChannelTechnology_Varnel_GSM   },
        {0x5137, kTSLogChannelTechnology_Varnel_GSM   },
        {0xD00A, kTSLogChannelTechnology_Varnel_UTRAN2},
        {0xD00C, kTSLogChannelTechnology_Varnel_UTRAN2},
        {0x1183, kTSLogChannelTechnology_Varnel_CDMA  },
        {0x119C, kTSLogChannelTechnology_Varnel_CDMA  },
    };
    for (const auto& each : cases) {
        phone.requests.clear();
        startUnknown();
        EXPECT_EQ(technologyWhileLogging(each.code), each.technology) << each.code;
        queue.runPending();
        EXPECT_THAT(phone.codes, IsEmpty()) << each.code;
        EXPECT_EQ(changes, 0);
        modem.reset();
    }
}

TEST_F(DiagnosticModemTest, NothingIsProbedBeforeAClientAsks)
{
    startUnknown();
    queue.advance(5min);
    EXPECT_THAT(phone.requests, SizeIs(3));
}

TEST_F(DiagnosticModemTest, EachTechnologyIsTriedForASecondInTurn)
{
    startUnknown();
    EXPECT_EQ(modem->technology(), "");
    queue.runPending();
    std::vector<std::set<std::uint16_t>> turns = {phone.codes};
    for (int i = 0; i < 4; ++i) {
        queue.advance(999ms);
        EXPECT_EQ(phone.codes, turns.back());
        queue.advance(1ms);
        turns.push_back(phone.codes);
    }
    EXPECT_THAT(turns, ElementsAre(ElementsAre(0xB179, 0xB17F), ElementsAre(0x4005, 0x5137),
                                   ElementsAre(0xD00A, 0xD00C), ElementsAre(0x1183, 0x119C),
                                   ElementsAre(0xB179, 0xB17F)));
}

TEST_F(DiagnosticModemTest, ASlowModemStillGetsASecondWithItsCodesOn)
{
    startUnknown();
    phone.manners[kSetMask] = Manner::Ignore;
    modem->technology();
    queue.advance(1500ms);
    phone.manners[kSetMask] = Manner::Answer;
    queue.advance(500ms);
    EXPECT_THAT(phone.codes, ElementsAre(0xB179, 0xB17F));
    queue.advance(999ms);
    EXPECT_TRUE(phone.logItem(0xB17F));
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
}

TEST_F(DiagnosticModemTest, ProbingEndsWhenNoClientAsksAnyMore)
{
    startUnknown();
    modem->technology();
    queue.advance(10s);
    modem->technology();
    queue.advance(14999ms);
    EXPECT_FALSE(phone.codes.empty());
    queue.advance(1ms);
    EXPECT_THAT(phone.codes, IsEmpty());
    const std::size_t before = phone.requests.size();
    queue.advance(1min);
    EXPECT_EQ(phone.requests.size(), before);
}

TEST_F(DiagnosticModemTest, ItemsOfAnEarlierSessionShowNoTechnology)
{
    startUnknown();
    modem->technology();
    queue.runPending();
    phone.sendItem(0x4005); // while LTE has its turn
    EXPECT_EQ(modem->technology(), "");
}

TEST_F(DiagnosticModemTest, ASilentModemIsNotProbedAgain)
{
    startUnknown();
    EXPECT_EQ(technologyWhileLogging(0xB17F), kTSLogChannelTechnology_Varnel_LTE);
    const auto ear = listen({0xB0C2});
    const std::size_t before = phone.requests.size();
    queue.advance(10min);
    EXPECT_EQ(phone.requests.size(), before);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
}

TEST_F(DiagnosticModemTest, AfterAnAbsenceTheLastKnownTechnologyIsTriedFirst)
{
    startUnknown();
    EXPECT_EQ(technologyWhileLogging(0xD00A), kTSLogChannelTechnology_Varnel_UTRAN2);
    phone.unplug();
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_UTRAN2);
    phone.plugIn();
    queue.advance(2s);
    EXPECT_EQ(modem->technology(), "");
    queue.runPending();
    EXPECT_THAT(phone.codes, ElementsAre(0xD00A, 0xD00C));
    phone.logItem(0xD00C);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_UTRAN2);
    EXPECT_EQ(changes, 0);
}

TEST_F(DiagnosticModemTest, AfterAnAbsenceAnItemThatAListenerAskedForConfirmsTheTechnology)
{
    startUnknown();
    EXPECT_EQ(technologyWhileLogging(0xB17F), kTSLogChannelTechnology_Varnel_LTE);
    const auto ear = listen({0xB0C2});
    phone.unplug();
    phone.plugIn();
    queue.advance(2s);
    phone.logItem(0xB0C2);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
    const std::size_t before = phone.requests.size();
    queue.advance(10min);
    EXPECT_EQ(phone.requests.size(), before);
}

TEST_F(DiagnosticModemTest, AModemThatComesBackAndIsSilentForAMinuteIsProbedForAnotherTechnology)
{
    startUnknown();
    EXPECT_EQ(technologyWhileLogging(0xB17F), kTSLogChannelTechnology_Varnel_LTE);
    const auto ear = listen({0xB0C2});
    phone.unplug();
    phone.plugIn();
    queue.advance(2s);
    EXPECT_THAT(phone.codes, ElementsAre(0xB0C2));
    queue.advance(59s);
    EXPECT_THAT(phone.codes, ElementsAre(0xB0C2));
    for (int i = 0; i < 50 && changes == 0; ++i) {
        queue.advance(100ms);
        phone.logItem(0x4005);
    }
    EXPECT_EQ(changes, 1);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_GSM);
    queue.runPending();
    EXPECT_THAT(phone.codes, ElementsAre(0xB0C2));
}

TEST_F(DiagnosticModemTest, ATechnologyThatAServiceTellsNeedsNoProbing)
{
    startUnknown();
    modem->tellTechnology(kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(changes, 0);
    modem->tellTechnology(kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(changes, 1);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_GSM);
    // Without service nothing is told: that is no change.
    modem->tellTechnology(std::nullopt);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(changes, 1);
    queue.advance(10s);
    EXPECT_THAT(phone.requests, SizeIs(3));
}

TEST_F(DiagnosticModemTest, ANamedTechnologyStaysWhateverAServiceTells)
{
    startLte();
    modem->tellTechnology(kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(changes, 0);
}

TEST_F(DiagnosticModemTest, ServicesCannotTellUtranFromUmts)
{
    startUnknown();
    EXPECT_EQ(technologyWhileLogging(0xD00A), kTSLogChannelTechnology_Varnel_UTRAN2);
    modem->tellTechnology(kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(modem->technology(), kTSLogChannelTechnology_Varnel_UTRAN2);
    EXPECT_EQ(changes, 0);
    modem->tellTechnology(kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(changes, 1);
}

} // namespace
} // namespace orvane
