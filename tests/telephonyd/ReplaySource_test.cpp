#include "telephonyd/ReplaySource.h"

#include "dlf/DlfTime.h"
#include "doubles/ManualMainQueue.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using std::chrono::milliseconds;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr double kStart = 1795255200; // the recording's first second

void put(Bytes& to, std::uint64_t value, unsigned width)
{
    for (unsigned i = 0; i < width; ++i)
        to.push_back(static_cast<std::uint8_t>(value >> 8 * i & 0xFF));
}

// An item whose payload is one byte, by which a test recognises it.
Bytes item(std::uint16_t code, std::uint64_t timestamp, std::uint8_t mark)
{
    Bytes bytes;
    put(bytes, 13, 2);
    put(bytes, code, 2);
    put(bytes, timestamp, 8);
    bytes.push_back(mark);
    return bytes;
}

struct Recorded {
    double second; // after kStart
    std::uint8_t mark;
    std::uint16_t code = 0xB0C2;
};

std::shared_ptr<const Bytes> recording(const std::vector<Recorded>& items)
{
    Bytes file;
    for (const Recorded& each : items) {
        const Bytes bytes = item(each.code, dlfTimestamp(kStart + each.second), each.mark);
        file.insert(file.end(), bytes.begin(), bytes.end());
    }
    return std::make_shared<const Bytes>(std::move(file));
}

struct Sent {
    milliseconds at;
    std::uint8_t mark;
    friend bool operator==(const Sent&, const Sent&) = default;
    friend void PrintTo(const Sent& sent, std::ostream* out)
    {
        *out << int{sent.mark} << " at " << sent.at.count() << " ms";
    }
};

class ReplaySourceTest : public testing::Test
{
protected:
    void replay(std::shared_ptr<const Bytes> file, std::optional<double> speed, bool loops = false,
                LogSelection selection = {{0xB0C2}, {}})
    {
        struct Held {
            explicit Held(std::shared_ptr<const Bytes> bytes) : content(bytes), source(*content) {}
            std::shared_ptr<const Bytes> content;
            MemorySource source;
        };
        const auto held = std::make_shared<Held>(std::move(file));
        source = std::make_unique<ReplaySource>(
            queue, [this] { return queue.now(); }, std::shared_ptr<ByteSource>(held, &held->source),
            ReplaySettings{"a technology", speed, loops});
        source->start(selection, [this](ByteView message) {
            sent.push_back({std::chrono::duration_cast<milliseconds>(queue.now()), message.back()});
            messages.emplace_back(message.begin(), message.end());
            return !room || sent.size() < *room;
        });
    }
    [[nodiscard]] std::vector<std::uint8_t> marks() const
    {
        std::vector<std::uint8_t> found;
        for (const Sent& each : sent)
            found.push_back(each.mark);
        return found;
    }

    ManualMainQueue queue;
    std::unique_ptr<ReplaySource> source;
    std::vector<Sent> sent;
    std::vector<Bytes> messages;
    std::optional<std::size_t> room; // messages after which the client is behind
};

TEST_F(ReplaySourceTest, AMessageIsTheItemBehindATypeByte)
{
    const auto file = recording({
        {0, 7}
    });
    replay(file, 1);
    EXPECT_THAT(sent, IsEmpty()); // never from within start()
    queue.runPending();
    Bytes expected = {1};
    expected.insert(expected.end(), file->begin(), file->end());
    EXPECT_THAT(messages, ElementsAre(expected));
    EXPECT_EQ(source->technology(), "a technology");
}

TEST_F(ReplaySourceTest, ItemsKeepTheirPaceAtEverySpeed)
{
    const struct {
        std::optional<double> speed;
        std::vector<milliseconds> times;
    } cases[] = {
        {1,            {0ms, 0ms, 1000ms, 2500ms}          },
        {2,            {0ms, 0ms, 500ms, 1250ms}           },
        {0.5,          {0ms, 0ms, 2000ms, 5000ms}          },
        {0.001,        {0ms, 0ms, 1'000'000ms, 2'500'000ms}},
        {1000,         {0ms, 0ms, 1ms, 2ms}                },
        {std::nullopt, {0ms, 0ms, 0ms, 0ms}                },
    };
    for (const auto& each : cases) {
        sent.clear();
        const auto begin = std::chrono::duration_cast<milliseconds>(queue.now());
        replay(recording({
                   {0,   1},
                   {0,   2},
                   {1,   3},
                   {2.5, 4}
        }),
               each.speed);
        queue.advance(3'000'000ms);
        std::vector<milliseconds> times;
        for (const Sent& one : sent)
            times.push_back(one.at - begin);
        EXPECT_EQ(times, each.times) << each.speed.value_or(0);
        EXPECT_THAT(marks(), ElementsAre(1, 2, 3, 4));
        EXPECT_EQ(queue.waitingTasks(), 0U); // silent after the end
    }
}

