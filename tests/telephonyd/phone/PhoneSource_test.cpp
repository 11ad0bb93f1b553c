#include "telephonyd/phone/PhoneSource.h"

#include "doubles/ManualMainQueue.h"
#include "support/Recording.h"
#include "telephonyd/phone/Scenarios.h"

#include <gmock/gmock.h>

#include <map>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;
using Kind = PhoneMessage::Kind;

// Returns at each step the messages that a test has given it.
class WrittenScenario final : public Scenario
{
public:
    explicit WrittenScenario(std::map<int, std::vector<PhoneMessage>> messages)
        : _messages(std::move(messages))
    {
    }
    [[nodiscard]] std::string technology() const override { return "written"; }
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override
    {
        return _messages[static_cast<int>(now.count())];
    }

private:
    std::map<int, std::vector<PhoneMessage>> _messages;
};

class PhoneSourceTest : public testing::Test
{
protected:
    void start(std::unique_ptr<Scenario> scenario, const LogSelection& selection)
    {
        source = std::make_unique<PhoneSource>(queue, std::move(scenario));
        source->start(selection, [this](ByteView message) {
            messages.emplace_back(message.begin(), message.end());
            return false; // a live phone does not wait
        });
    }

    TestServices services;
    ManualMainQueue queue;
    std::unique_ptr<PhoneSource> source;
    std::vector<Bytes> messages;
};

TEST_F(PhoneSourceTest, LogMessagesGetAHeader)
{
    services.clock.now = 315964800 + 1.25e-3 * 0x0A0B; // steps of the timestamp
    start(std::make_unique<WrittenScenario>(std::map<int, std::vector<PhoneMessage>>{
              {0, {{Kind::Modem, 0xB0C2, {7, 8}}, {Kind::Server, 1, {9}}}}
    }),
          {{0xB0C2}, {1}});
    EXPECT_THAT(messages, IsEmpty()); // never from within start()
    queue.advance(PhoneSource::kStep);
    EXPECT_THAT(messages,
                ElementsAre(Bytes{1, 14, 0, 0xC2, 0xB0, 0, 0, 0x0B, 0x0A, 0, 0, 0, 0, 7, 8},
                            Bytes{0xFF, 13, 0, 1, 0, 0, 0, 0x0B, 0x0A, 0, 0, 0, 0, 9}));
    EXPECT_EQ(source->technology(), "written");
}

TEST_F(PhoneSourceTest, OnlyWhatWasAskedForIsSentModemAndServerApart)
{
    const std::vector<PhoneMessage> all = {
        {Kind::Modem,  1, {11}},
        {Kind::Server, 1, {12}},
        {Kind::Modem,  2, {21}},
        {Kind::Server, 2, {22}},
    };
    start(std::make_unique<WrittenScenario>(std::map<int, std::vector<PhoneMessage>>{
              {0, all}
    }),
          {{1}, {2}});
    queue.advance(1s);
    ASSERT_EQ(messages.size(), 2U);
    EXPECT_EQ(messages[0].back(), 11);
    EXPECT_EQ(messages[1].back(), 22);
}

TEST_F(PhoneSourceTest, ABareMessageIsSentAsItIsWhateverWasAskedFor)
{
    start(std::make_unique<WrittenScenario>(std::map<int, std::vector<PhoneMessage>>{
              {40, {{Kind::Bare, 0, {'<', '>'}}}}
    }),
          {});
    queue.advance(1s);
    EXPECT_THAT(messages, ElementsAre(Bytes{'<', '>'}));
}

TEST_F(PhoneSourceTest, OneMessageInFiftyIsWrapped)
{
    start(std::make_unique<WrittenScenario>(std::map<int, std::vector<PhoneMessage>>{
              {0, std::vector<PhoneMessage>(120, PhoneMessage{Kind::Modem, 1, {}})}
    }),
          {{1}, {}});
    queue.advance(1s);
    ASSERT_EQ(messages.size(), 120U);
    for (std::size_t i = 0; i < messages.size(); ++i) {
        const bool isWrapped = i % 50 == 49;
        EXPECT_EQ(messages[i].front(), isWrapped ? 0x81 : 1);
        EXPECT_EQ(messages[i].size(), isWrapped ? 15U : 13U);
        EXPECT_EQ(messages[i][isWrapped ? 2 : 0], 1);
    }
}

TEST_F(PhoneSourceTest, NothingComesAfterItsEnd)
{
    start(makeScenario("lte", 1), {{0xB17F}, {}});
    queue.advance(1s);
    const std::size_t before = messages.size();
    EXPECT_GT(before, 0U);
    source.reset();
    queue.advance(10s);
    EXPECT_EQ(messages.size(), before);
}

TEST_F(PhoneSourceTest, TimestampsCountStepsAndTheirFractionsFrom1980)
{
    EXPECT_EQ(logTimestamp(315964800), 0U);
    EXPECT_EQ(logTimestamp(315964801), std::uint64_t{800} << 16);
    EXPECT_EQ(logTimestamp(315964800 + 0.000625), 0x8000U);
    EXPECT_EQ(logTimestamp(1795255200), std::uint64_t{1479290400} * 800 << 16);
    EXPECT_EQ(logTimestamp(0), 0U);
    EXPECT_EQ(logTimestamp(1e30), 0U);
}

TEST_F(PhoneSourceTest, ScenariosAreFoundByName)
{
    EXPECT_THAT(scenarioNames(), testing::Contains("lte"));
    for (const std::string& name : scenarioNames()) {
        EXPECT_TRUE(makeScenario(name, 1)) << name;
        EXPECT_TRUE(phoneSourceFactory(name, queue)()) << name;
    }
    EXPECT_FALSE(makeScenario("no such", 1));
    EXPECT_FALSE(phoneSourceFactory("no such", queue)());
}

} // namespace
} // namespace orvane
