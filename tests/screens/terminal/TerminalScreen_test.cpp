#include "platform/base/PropertyValue.h"
#include "screens/terminal/TerminalScreenTest.h"

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

using Kind = Key::Kind;

class TerminalBrowsingTest : public TerminalScreenTest
{
protected:
    TerminalBrowsingTest()
    {
        refresh({
            {"Serving Cell", dictionary({{"Cell Identity", "1234"}, {"PCI", "7"}})},
            {"Bandwidth",    "20 MHz"                                             },
            {"Empty",        PropertyValue::newDictionary()                       }
        });
    }
};

class SmallTerminalTest : public TerminalScreenTest
{
protected:
    SmallTerminalTest() : TerminalScreenTest(10, 40) { refresh(numberedRows(20)); }
};

class WideTerminalTest : public TerminalScreenTest
{
protected:
    WideTerminalTest() : TerminalScreenTest(50, 200) {}
};

} // namespace

TEST_F(TerminalScreenTest, BeforeAnyDataItSaysWhatIsWaitedForAndWhatToDo)
{
    EXPECT_THAT(device.text(0), StartsWith(" Orvane"));
    EXPECT_THAT(device.text(0), EndsWith("simulated phone"));
    EXPECT_GE(device.lineOf("Waiting for the telephony server"), 0);
    EXPECT_GE(device.lineOf("Start the server."), 0);
    EXPECT_EQ(device.text(22), " ⠋ Connecting");
    EXPECT_EQ(device.text(23), " s save  ? keys  q quit");
}

TEST_F(TerminalScreenTest, TheBusyIndicatorTurnsUntilItStops)
{
    queue.advance(150ms);
    EXPECT_EQ(device.text(22), " ⠙ Connecting");
    queue.advance(1500ms);
    EXPECT_EQ(device.text(22), " ⠙ Connecting") << "full circle";
    root->setStatus("Updated now", false);
    queue.runPending();
    EXPECT_EQ(device.text(22), " Updated now");
    EXPECT_EQ(queue.waitingTasks(), 0U) << "nothing turns any more";
}

TEST_F(TerminalScreenTest, AnEmptyPaneThatWaitsForNothingSaysSo)
{
    refresh({});
    EXPECT_GE(device.lineOf("No data yet"), 0);
    EXPECT_EQ(device.lineOf("Waiting"), -1);
}

TEST_F(TerminalScreenTest, WithoutBeautifulCharactersThoseOfAnyTerminalDo)
{
    device.isBeautiful = false;
    queue.advance(150ms);
    EXPECT_EQ(device.text(22), " / Connecting");
    refresh({
        {"Group", dictionary({{"A", "1"}})}
    });
    EXPECT_THAT(device.text(1), EndsWith(">"));
}

TEST_F(TerminalBrowsingTest, KeysAreAtTheLeftAndValuesFlushRight)
{
    EXPECT_EQ(device.text(2), " Bandwidth" + std::string(63, ' ') + "20 MHz");
    EXPECT_EQ(device.text(1), " Serving Cell" + std::string(65, ' ') + "›");
    EXPECT_EQ(styleOf("Bandwidth").ink, Ink::Key);
    EXPECT_EQ(styleOf("20 MHz").ink, Ink::Plain);
}

TEST_F(TerminalBrowsingTest, EnterOpensAGroupAndLeftLeadsBack)
{
    EXPECT_THAT(selected(), HasSubstr("Serving Cell"));
    press(Kind::Enter);
    EXPECT_THAT(device.text(0), StartsWith(" Orvane › Serving Cell "));
    EXPECT_THAT(device.text(1), HasSubstr("Cell Identity"));
    EXPECT_THAT(device.text(22), StartsWith(" Updated now")) << "starts as its parent";
    press(Kind::Left);
    EXPECT_THAT(device.text(0), Not(HasSubstr("Serving Cell")));
    press(Kind::Left);
    EXPECT_EQ(navigation->viewControllers().size(), 1U) << "the root stays";
}

TEST_F(TerminalBrowsingTest, TheLettersDoAsTheArrowsAndEscapeAndBackspaceLeadBack)
{
    type("jk");
    EXPECT_THAT(selected(), HasSubstr("Serving Cell"));
    type("l");
    EXPECT_EQ(navigation->viewControllers().size(), 2U);
    type("h");
    EXPECT_EQ(navigation->viewControllers().size(), 1U);
    for (const Kind kind : {Kind::Escape, Kind::Backspace}) {
        press(Kind::Right);
        EXPECT_EQ(navigation->viewControllers().size(), 2U);
        press(kind);
        EXPECT_EQ(navigation->viewControllers().size(), 1U);
    }
}

