#include "telephonyd/TypedMessages.h"

#include "doubles/ManualMainQueue.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

TEST(TypedLineTest, ALineIsALogCodeAndBytes)
{
    const struct {
        const char* line;
        std::uint32_t code;
        Bytes payload;
    } cases[] = {
        {"0xB0C2 01 ff Ab",       0xB0C2,   {0x01, 0xFF, 0xAB}},
        {"0xB0C2 01ffAb",         0xB0C2,   {0x01, 0xFF, 0xAB}},
        {"  0XB0C2\t01  ff ab\r", 0xB0C2,   {0x01, 0xFF, 0xAB}},
        {"45250 00",              0xB0C2,   {0x00}            },
        {"0xB0C2",                0xB0C2,   {}                },
        {"0",                     0,        {}                },
        {"0xFFFF 07",             0xFFFF,   {0x07}            },
        {"0xFF0000 3C",           0xFF0000, {0x3C}            },
        {"0xFFFFFF 3C",           0xFFFFFF, {0x3C}            },
    };
    for (const auto& each : cases) {
        const TypedLine typed = parseTypedLine(each.line);
        ASSERT_TRUE(typed.message) << each.line << ": " << typed.error;
        EXPECT_EQ(typed.message->code, each.code) << each.line;
        EXPECT_EQ(typed.message->payload, each.payload) << each.line;
        EXPECT_EQ(typed.error, "") << each.line;
    }
}

TEST(TypedLineTest, EmptyLinesAndCommentsAreNeitherMessagesNorMistakes)
{
    for (const char* line : {"", "  \t\r", "# 0xB0C2 01", "  #"}) {
        const TypedLine typed = parseTypedLine(line);
        EXPECT_FALSE(typed.message) << line;
        EXPECT_EQ(typed.error, "") << line;
    }
}

TEST(TypedLineTest, AMistakeIsNamed)
{
    const struct {
        const char* line;
        const char* error;
    } cases[] = {
        {"B0C2 01",                "not with \"B0C2\""     },
        {"0x 01",                  "not with \"0x\""       },
        {"0x10000 01",             "not with \"0x10000\""  },
        {"0xFEFFFF 01",            "not with \"0xFEFFFF\"" },
        {"0x1000000 01",           "not with \"0x1000000\""},
        {"99999999999 01",         "not with \"999"        },
        {"-1 01",                  "not with \"-1\""       },
        {"\x1B[2J",                "not with \"?[2J\""     },
        {"0xB0C2 0xF5",            "digits, not \"0xF5\""  },
        {"0xB0C2 01 0",            "digits, not \"0\""     },
        {"0xB0C2 01 0 1",          "digits, not \"0\""     },
        {"0xB0C2 01 \xC3\xA4\x7F", "digits, not \"???\""   },
    };
    for (const auto& each : cases) {
        const TypedLine typed = parseTypedLine(each.line);
        EXPECT_FALSE(typed.message) << each.line;
        EXPECT_THAT(typed.error, HasSubstr(each.error));
    }
}

TEST(TypedLineTest, AMessageFitsIntoItsLengthField)
{
    const auto line = [](std::size_t bytes) { return "1 " + std::string(2 * bytes, '0'); };
    EXPECT_TRUE(parseTypedLine(line(65523)).message);
    EXPECT_FALSE(parseTypedLine(line(65524)).message);
    EXPECT_EQ(parseTypedLine(line(65524)).error, "a message has at most 65523 bytes");
}

class TypedMessagesTest : public testing::Test
{
protected:
    struct Viewer {
        std::unique_ptr<LogSource> source;
        std::vector<Bytes> messages;
    };
    std::unique_ptr<Viewer> viewer(LogSelection selection)
    {
        auto made = std::make_unique<Viewer>();
        made->source = typed->sources()();
        made->source->start(selection, [viewer = made.get()](ByteView message) {
            viewer->messages.emplace_back(message.begin(), message.end());
            return true;
        });
        return made;
    }
    static std::vector<std::uint8_t> lastBytes(const Viewer& viewer)
    {
        std::vector<std::uint8_t> bytes;
        for (const Bytes& message : viewer.messages)
            bytes.push_back(message.back());
        return bytes;
    }

    ManualMainQueue queue;
    std::vector<std::string> told;
    std::unique_ptr<TypedMessages> typed = std::make_unique<TypedMessages>(
        "a technology", queue, [this](const std::string& text) { told.push_back(text); });
};

