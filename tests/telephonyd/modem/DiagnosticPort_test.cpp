#include "telephonyd/modem/DiagnosticPort.h"

#include "doubles/ManualMainQueue.h"
#include "telephonyd/support/MemoryModem.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using testing::UnorderedElementsAre;
using Manner = MemoryModem::Manner;

constexpr std::uint32_t kOff = 0;
constexpr std::uint32_t kRanges = 1;
constexpr std::uint32_t kSetMask = 3;

class DiagnosticPortTest : public testing::Test
{
protected:
    // Opens the port and runs what is due.
    void open()
    {
        port.reset();
        std::string error;
        DiagnosticPort::Events events;
        events.item = [this](ByteView item) { items.emplace_back(item.begin(), item.end()); };
        events.ready = [this] { ++readies; };
        events.settled = [this] { ++settlings; };
        events.missing = [this](const auto& codes) { missing.insert(codes.begin(), codes.end()); };
        events.refused = [this](const std::string& what) { refused.push_back(what); };
        events.failed = [this](const std::string& reason) {
            failure = reason;
            port.reset();
        };
        port = std::make_unique<DiagnosticPort>(queue, modem.opener()(error), std::move(events));
        queue.runPending();
    }
    // First byte and, of a mask request, operation of each request that came.
    [[nodiscard]] std::vector<std::string> requests() const
    {
        std::vector<std::string> names;
        for (const Bytes& request : modem.requests)
            names.emplace_back(request[0] == 0         ? "version"
                               : request[4] == kOff    ? "off"
                               : request[4] == kRanges ? "ranges"
                                                       : "mask");
        return names;
    }
    void want(LogCodes codes)
    {
        port->setWantedCodes(std::move(codes));
        queue.runPending();
    }

    ManualMainQueue queue;
    MemoryModem modem{queue};
    std::unique_ptr<DiagnosticPort> port;
    std::vector<Bytes> items;
    int readies = 0;
    int settlings = 0;
    std::set<std::uint16_t> missing;
    std::vector<std::string> refused;
    std::optional<std::string> failure;
};

TEST_F(DiagnosticPortTest, OnOpeningAllIsSwitchedOffBeforeAnythingIsSwitchedOn)
{
    modem.codes = {0x1234, 0xB0C2}; // of an earlier session
    open();
    EXPECT_THAT(requests(), ElementsAre("version", "off", "ranges"));
    EXPECT_THAT(modem.codes, IsEmpty());
    EXPECT_EQ(readies, 1);
    want({0xB0C2});
    EXPECT_THAT(requests(), ElementsAre("version", "off", "ranges", "mask"));
    EXPECT_THAT(modem.codes, ElementsAre(0xB0C2));
}

TEST_F(DiagnosticPortTest, ExactlyTheWantedCodesAreSwitchedOn)
{
    open();
    want({0xB0C2, 0xB17F, 0x4005, 0x1183});
    EXPECT_THAT(modem.codes, ElementsAre(0x1183, 0x4005, 0xB0C2, 0xB17F));
    want({0xB0C2, 0x5134});
    EXPECT_THAT(modem.codes, ElementsAre(0x5134, 0xB0C2));
    want({});
    EXPECT_THAT(modem.codes, IsEmpty());
    EXPECT_EQ(requests().back(), "off");
    want({0xB0C2});
    EXPECT_THAT(modem.codes, ElementsAre(0xB0C2));
    EXPECT_EQ(settlings, 5); // once without codes
}

TEST_F(DiagnosticPortTest, AGroupThatStaysAsItIsIsNotAskedForAgain)
{
    open();
    want({0xB0C2, 0x4005});
    const std::size_t before = modem.requests.size();
    want({0xB0C2, 0x4005});
    EXPECT_EQ(modem.requests.size(), before);
    want({0xB0C2, 0x4005, 0x4031});
    EXPECT_EQ(modem.requests.size(), before + 1);
}

TEST_F(DiagnosticPortTest, CodesWantedBeforeTheModemAnswersAreSwitchedOnAfterwards)
{
    modem.greeting = Manner::Ignore;
    open();
    want({0xB0C2});
    EXPECT_THAT(requests(), ElementsAre("version"));
    modem.greeting = Manner::Answer;
    queue.advance(1s);
    EXPECT_THAT(modem.codes, ElementsAre(0xB0C2));
}