TEST_F(TerminalBrowsingTest, KeysTypedAheadMeetThePaneThatTheyWereMeantFor)
{
    for (const Kind kind : {Kind::Enter, Kind::Down})
        device.keys.push_back(keyOfKind(kind));
    screen->inputIsReady();
    EXPECT_THAT(selected(), HasSubstr("PCI"));
}

TEST_F(TerminalBrowsingTest, AValueOpensNothing)
{
    press(Kind::Down);
    press(Kind::Enter);
    press(Kind::Right);
    EXPECT_EQ(navigation->viewControllers().size(), 1U);
    EXPECT_THAT(selected(), HasSubstr("Bandwidth"));
}

TEST_F(TerminalBrowsingTest, TheSelectionOfAPaneIsThereAfterComingBack)
{
    press(Kind::Enter);
    press(Kind::Down);
    refresh({
        {"New",          "1"                                                               },
        {"Serving Cell", dictionary({{"First", "0"}, {"Cell Identity", "1"}, {"PCI", "7"}})}
    });
    EXPECT_THAT(selected(), HasSubstr("PCI"));
    press(Kind::Left);
    EXPECT_THAT(selected(), HasSubstr("Serving Cell"));
}

TEST_F(TerminalBrowsingTest, ARefreshKeepsTheSelectionByName)
{
    press(Kind::Down);
    refresh({
        {"New",          "1"           },
        {"Serving Cell", dictionary({})},
        {"Bandwidth",    "10 MHz"      }
    });
    EXPECT_THAT(selected(), HasSubstr("Bandwidth"));
    refresh({
        {"New", "1"}
    });
    EXPECT_THAT(selected(), HasSubstr("New")) << "the nearest where it has gone";
}

TEST_F(TerminalBrowsingTest, ChangedValuesAreMarkedUntilTheNextRefresh)
{
    press(Kind::Enter);
    refresh({
        {"Serving Cell", dictionary({{"Cell Identity", "5678"}, {"PCI", "7"}})}
    });
    EXPECT_EQ(styleOf("5678").ink, Ink::Changed);
    EXPECT_EQ(device.shown.at(2, 78).style.ink, Ink::Plain);
    refresh({
        {"Serving Cell", dictionary({{"Cell Identity", "5678"}, {"PCI", "8"}})}
    });
    EXPECT_EQ(styleOf("5678").ink, Ink::Plain);
    EXPECT_EQ(device.shown.at(2, 78).style.ink, Ink::Changed);
}

TEST_F(TerminalBrowsingTest, MarksFadeWhereNoRefreshComes)
{
    press(Kind::Enter);
    refresh({
        {"Serving Cell", dictionary({{"Cell Identity", "5678"}, {"PCI", "7"}})}
    });
    resize(24, 70);
    EXPECT_EQ(styleOf("5678").ink, Ink::Changed) << "another size is no refresh";
    queue.advance(4900ms);
    EXPECT_EQ(styleOf("5678").ink, Ink::Changed);
    queue.advance(200ms);
    EXPECT_EQ(styleOf("5678").ink, Ink::Plain);
}

TEST_F(TerminalBrowsingTest, ValuesThatChangedInAPaneBelowAreMarkedWhenItIsSeenAgain)
{
    const auto cell = dictionary({
        {"Cell Identity", "1234"},
        {"PCI",           "7"   }
    });
    press(Kind::Enter);
    refresh({
        {"Serving Cell", cell    },
        {"Bandwidth",    "10 MHz"}
    });
    press(Kind::Left);
    EXPECT_EQ(styleOf("10 MHz").ink, Ink::Changed);
    press(Kind::Enter);
    refresh({
        {"Serving Cell", cell    },
        {"Bandwidth",    "10 MHz"}
    });
    press(Kind::Left);
    EXPECT_EQ(styleOf("10 MHz").ink, Ink::Plain) << "not by the latest refresh";
}

TEST_F(TerminalBrowsingTest, APaneWhosePathIsGoneIsLeft)
{
    press(Kind::Enter);
    refresh({
        {"Other", "1"}
    });
    EXPECT_THAT(device.text(0), Not(HasSubstr("Serving Cell")));
    EXPECT_THAT(device.text(1), HasSubstr("Other"));
}

TEST_F(TerminalBrowsingTest, AClickOpensAndOneOnThePathLeadsBack)
{
    click(1, 5);
    EXPECT_EQ(navigation->viewControllers().size(), 2U);
    click(0, 2);
    EXPECT_EQ(navigation->viewControllers().size(), 1U);
    click(2, 5);
    EXPECT_THAT(selected(), HasSubstr("Bandwidth"));
    click(15, 5);
    click(23, 79);
    EXPECT_EQ(navigation->viewControllers().size(), 1U) << "nothing is there";
}