TEST_F(ReplaySourceTest, AnItemOfThePastFollowsAtOnceAndTimeDoesNotGoBack)
{
    replay(recording({
               {0,    1},
               {10,   2},
               {4,    3},
               {9.5,  4},
               {10.5, 5}
    }),
           1);
    queue.advance(60s);
    EXPECT_THAT(sent, ElementsAre(Sent{0ms, 1}, Sent{10'000ms, 2}, Sent{10'000ms, 3},
                                  Sent{10'000ms, 4}, Sent{10'500ms, 5}));
}

TEST_F(ReplaySourceTest, AClockThatWasSetTakesNoTime)
{
    replay(recording({
               {-1'000'000'000, 1}, // before the modem knew the date
               {0,              2},
               {3600,           3},
               {7201,           4}
    }),
           1);
    queue.advance(4h);
    EXPECT_THAT(
        sent, ElementsAre(Sent{0ms, 1}, Sent{0ms, 2}, Sent{3'600'000ms, 3}, Sent{3'600'000ms, 4}));
}

TEST_F(ReplaySourceTest, ItemsWithoutATimestampAreNotSentAndTakeNoTime)
{
    Bytes file = item(0x1FFD, 0, 1);
    for (const Bytes& each : {item(0xB0C2, dlfTimestamp(kStart), 2), item(0xB0C2, 0, 3),
                              item(0xB0C2, dlfTimestamp(kStart + 1), 4)})
        file.insert(file.end(), each.begin(), each.end());
    replay(std::make_shared<const Bytes>(file), 1, false,
           {
               {0xB0C2,           0x1FFD},
               {                }
    });
    queue.advance(10s);
    EXPECT_THAT(sent, ElementsAre(Sent{0ms, 2}, Sent{1000ms, 4}));
}

TEST_F(ReplaySourceTest, OnlyWhatWasAskedForIsSentAtItsOwnTime)
{
    replay(recording({
               {0, 1, 0xB179},
               {1, 2, 0xB0C2},
               {2, 3, 0xB17F},
               {3, 4, 0xB0C2}
    }),
           1);
    queue.advance(10s);
    EXPECT_THAT(sent, ElementsAre(Sent{1000ms, 2}, Sent{3000ms, 4}));
}

TEST_F(ReplaySourceTest, ItemsOfTheServerAreToldApartByTheirTypeByte)
{
    Bytes file = item(0xB0C2, dlfTimestamp(kStart), 1);
    for (const unsigned type : {0xFFU, 0x01U}) {
        file.push_back(static_cast<std::uint8_t>(type));
        const Bytes next = item(2, dlfTimestamp(kStart), static_cast<std::uint8_t>(type & 0x0F));
        file.insert(file.end(), next.begin(), next.end());
    }
    const auto shared = std::make_shared<const Bytes>(file);
    replay(shared, 1, false, {{}, {2}});
    queue.runPending();
    ASSERT_EQ(messages.size(), 1U);
    EXPECT_EQ(messages[0].front(), 0xFF);
    EXPECT_EQ(messages[0].back(), 0x0F);

    messages.clear();
    replay(shared, 1, false, {{2}, {}});
    queue.runPending();
    ASSERT_EQ(messages.size(), 1U);
    EXPECT_EQ(messages[0].front(), 1);
}

TEST_F(ReplaySourceTest, AtFullSpeedItWaitsForTheClient)
{
    std::vector<Recorded> items;
    for (std::uint8_t i = 0; i < 10; ++i)
        items.push_back({i * 100.0, i});
    room = 4;
    replay(recording(items), std::nullopt);
    queue.advance(1h);
    EXPECT_THAT(marks(), ElementsAre(0, 1, 2, 3));
    source->resume();
    EXPECT_EQ(sent.size(), 4U); // not from within the call
    queue.runPending();
    EXPECT_EQ(sent.size(), 5U); // still behind
    room.reset();
    source->resume();
    queue.runPending();
    EXPECT_THAT(marks(), ElementsAre(0, 1, 2, 3, 4, 5, 6, 7, 8, 9));
    source->resume(); // when nothing waits
    queue.runPending();
    EXPECT_EQ(sent.size(), 10U);
}

TEST_F(ReplaySourceTest, AClientThatWasBehindGetsWhatItMissedAndThenThePaceAgain)
{
    room = 2;
    replay(recording({
               {0,  1},
               {1,  2},
               {2,  3},
               {3,  4},
               {10, 5}
    }),
           1);
    queue.advance(5s);
    EXPECT_THAT(marks(), ElementsAre(1, 2));
    room.reset();
    source->resume();
    queue.advance(60s);
    EXPECT_THAT(sent, ElementsAre(Sent{0ms, 1}, Sent{1000ms, 2}, Sent{5000ms, 3}, Sent{5000ms, 4},
                                  Sent{10'000ms, 5}));
}

TEST_F(ReplaySourceTest, ALoopStartsOverASecondOfTheRecordingAfterTheEnd)
{
    const auto file = recording({
        {0, 1},
        {4, 2}
    });
    replay(file, 2, true);
    queue.advance(5s);
    EXPECT_THAT(sent, ElementsAre(Sent{0ms, 1}, Sent{2000ms, 2}, Sent{2500ms, 1}, Sent{4500ms, 2},
                                  Sent{5000ms, 1}));
}

TEST_F(ReplaySourceTest, ALoopAtFullSpeedGoesRoundAsTheClientTakesIt)
{
    room = 5;
    replay(recording({
               {0, 1},
               {4, 2}
    }),
           std::nullopt, true);
    queue.runPending();
    EXPECT_THAT(marks(), ElementsAre(1, 2, 1, 2, 1));
}

TEST_F(ReplaySourceTest, ALoopWithNothingToSendEnds)
{
    const auto some = recording({
        {0, 1},
        {4, 2}
    });
    const std::shared_ptr<const Bytes> files[] = {some, std::make_shared<const Bytes>(),
                                                  std::make_shared<const Bytes>(Bytes(1000, 0xAB))};
    for (const auto& file : files)
        for (const std::optional<double> speed : {std::optional(1.0), std::optional<double>()}) {
            replay(file, speed, true, {{0x1111}, {1}});
            queue.advance(60s);
            EXPECT_THAT(sent, IsEmpty());
            EXPECT_EQ(queue.waitingTasks(), 0U);
        }
}

TEST_F(ReplaySourceTest, ManyItemsOfOneMomentComeByTurns)
{
    std::vector<Recorded> items(5000, Recorded{0, 3});
    const auto file = recording(items);
    replay(file, 1);
    std::size_t sentBeforeOthers = 0;
    queue.async([&] { queue.async([&] { sentBeforeOthers = sent.size(); }); });
    queue.runPending();
    EXPECT_EQ(sent.size(), 5000U);
    EXPECT_LE(sentBeforeOthers, 2000U);
    EXPECT_GT(sentBeforeOthers, 0U);
}

TEST_F(ReplaySourceTest, EachChannelStartsAnewOnTheSharedFile)
{
    const auto file = recording({
        {0, 1},
        {5, 2}
    });
    replay(file, 1);
    queue.advance(10s);
    const auto first = std::move(source);
    replay(file, 1);
    queue.advance(10s);
    EXPECT_THAT(sent,
                ElementsAre(Sent{0ms, 1}, Sent{5000ms, 2}, Sent{10'000ms, 1}, Sent{15'000ms, 2}));
    EXPECT_EQ(file.use_count(), 3);
}

TEST_F(ReplaySourceTest, NothingComesAfterItsEnd)
{
    replay(recording({
               {0, 1},
               {5, 2}
    }),
           1);
    queue.runPending();
    source.reset();
    queue.advance(10s);
    EXPECT_THAT(marks(), ElementsAre(1));
}

} // namespace
} // namespace orvane
