#include "app/CommandInterpreter.h"
#include "app/PrintingApp.h"

#include "doubles/FakePreferencesStore.h"
#include "doubles/LoopbackTransport.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "screens/print/JsonPrinter.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <filesystem>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;

constexpr const char* kNotOffered = "{\"error\":\"saving is not offered on this machine\"}\n";

// An application without a server, below a root of its own, and what it answers to commands.
class CommandInterpreterTest : public ::testing::Test
{
protected:
    void offerSaving()
    {
        std::filesystem::create_directories(files.located(kInstallMarker));
        std::filesystem::create_directories(files.located("/var/mobile/Library/Logs/DiagDrop"));
    }
    // The answers to the line, from an application that has just been launched.
    std::vector<std::string> answersTo(std::string_view line, bool wasCut = false)
    {
        answers.clear();
        PrintingApp app(
            {queue, ports, client, std::chrono::seconds(2), [] { return std::nullopt; }}, files,
            preferences, output);
        app.applicationDidFinishLaunching();
        answers.clear();
        CommandInterpreter commands(app, output, [this] { ++quits; });
        commands.takeLine(line, wasCut);
        return answers;
    }
    // The description in the file that the answer names.
    [[nodiscard]] static std::string savedDescription(const std::string& answer)
    {
        const std::string start = "{\"saved\":\"";
        EXPECT_THAT(answer, StartsWith(start));
        const auto file = readFile(answer.substr(start.size(), answer.rfind('"') - start.size()));
        return file ? readPropertyList(*file).value["Description"].description() : "(no file)";
    }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    FakePreferencesStore preferences;
    std::vector<std::string> answers;
    JsonPrinter output{[this](std::string_view line) { answers.emplace_back(line); }, false};
    int quits = 0;
};

} // namespace

TEST_F(CommandInterpreterTest, QuitEndsTheProgramWithoutAnAnswer)
{
    EXPECT_THAT(answersTo("quit"), IsEmpty());
    EXPECT_EQ(quits, 1);
}

TEST_F(CommandInterpreterTest, EmptyLinesArePassedOver)
{
    EXPECT_THAT(answersTo(""), IsEmpty());
    EXPECT_THAT(answersTo("\r"), IsEmpty());
    EXPECT_EQ(quits, 0);
}

TEST_F(CommandInterpreterTest, ALineMayEndInACarriageReturn)
{
    EXPECT_THAT(answersTo("quit\r"), IsEmpty());
    EXPECT_EQ(quits, 1);
    offerSaving();
    const auto saved = answersTo("save at the mill\r");
    ASSERT_EQ(saved.size(), 1U);
    EXPECT_EQ(savedDescription(saved[0]), "at the mill");
}

TEST_F(CommandInterpreterTest, ALineThatWasCutIsNotObeyed)
{
    offerSaving();
    for (const char* line : {"quit", "save x", "nonsense"})
        EXPECT_THAT(answersTo(line, true), ElementsAre("{\"error\":\"the line is too long\"}\n"));
    EXPECT_EQ(quits, 0);
}

TEST_F(CommandInterpreterTest, OtherWordsAreAnsweredWithWhatThereIs)
{
    offerSaving();
    for (const std::string line : {"savex", "Save", " save", "quit now", "dance"})
        EXPECT_THAT(answersTo(line),
                    ElementsAre("{\"error\":\"unknown command \\\"" + line +
                                "\\\": the commands are save DESCRIPTION and quit\"}\n"));
    EXPECT_EQ(quits, 0);
}

TEST_F(CommandInterpreterTest, SaveAloneSavesWithAnEmptyDescription)
{
    offerSaving();
    for (const char* line : {"save", "save "}) {
        const auto saved = answersTo(line);
        ASSERT_EQ(saved.size(), 1U);
        EXPECT_EQ(savedDescription(saved[0]), "");
    }
}

TEST_F(CommandInterpreterTest, ADescriptionIsTakenAsTypedWhereAFileCanHoldIt)
{
    offerSaving();
    const auto blanks = answersTo("save  two blanks ");
    ASSERT_EQ(blanks.size(), 1U);
    EXPECT_EQ(savedDescription(blanks[0]), " two blanks ");
    const auto bell = answersTo("save a\abell");
    ASSERT_EQ(bell.size(), 1U);
    EXPECT_EQ(savedDescription(bell[0]), "a bell");
}

TEST_F(CommandInterpreterTest, SavingWhereItIsNotOfferedIsAnswered)
{
    EXPECT_THAT(answersTo("save"), ElementsAre(kNotOffered));
    EXPECT_THAT(answersTo("save x"), ElementsAre(kNotOffered));
}

} // namespace orvane