TEST_F(DiagnosticPortTest, OneRequestIsUnderWayAtATime)
{
    open();
    const std::size_t before = modem.requests.size();
    modem.manners[kSetMask] = Manner::Ignore;
    want({0xB0C2, 0x4005, 0x1183});
    EXPECT_EQ(modem.requests.size(), before + 1);
    want({0xB0C2, 0x4005, 0x1183, 0x5134});
    EXPECT_EQ(modem.requests.size(), before + 1);
}

TEST_F(DiagnosticPortTest, ARequestWithoutAnAnswerIsMadeThreeTimesASecondApart)
{
    modem.greeting = Manner::Ignore;
    open();
    queue.advance(999ms);
    EXPECT_THAT(modem.requests, SizeIs(1));
    queue.advance(1ms);
    EXPECT_THAT(modem.requests, SizeIs(2));
    queue.advance(1s);
    EXPECT_THAT(modem.requests, SizeIs(3));
    EXPECT_FALSE(failure);
    queue.advance(1s);
    EXPECT_THAT(modem.requests, SizeIs(3));
    EXPECT_EQ(failure, "it does not answer");
    EXPECT_FALSE(modem.isOpen());
}

TEST_F(DiagnosticPortTest, AnAnswerToTheSecondOrThirdTryIsGoodEnough)
{
    for (const std::size_t tries : {2U, 3U}) {
        modem.requests.clear();
        modem.greeting = Manner::Ignore;
        modem.onRequest = [&](const Bytes&) {
            if (modem.requests.size() == tries)
                modem.greeting = Manner::Answer;
        };
        readies = 0;
        open();
        queue.advance(2s);
        EXPECT_EQ(readies, 1) << tries;
    }
}

TEST_F(DiagnosticPortTest, AModemThatIsNotReadyIsAskedAgainAndThenCountsAsRefusing)
{
    open();
    modem.manners[kSetMask] = Manner::NotNow;
    want({0xB0C2});
    queue.advance(1s);
    modem.manners[kSetMask] = Manner::Answer;
    queue.advance(1s);
    EXPECT_THAT(modem.codes, ElementsAre(0xB0C2));
    EXPECT_THAT(refused, IsEmpty());

    modem.manners[kSetMask] = Manner::NotNow;
    want({0xB0C2, 0x4005});
    queue.advance(3s);
    EXPECT_THAT(refused, ElementsAre("the log codes 0x4000 to 0x4FFF"));
    EXPECT_FALSE(failure);
}

TEST_F(DiagnosticPortTest, CodesBeyondARangeAreMissingAndTheRestIsAskedFor)
{
    modem.ranges[0xB] = 0x100; // 0xB000 to 0xB0FF
    modem.ranges[4] = 0;
    open();
    want({0xB0C2, 0xB0FF, 0xB100, 0x4005, 0x1183});
    EXPECT_THAT(modem.codes, ElementsAre(0x1183, 0xB0C2, 0xB0FF));
    EXPECT_THAT(missing, UnorderedElementsAre(0xB100, 0x4005));
}

TEST_F(DiagnosticPortTest, TheMaskHasAsManyBitsAsTheGroupHasCodes)
{
    modem.ranges[0xB] = 0x3FF;
    open();
    want({0xB0C2});
    EXPECT_THAT(modem.requests.back(), SizeIs(16 + 0x400 / 8));
}

TEST_F(DiagnosticPortTest, ARangeThatNoCodeCanReachCostsNoMemory)
{
    modem.ranges[0xB] = 0xFFFFFFFF;
    open();
    want({0xBFFF});
    EXPECT_THAT(modem.codes, ElementsAre(0xBFFF));
    EXPECT_THAT(modem.requests.back(), SizeIs(16 + 512));
}

TEST_F(DiagnosticPortTest, WithoutRangesAMaskReachesToTheHighestCodeAskedFor)
{
    for (const Manner manner : {Manner::RefuseCommand, Manner::FailedStatus}) {
        modem.manners[kRanges] = manner;
        open();
        want({0xB00A});
        EXPECT_THAT(modem.requests.back(), SizeIs(16 + 2));
        EXPECT_EQ(modem.requests.back()[12], 0x0B);
        EXPECT_THAT(missing, IsEmpty());
        // A shorter mask could leave the code beyond it on.
        want({0xB001});
        EXPECT_EQ(modem.requests.back()[12], 0x0B);
        want({0x4005});
        EXPECT_THAT(modem.codes, ElementsAre(0x4005));
    }
}

