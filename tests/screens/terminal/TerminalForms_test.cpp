// The filter, the save screen and alerts.

#include "screens/terminal/TerminalScreenTest.h"

#include "screens/toolkit/AlertView.h"

namespace orvane
{

namespace
{

using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;

using Kind = Key::Kind;

class TerminalFormsTest : public TerminalScreenTest
{
protected:
    TerminalFormsTest()
    {
        refresh({
            {"Serving Cell", dictionary({{"A", "1"}})},
            {"Bandwidth",    "20 MHz"                },
            {"Band",         "7"                     },
            {"Power",        "23 dBm"                }
        });
    }
    void paste(const std::string& text)
    {
        Key key = keyOfKind(Kind::Pasted);
        for (const char32_t character : decoded(text)) {
            key.character = character;
            press(key);
        }
    }
};

} // namespace

TEST_F(TerminalFormsTest, TheFilterNarrowsTheRowsWhileOneTypes)
{
    type("/b");
    EXPECT_EQ(device.text(23).substr(0, 10), " Filter: b");
    EXPECT_TRUE(device.shownCursor.isVisible);
    EXPECT_EQ(device.shownCursor.column, 10);
    EXPECT_THAT(device.text(1), HasSubstr("Bandwidth"));
    EXPECT_THAT(device.text(3), HasSubstr("23 dBm")) << "values count as well";
    type("and");
    EXPECT_THAT(device.text(2), HasSubstr("Band "));
    EXPECT_EQ(device.text(3), "");
    press(Kind::Backspace);
    press(Kind::Backspace);
    press(Kind::Backspace);
    EXPECT_THAT(device.text(3), HasSubstr("23 dBm"));
    press(Kind::Escape);
    EXPECT_THAT(device.text(1), HasSubstr("Serving Cell"));
    EXPECT_FALSE(device.shownCursor.isVisible);
}

TEST_F(TerminalFormsTest, AFilterThatIsKeptStaysThroughRefreshesUntilEscape)
{
    type("/band");
    press(Kind::Enter);
    EXPECT_THAT(device.text(22), EndsWith("\"band\" 1/2 of 4"));
    refresh({
        {"Serving Cell", dictionary({{"A", "1"}})},
        {"Band",         "8"                     },
        {"Band too",     "9"                     }
    });
    EXPECT_THAT(device.text(1), HasSubstr("Band "));
    EXPECT_THAT(device.text(2), HasSubstr("Band too"));
    EXPECT_EQ(device.text(3), "");
    press(Kind::Escape);
    EXPECT_THAT(device.text(1), HasSubstr("Serving Cell"));
}

TEST_F(TerminalFormsTest, EachPaneHasItsOwnFilter)
{
    type("/serving");
    press(Kind::Enter);
    press(Kind::Enter);
    EXPECT_THAT(device.text(1), HasSubstr("A")) << "not filtered";
    press(Kind::Left);
    EXPECT_THAT(device.text(22), EndsWith("\"serving\" 1/1 of 4"));
}

TEST_F(TerminalFormsTest, AFilterWithoutRowsSaysSo)
{
    type("/zzz");
    EXPECT_GE(device.lineOf("No row here has \"zzz\""), 0);
    press(Kind::Enter);
    press(Kind::Enter);
    press(Kind::Right);
    press(Kind::Down);
    EXPECT_THAT(device.text(22), EndsWith("\"zzz\" 0/0 of 4"));
}

TEST_F(TerminalFormsTest, AFilterWithoutRowsSaysThatItDoesNotLookInsideGroups)
{
    type("/A1");
    EXPECT_GE(device.lineOf("The filter does not look inside groups"), 0);
    press(Kind::Escape);
    EXPECT_EQ(device.lineOf("does not look inside"), -1);
    press(Kind::Enter);
    EXPECT_THAT(device.text(0), HasSubstr("Serving Cell"));
    type("/zzz");
    EXPECT_GE(device.lineOf("No row here has \"zzz\""), 0);
    EXPECT_EQ(device.lineOf("does not look inside"), -1) << "there are no groups";
}

TEST_F(TerminalFormsTest, ControlLDrawsTheScreenAgainWhereverOneIs)
{
    const Key redraw = keyOfCharacter('L' & 0x1F);
    type("/b");
    press(redraw);
    EXPECT_EQ(device.retakes, 1) << "in the filter";
    EXPECT_EQ(device.text(23).substr(0, 10), " Filter: b");
    press(Kind::Escape);
    type("?");
    press(redraw);
    EXPECT_EQ(device.retakes, 2) << "in the list of keys";
    EXPECT_THAT(device.text(0), HasSubstr("Keys"));
    press(Kind::Escape);
    type("s");
    press(redraw);
    EXPECT_EQ(device.retakes, 3) << "on the save screen";
    EXPECT_TRUE(saveView);
    screen->showAlert(std::make_unique<AlertView>("File Error", "No", "Close"));
    queue.runPending();
    press(redraw);
    EXPECT_EQ(device.retakes, 4) << "before an alert";
    EXPECT_TRUE(screen->alert());
}

TEST_F(TerminalFormsTest, LettersInTheFilterAreNoCommands)
{
    type("/qs?");
    EXPECT_EQ(quits, 0);
    EXPECT_FALSE(saveView);
    EXPECT_EQ(device.text(23).substr(0, 12), " Filter: qs?");
}

TEST_F(TerminalFormsTest, TheSaveScreenListsWhatWillBeSavedAndTakesADescription)
{
    type("s");
    ASSERT_TRUE(saveView);
    EXPECT_THAT(device.text(0), StartsWith(" Orvane › Save"));
    EXPECT_THAT(device.text(device.lineOf("Snapshot one")), EndsWith("✓"));
    type("q hé");
    paste("世\nx");
    EXPECT_EQ(saveView->saveDescription()->text(), "q hé世 x");
    EXPECT_THAT(device.text(device.lineOf("Description:")), HasSubstr("q hé世 x"));
    press(Kind::Home);
    press(Kind::Delete);
    EXPECT_EQ(saveView->saveDescription()->text(), " hé世 x");
}

TEST_F(TerminalFormsTest, EnterEndsTypingAndTheNextOneSaves)
{
    type("s");
    press(Kind::Enter);
    ASSERT_TRUE(saveView);
    EXPECT_FALSE(saveView->saveDescription()->isFirstResponder());
    EXPECT_TRUE(styleOf("[ Save ]").isSelected);
    press(Kind::Enter);
    EXPECT_FALSE(saveView) << "closed by the shell";
    ASSERT_TRUE(screen->alert()) << "nothing can be written here";
    EXPECT_GE(device.lineOf("File Error"), 0);
    EXPECT_GE(device.lineOf("Unable to write file to disk"), 0);
    press(Kind::Down);
    type("q");
    EXPECT_EQ(quits, 0) << "the alert has the keys";
    refresh({
        {"Band", "7"}
    });
    EXPECT_GE(device.lineOf("File Error"), 0) << "stays whatever goes on";
    press(Kind::Enter);
    EXPECT_FALSE(screen->alert());
    EXPECT_EQ(device.lineOf("File Error"), -1);
}

TEST_F(TerminalFormsTest, ControlZSuspendsWhateverIsInFront)
{
    press(keyOfCharacter('Z' & 0x1F));
    EXPECT_EQ(device.suspensions, 1);
    type("s");
    press(keyOfCharacter('Z' & 0x1F));
    EXPECT_EQ(device.suspensions, 2);
    EXPECT_EQ(saveView->saveDescription()->text(), "");
}

TEST_F(TerminalFormsTest, TabGoesRoundAndEscapeCancels)
{
    type("s");
    press(Kind::Tab);
    EXPECT_TRUE(styleOf("[ Save ]").isSelected);
    press(Kind::Tab);
    EXPECT_TRUE(styleOf("[ Cancel ]").isSelected);
    press(Kind::Tab);
    EXPECT_TRUE(saveView->saveDescription()->isFirstResponder());
    press(Kind::BackTab);
    EXPECT_TRUE(styleOf("[ Cancel ]").isSelected);
    press(Kind::Escape);
    EXPECT_FALSE(saveView);
    EXPECT_FALSE(screen->alert()) << "nothing was written";
}

TEST_F(TerminalFormsTest, ClicksReachButtonsTheFieldAndTheBackground)
{
    type("s");
    click(20, 40);
    EXPECT_FALSE(saveView->saveDescription()->isFirstResponder());
    click(device.lineOf("Description:"), 20);
    EXPECT_TRUE(saveView->saveDescription()->isFirstResponder());
    click(device.lineOf("[ Cancel ]"), 14);
    EXPECT_FALSE(saveView);
}

TEST_F(TerminalFormsTest, ARefreshDoesNotDisturbWhatIsBeingTyped)
{
    type("sabc");
    press(Kind::Left);
    refresh({
        {"Band", "9"}
    });
    type("x");
    EXPECT_EQ(saveView->saveDescription()->text(), "abxc");
}

TEST_F(TerminalFormsTest, WhereSavingIsNotOfferedTheKeyDoesNothing)
{
    isSavingOffered = false;
    refresh({
        {"Band", "7"}
    });
    type("s");
    EXPECT_FALSE(saveView);
    EXPECT_EQ(device.text(23), " / filter  ? keys  q quit");
}

TEST_F(TerminalFormsTest, TheSaveScreenFitsTheSmallestTerminal)
{
    resize(10, 40);
    type("s");
    EXPECT_GE(device.lineOf("Description:"), 0);
    EXPECT_GE(device.lineOf("Snapshot two"), 0);
    EXPECT_GE(device.lineOf("[ Save ]   [ Cancel ]"), 0);
    EXPECT_THAT(device.text(9), HasSubstr("Enter done"));
}

} // namespace orvane