TEST_F(TerminalBrowsingTest, AClickOnAKeyAtTheFootPressesIt)
{
    const std::string foot = device.text(23);
    click(23, static_cast<int>(foot.find("quit")));
    EXPECT_EQ(quits, 1);
}

TEST_F(TerminalBrowsingTest, QuitAndHangUpEndTheProgram)
{
    type("q");
    EXPECT_EQ(quits, 1);
    device.isHungUp = true;
    screen->inputIsReady();
    EXPECT_EQ(quits, 2);
}

TEST_F(TerminalBrowsingTest, TheListOfKeysOpensAndCloses)
{
    type("?");
    EXPECT_THAT(device.text(0), StartsWith(" Keys"));
    EXPECT_GE(device.lineOf("filter as you type"), 0);
    EXPECT_EQ(device.lineOf("play, pause"), -1) << "only with a recording";
    type("q");
    EXPECT_EQ(quits, 0);
    EXPECT_THAT(device.text(0), StartsWith(" Orvane"));
}

TEST_F(TerminalBrowsingTest, TheListOfKeysHasOnlyKeysThatDoSomethingNow)
{
    const auto keysNow = [this] {
        type("?");
        const std::string keys = device.screen();
        press(Kind::Escape);
        return keys;
    };
    isSavingOffered = true;
    refresh({
        {"Group", dictionary({{"A", "1"}})},
        {"Band",  "7"                     }
    });
    EXPECT_THAT(keysNow(), AllOf(HasSubstr("save a snapshot"), HasSubstr("open the row"),
                                 HasSubstr("a row up, down"), HasSubstr("filter as you type")));
    EXPECT_THAT(keysNow(), Not(AnyOf(HasSubstr(" back\n"), HasSubstr("scroll a long value"),
                                     HasSubstr("all rows"), HasSubstr("stop reading"))));
    type("/band");
    press(Kind::Enter);
    EXPECT_THAT(keysNow(), HasSubstr("all rows"));
    EXPECT_THAT(keysNow(), Not(AnyOf(HasSubstr("open the row"), HasSubstr("a row up, down"))));
    press(Kind::Escape);
    press(Kind::Home);
    press(Kind::Enter);
    EXPECT_THAT(keysNow(), HasSubstr(" back\n"));
    press(Kind::Left);

    isSavingOffered = false;
    refresh({
        {"Group",          dictionary({{"A", "1"}})},
        { "Band", std::string(200,                     '7')}
    });
    EXPECT_THAT(keysNow(), HasSubstr("scroll a long value"));
    EXPECT_THAT(keysNow(), Not(HasSubstr("save a snapshot")));

    refresh({});
    EXPECT_THAT(keysNow(), Not(HasSubstr("filter as you type")));
    EXPECT_THAT(keysNow(), AllOf(HasSubstr("these keys"), HasSubstr("quit")));
}

TEST_F(TerminalBrowsingTest, ControlLDrawsEverythingAnew)
{
    press(keyOfCharacter('L' & 0x1F));
    EXPECT_EQ(device.retakes, 1);
}

TEST_F(TerminalBrowsingTest, TextsOfTheNetworkDoNotReachTheTerminalAsCommands)
{
    refresh({
        {"\x1b[31mGroup", dictionary({})             },
        {"Operator",      "\x1b[2J\x07"
                     "Evil\u009b"}
    });
    for (int line = 0; line < device.shown.lines(); ++line)
        for (const char32_t character : decoded(device.text(line)))
            EXPECT_TRUE(character >= 0x20 && (character < 0x7F || character >= 0xA0));
    EXPECT_GE(device.lineOf("Evil"), 0);
}

TEST_F(SmallTerminalTest, RowsScrollWithTheSelection)
{
    EXPECT_THAT(device.text(1), HasSubstr("Row 0 "));
    EXPECT_THAT(device.text(8), EndsWith("1/20"));
    for (int i = 0; i < 7; ++i)
        press(Kind::Down);
    EXPECT_THAT(device.text(1), HasSubstr("Row 1 "));
    EXPECT_THAT(device.text(7), HasSubstr("Row 7 "));
    press(Kind::PageDown);
    EXPECT_THAT(selected(), HasSubstr("Row 13"));
    press(Kind::End);
    EXPECT_THAT(device.text(7), HasSubstr("Row 19"));
    EXPECT_THAT(device.text(8), EndsWith("20/20"));
    press(Kind::PageUp);
    EXPECT_THAT(selected(), HasSubstr("Row 13"));
    press(Kind::Home);
    EXPECT_THAT(device.text(1), HasSubstr("Row 0 "));
}