TEST_F(DiagnosticPortTest, AGroupThatIsRefusedIsToldAndOthersAreAskedFor)
{
    open();
    modem.manners[kSetMask] = Manner::FailedStatus;
    modem.onRequest = [&](const Bytes& request) {
        modem.manners[kSetMask] = request[8] == 4 ? Manner::FailedStatus : Manner::Answer;
    };
    want({0xB0C2, 0x4005, 0x1183});
    EXPECT_THAT(modem.codes, ElementsAre(0x1183, 0xB0C2));
    EXPECT_THAT(refused, ElementsAre("the log codes 0x4000 to 0x4FFF"));
    const std::size_t before = modem.requests.size();
    queue.advance(10s);
    EXPECT_EQ(modem.requests.size(), before);
}

TEST_F(DiagnosticPortTest, AModemThatCannotSwitchAllOffIsServedAllTheSame)
{
    modem.manners[kOff] = Manner::RefuseCommand;
    open();
    want({0xB0C2});
    EXPECT_THAT(modem.codes, ElementsAre(0xB0C2));
    EXPECT_THAT(refused, ElementsAre("to switch all log codes off"));
}

TEST_F(DiagnosticPortTest, ItemsComeInBetweenAnswers)
{
    open();
    modem.onRequest = [&](const Bytes&) { modem.sendItem(0x4005); };
    want({0xB0C2, 0x4005});
    EXPECT_THAT(modem.codes, ElementsAre(0x4005, 0xB0C2));
    EXPECT_THAT(items, ElementsAre(MemoryModem::item(0x4005), MemoryModem::item(0x4005)));
}

TEST_F(DiagnosticPortTest, ItemsOfAnEarlierSessionAreNotGivenBeforeAllWasSwitchedOff)
{
    modem.greeting = Manner::Ignore;
    open();
    modem.sendItem(0x4005);
    EXPECT_THAT(items, IsEmpty());
}

TEST_F(DiagnosticPortTest, DamageIsCounted)
{
    open();
    modem.sendItem(0x4005);
    modem.sendPayload(Bytes{0x10, 0, 12, 0, 13, 0});
    modem.send(Bytes{'R', 'D', 'Y', 0x7E});
    EXPECT_EQ(port->counts().items, 1U);
    EXPECT_EQ(port->counts().damagedItems, 1U);
    EXPECT_EQ(port->counts().damagedFrames, 1U);
    EXPECT_THAT(items, SizeIs(1));
}

TEST_F(DiagnosticPortTest, ADeviceThatGoesAwayIsTheLastEvent)
{
    open();
    want({0xB0C2});
    modem.unplug("it was unplugged");
    EXPECT_EQ(failure, "it was unplugged");
    queue.advance(10s);
}

TEST_F(DiagnosticPortTest, FinishingSwitchesAllOff)
{
    open();
    want({0xB0C2, 0x4005});
    bool isDone = false;
    port->finish([&] { isDone = true; });
    EXPECT_FALSE(isDone);
    queue.runPending();
    EXPECT_TRUE(isDone);
    EXPECT_THAT(modem.codes, IsEmpty());
    port->setWantedCodes({0xB0C2});
    queue.runPending();
    EXPECT_THAT(modem.codes, IsEmpty());
}

TEST_F(DiagnosticPortTest, FinishingAtAnyMomentEndsWithAllOff)
{
    // After each number of tasks of the queue, so between any two requests and answers.
    for (std::size_t requestsBefore = 1; requestsBefore <= 6; ++requestsBefore) {
        modem.requests.clear();
        modem.codes = {0x1234};
        bool isDone = false;
        modem.onRequest = [&](const Bytes&) {
            if (modem.requests.size() == requestsBefore)
                queue.async([&] { port->finish([&] { isDone = true; }); });
        };
        open();
        want({0xB0C2, 0x4005, 0x1183});
        EXPECT_TRUE(isDone) << requestsBefore;
        EXPECT_THAT(modem.codes, IsEmpty()) << requestsBefore;
    }
}

TEST_F(DiagnosticPortTest, FinishingWithAModemThatIsSilentOrGoneTakesSecondsAtMost)
{
    open();
    want({0xB0C2});
    modem.manners[kOff] = Manner::Ignore;
    bool isDone = false;
    port->finish([&] { isDone = true; });
    queue.advance(3s);
    EXPECT_TRUE(isDone);
    EXPECT_FALSE(failure);

    isDone = false;
    modem.manners.clear();
    open();
    want({0xB0C2});
    modem.manners[kOff] = Manner::Ignore;
    port->finish([&] { isDone = true; });
    modem.unplug();
    queue.runPending();
    EXPECT_TRUE(isDone);
}

} // namespace
} // namespace orvane