TEST_F(TypedMessagesTest, AMessageIsTheTypedBytesBehindAHeader)
{
    const auto one = viewer({{0xB0C2}, {2}});
    EXPECT_EQ(one->source->technology(), "a technology");
    queue.runPending();
    typed->take("0xB0C2 DD 00");
    typed->take("0xFF0002 3C");
    ASSERT_EQ(one->messages.size(), 2U);
    Bytes message = one->messages[0];
    ASSERT_EQ(message.size(), 15U);
    std::fill_n(message.begin() + 5, 8, 0); // the time
    EXPECT_EQ(message, (Bytes{1, 14, 0, 0xC2, 0xB0, 0, 0, 0, 0, 0, 0, 0, 0, 0xDD, 0}));
    message = one->messages[1];
    ASSERT_EQ(message.size(), 14U);
    std::fill_n(message.begin() + 5, 8, 0);
    EXPECT_EQ(message, (Bytes{0xFF, 13, 0, 2, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0x3C}));
}

TEST_F(TypedMessagesTest, AViewerGetsWhatWasTypedBeforeItStartedAndAfter)
{
    typed->take("0xB0C2 01");
    typed->take("0xB0C1 02");
    const auto one = viewer({{0xB0C2}, {}});
    EXPECT_THAT(one->messages, IsEmpty()); // never from within start()
    queue.runPending();
    typed->take("0xB0C2 03");
    EXPECT_THAT(lastBytes(*one), ElementsAre(1, 3));
    EXPECT_THAT(told,
                ElementsAre("0xB0C2: kept for the first viewer that starts",
                            "0xB0C1: kept for the first viewer that starts", "a viewer has started",
                            "0xB0C2: sent to it", "0xB0C1: not sent, it does not ask for this code",
                            "0xB0C2: sent to 1 viewer"));
}

TEST_F(TypedMessagesTest, EachViewerGetsTheCodesThatItAsksFor)
{
    const auto one = viewer({{0xB0C2}, {}});
    const auto other = viewer({
        {0xB0C2,    0xB0C1},
        {         }
    });
    queue.runPending();
    told.clear();
    typed->take("0xB0C2 01");
    typed->take("0xB0C1 02");
    typed->take("0xB0C0 03");
    EXPECT_THAT(lastBytes(*one), ElementsAre(1));
    EXPECT_THAT(lastBytes(*other), ElementsAre(1, 2));
    EXPECT_THAT(told, ElementsAre("0xB0C2: sent to 2 viewers", "0xB0C1: sent to 1 viewer",
                                  "0xB0C0: not sent, no viewer asks for this code"));
}

TEST_F(TypedMessagesTest, ALineThatIsNotAMessageIsToldAndSendsNothing)
{
    const auto one = viewer({{0xB0C2}, {}});
    queue.runPending();
    told.clear();
    typed->take("lamp 01");
    typed->take("# a comment");
    EXPECT_THAT(one->messages, IsEmpty());
    EXPECT_THAT(told, ElementsAre(HasSubstr("not with \"lamp\"")));
}

TEST_F(TypedMessagesTest, TheOldestMessagesGoWhenTheKeptOnesGrowTooLarge)
{
    const std::string bytes(2 * 60000, '0');
    constexpr std::size_t kFit = TypedMessages::kKeptBytes / 60001;
    for (std::size_t i = 0; i < kFit; ++i)
        typed->take("0xB0C2 " + bytes + "01");
    typed->take("0xB0C2 " + bytes + "02");
    const auto one = viewer({{0xB0C2}, {}});
    queue.runPending();
    std::vector<std::uint8_t> expected(kFit, 1);
    expected.back() = 2;
    EXPECT_EQ(lastBytes(*one), expected);
}

TEST_F(TypedMessagesTest, AViewerThatHasEndedIsForgotten)
{
    auto one = viewer({{0xB0C2}, {}});
    auto never = viewer({{0xB0C2}, {}});
    never.reset(); // before its start was served
    queue.runPending();
    one.reset();
    told.clear();
    typed->take("0xB0C2 01");
    EXPECT_THAT(told, ElementsAre("0xB0C2: kept for the first viewer that starts"));
}

TEST_F(TypedMessagesTest, ASourceOutlivesTheTypingAndIsSilent)
{
    typed->take("0xB0C2 01");
    const auto one = viewer({{0xB0C2}, {}});
    const LogSourceFactory sources = typed->sources();
    typed.reset();
    queue.runPending();
    EXPECT_EQ(one->source->technology(), "a technology");
    EXPECT_EQ(sources()->technology(), "a technology");
}

} // namespace
} // namespace orvane