TEST_F(SmallTerminalTest, TheWheelMovesTheRowsAndTheSelectionStaysInView)
{
    press(Kind::WheelDown);
    EXPECT_THAT(device.text(1), HasSubstr("Row 3 "));
    EXPECT_THAT(selected(), HasSubstr("Row 3 "));
    press(Kind::WheelUp);
    press(Kind::WheelUp);
    EXPECT_THAT(device.text(1), HasSubstr("Row 0 "));
    EXPECT_THAT(selected(), HasSubstr("Row 3 "));
}

TEST_F(SmallTerminalTest, ARefreshKeepsWhatIsInView)
{
    press(Kind::PageDown);
    press(Kind::PageDown);
    press(Kind::Up);
    const std::string before = device.screen();
    refresh(numberedRows(20));
    EXPECT_EQ(device.screen(), before);
    auto rows = numberedRows(20);
    rows.insert(rows.begin(), {"Before", "all"});
    refresh(rows);
    EXPECT_THAT(selected(), HasSubstr("Row 11"));
    EXPECT_EQ(device.lineOf("Row 11"), 6) << "on the same line as before";
}

TEST_F(SmallTerminalTest, AnotherSizeIsFollowedAtOnce)
{
    press(Kind::End);
    resize(24, 100);
    EXPECT_THAT(device.text(1), HasSubstr("Row 0 "));
    EXPECT_THAT(selected(), HasSubstr("Row 19"));
    EXPECT_EQ(columnsOf(device.text(1)), 99) << "values at the new edge";
    for (const auto& [lines, columns] : {std::pair(1, 1), std::pair(2, 5), std::pair(3, 200)})
        resize(lines, columns);
    resize(10, 40);
    EXPECT_THAT(selected(), HasSubstr("Row 19"));
}

TEST_F(SmallTerminalTest, APathThatIsTooLongIsShortenedFromTheLeft)
{
    const auto inner = dictionary({
        {"Inner group", dictionary({{"A", "1"}})}
    });
    refresh({
        {"A group of a long name", inner}
    });
    press(Kind::Enter);
    press(Kind::Enter);
    EXPECT_EQ(device.text(0), " … › Inner group              simulated");
}

TEST_F(SmallTerminalTest, ALongValueIsScrolledSideways)
{
    refresh({
        {"Key", "a value that is much too long for a terminal of forty columns"}
    });
    EXPECT_THAT(device.text(1), EndsWith("…"));
    EXPECT_THAT(device.text(9), HasSubstr("→ more"));
    press(Kind::Right);
    EXPECT_THAT(device.text(1), StartsWith("…"));
    const std::string scrolled = device.text(1);
    refresh({
        {"Key", "a value that is much too long for a terminal of forty columns"}
    });
    EXPECT_EQ(device.text(1), scrolled) << "stays through a refresh";
    press(Kind::Right);
    EXPECT_THAT(device.text(1), EndsWith("forty columns"));
    press(Kind::Right);
    EXPECT_THAT(device.text(1), EndsWith("forty columns"));
    for (int i = 0; i < 3; ++i)
        press(Kind::Left);
    EXPECT_THAT(device.text(1), StartsWith(" Key     a value"));
}

TEST_F(SmallTerminalTest, WideCharactersTakeTheirColumns)
{
    refresh({
        {"運営者", "世界電話"       },
        {"Combined",  "Te\u0301le\u0301com"}
    });
    EXPECT_EQ(device.text(1), " 運営者" + std::string(24, ' ') + "世界電話");
    EXPECT_EQ(columnsOf(device.text(2)), 39);
}

TEST_F(WideTerminalTest, ValuesStayNearTheirKeysUnlessAValueNeedsTheWidth)
{
    refresh({
        {"Key", "value"}
    });
    EXPECT_EQ(columnsOf(device.text(1)), 99);
    refresh({
        {"Key",            "value"},
        { "Long", std::string(150,    'x')}
    });
    EXPECT_EQ(columnsOf(device.text(1)), 199);
    EXPECT_THAT(device.text(2), Not(HasSubstr("…")));
}

TEST_F(WideTerminalTest, AThousandRowsAndMoreShowTheirValues)
{
    auto rows = numberedRows(3000);
    rows[1500].second = dictionary({
        {"A", "1"}
    });
    refresh(rows);
    refresh(rows);
    press(Kind::End);
    EXPECT_THAT(selected(), HasSubstr("value 2999"));
    type("/value 1499");
    EXPECT_THAT(device.text(1), HasSubstr("value 1499"));
}

} // namespace orvane
