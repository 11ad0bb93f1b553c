// `telephonyd --port` with a modem on a pseudo-terminal, and viewers beside it.

#include "modems/ModemTest.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>

namespace orvane
{
namespace
{

using testing::AllOf;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

constexpr const char* kLteCodes = R"(["0xB0C1", "0xB0C2", "0xB179", "0xB17F", "0xB180", "0xB186"])";
constexpr const char* kRow = "\"name\":\"Physical Cell ID\"";

// The display in a line of JSON, without what follows it there.
std::string treeIn(const std::string& line)
{
    const auto begin = line.find("\"tree\":");
    if (begin == std::string::npos)
        return "";
    const auto time = line.rfind(",\"time\":\"");
    return line.substr(begin, (time == std::string::npos ? line.size() - 1 : time) - begin);
}

class DiagnosticPortTest : public ModemTest
{
protected:
    // What the recording shows at its end.
    static std::string lastTreeOf(const std::string& recording)
    {
        ChildProcess program(
            {ORVANE_PROGRAM, "open", testDataPath(recording), "--ui", "json", "--log", "none"});
        EXPECT_EQ(program.waitForEnd(), 0);
        return program.lines().empty() ? "" : treeIn(program.lines().back());
    }
    bool showsTree(const std::string& tree)
    {
        const auto program = viewer();
        const bool shows =
            program->waitForLine([&](const std::string& line) { return treeIn(line) == tree; })
                .has_value();
        EXPECT_TRUE(shows) << program->lines().back() << "\ninstead of\n" << tree;
        return shows;
    }
};

struct Recorded {
    const char* technology;
    const char* recording;
};

class RecordedModemTest : public DiagnosticPortTest, public ::testing::WithParamInterface<Recorded>
{
};

TEST_P(RecordedModemTest, ShowsTheRowsThatTheReplayedRecordingShows)
{
    const std::string tree = lastTreeOf(GetParam().recording);
    ASSERT_THAT(tree, HasSubstr("\"children\""));
    const auto replay =
        telephonyd({"--replay", testDataPath(GetParam().recording), "--speed", "max"});
    ASSERT_TRUE(replay->waitForError("Serving in"));
    EXPECT_TRUE(showsTree(tree));
    expectNormalEnd(*replay);

    const PretendModem phone = modem(GetParam().recording, {"--speed", "max"});
    const auto server = serve(phone, {"--technology", GetParam().technology});
    EXPECT_TRUE(showsTree(tree));
    expectNormalEnd(*server);
    EXPECT_EQ(phone.codes(), "[]");
}

// Those whose log codes are of one group: the modem begins to play with the first mask.
INSTANTIATE_TEST_SUITE_P(Technologies, RecordedModemTest,
                         ::testing::Values(Recorded{"lte", "lte-drive.dlf"},
                                           Recorded{"utran", "utran-walk.dlf"},
                                           Recorded{"cdma", "cdma-evening.dlf"}),
                         [](const auto& each) { return std::string(each.param.technology); });

TEST_F(DiagnosticPortTest, ExactlyTheViewersCodesAreSwitchedOnAndTheLastViewerSwitchesThemOff)
{
    const PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop"});
    const auto server = serve(phone);
    EXPECT_EQ(phone.codes(), "[]");
    auto first = viewer();
    ASSERT_TRUE(first->waitForText(kRow));
    EXPECT_EQ(phone.codes(), kLteCodes);
    const auto second = viewer();
    ASSERT_TRUE(second->waitForText(kRow));
    expectNormalEnd(*first);
    // A row that was not shown before shows that items still come.
    const std::string shown = treeIn(second->lines().back());
    EXPECT_TRUE(second->waitForLine(
        [&](const std::string& line) { return !treeIn(line).empty() && treeIn(line) != shown; }));
    EXPECT_EQ(phone.codes(), kLteCodes);
    expectNormalEnd(*second);
    EXPECT_TRUE(phone.waitForCodes("[]"));
    expectNormalEnd(*server);
}

TEST_F(DiagnosticPortTest, TheTechnologyIsFoundOutWhenNotNamed)
{
    for (const char* recording : {"lte-drive.dlf", "umts-city.dlf"}) {
        const PretendModem phone = modem(recording, {"--speed", "20", "--loop"});
        const auto server = serve(phone, {});
        const auto program = viewer();
        EXPECT_TRUE(program->waitForText("\"children\":[{")) << recording << program->errors();
        expectNormalEnd(*server);
        EXPECT_EQ(phone.codes(), "[]");
    }
}

TEST_F(DiagnosticPortTest, SignalsLeaveTheModemAsItWasFound)
{
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        const PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop"});
        const auto server = serve(phone);
        const auto program = viewer();
        ASSERT_TRUE(program->waitForText(kRow));
        EXPECT_EQ(phone.codes(), kLteCodes);
        server->sendSignal(signal);
        EXPECT_EQ(server->waitForEnd(), 0);
        EXPECT_EQ(phone.codes(), "[]") << signal;
        EXPECT_TRUE(program->waitForText(R"("status":"Connecting...","loading":true)"));
    }
}

TEST_F(DiagnosticPortTest, MasksThatAKilledServerLeftAreClearedAtTheNextStart)
{
    PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop"});
    // Killed after each thing that the modem was asked or did until the codes are on.
    for (std::size_t moment = 1; moment <= 6; ++moment) {
        const std::size_t before = phone.trace().size();
        {
            const auto server = telephonyd({"--port", phone.path(), "--technology", "lte"});
            const auto program = viewer();
            EXPECT_TRUE(
                PretendModem::waitUntil([&] { return phone.trace().size() >= before + moment; }));
            server->sendSignal(SIGKILL);
            EXPECT_EQ(server->waitForEnd(), -SIGKILL);
        }
        phone.process().sendSignal(SIGUSR1);
        const auto next = serve(phone);
        EXPECT_TRUE(phone.waitForCodes("[]")) << moment;
        expectNormalEnd(*next);
    }
}

TEST_F(DiagnosticPortTest, ADeviceThatCannotBeOpenedEndsTheServerWithOneLine)
{
    const auto refusal = [this](const std::string& path) {
        const auto server = telephonyd({"--port", path});
        EXPECT_EQ(server->waitForEnd(), 1);
        EXPECT_EQ(std::count(server->errors().begin(), server->errors().end(), '\n'), 1)
            << server->errors();
        return server->errors();
    };
    EXPECT_THAT(refusal(file("none")),
                StartsWith("telephonyd: cannot open " + file("none") + ": No such file"));
    EXPECT_THAT(refusal(directory.path()), HasSubstr("it is not a device"));

    const PretendModem phone = modem("lte-drive.dlf", {});
    const std::string otherPorts = file("other-ports");
    ChildProcess first({TELEPHONYD_PROGRAM, "--port", phone.path(), "--technology", "lte",
                        "--ports", otherPorts, "--log", "stderr", "--log-level", "notice"});
    ASSERT_TRUE(first.waitForError("answers"));
    EXPECT_THAT(refusal(phone.path()),
                AllOf(HasSubstr("cannot open " + phone.path() + ": Device or resource busy; "),
                      HasSubstr(" (process "), HasSubstr(") uses it; end that first")));
}

TEST_F(DiagnosticPortTest, AModemThatIsReplacedAtTheSameLinkIsFoundAndTheViewerGoesOn)
{
    auto phone =
        std::make_unique<PretendModem>(directory.path(), testDataPath("lte-drive.dlf"),
                                       std::vector<std::string>{"--speed", "20", "--loop"});
    const auto server = serve(*phone, {});
    const auto program = viewer();
    ASSERT_TRUE(program->waitForText(kRow));
    phone.reset();
    EXPECT_TRUE(server->waitForError("warning: No modem at " + file("modem")));
    EXPECT_TRUE(program->waitForText(R"({"status":"No modem","loading":false,"tree":{)"));
    const auto late = viewer();
    EXPECT_TRUE(late->waitForText(R"("status":"No modem")"));
    phone = std::make_unique<PretendModem>(directory.path(), testDataPath("lte-drive.dlf"),
                                           std::vector<std::string>{"--speed", "20", "--loop"});
    EXPECT_TRUE(PretendModem::waitUntil([&] { return phone->codes() == kLteCodes; }));
    const std::string shown = treeIn(program->lines().back());
    EXPECT_TRUE(program->waitForLine([&](const std::string& line) {
        return line.find("\"Updated ") != std::string::npos && treeIn(line) != shown;
    }));
    EXPECT_THAT(program->errors(), Not(HasSubstr("INVALIDATED"))) << "its channel lives on";
    expectNormalEnd(*server);
}

class LosslessFaultTest : public DiagnosticPortTest,
                          public ::testing::WithParamInterface<const char*>
{
};

TEST_P(LosslessFaultTest, CostsNoRow)
{
    const std::string tree = lastTreeOf("lte-drive.dlf");
    const PretendModem phone = modem("lte-drive.dlf", {"--speed", "max", "--fault", GetParam()});
    const auto server = serve(phone);
    EXPECT_TRUE(showsTree(tree));
    expectNormalEnd(*server);
    EXPECT_EQ(phone.codes(), "[]");
}

INSTANTIATE_TEST_SUITE_P(Faults, LosslessFaultTest,
                         ::testing::Values("boot", "stale", "split", "late", "deaf", "deaf=2",
                                           "noranges"),
                         [](const auto& each) {
                             std::string name = each.param;
                             std::replace(name.begin(), name.end(), '=', '_');
                             return name;
                         });

TEST_F(DiagnosticPortTest, NoiseAndLossCostDamagedItemsOnlyAndAreCounted)
{
    for (const std::string fault : {"noise=20", "drop=20"}) {
        const PretendModem phone =
            modem("lte-drive.dlf", {"--speed", "20", "--loop", "--fault", fault});
        const auto server = serve(phone);
        const auto program = viewer();
        EXPECT_TRUE(program->waitForText(kRow)) << fault;
        EXPECT_TRUE(PretendModem::waitUntil([&] {
            const auto trace = phone.trace();
            return std::count_if(trace.begin(), trace.end(), [](const std::string& line) {
                       return line.find("\"damaged\"") != std::string::npos ||
                              line.find("\"dropped a byte\"") != std::string::npos;
                   }) >= 3;
        }));
        expectNormalEnd(*server);
        EXPECT_THAT(server->errors(), HasSubstr(" damaged and dropped\n")) << fault;
        EXPECT_EQ(phone.codes(), "[]");
    }
}

TEST_F(DiagnosticPortTest, AModemThatRefusesItsMasksIsToldOnceAndServedOn)
{
    const PretendModem phone = modem("lte-drive.dlf", {"--fault", "refuse"});
    const auto server = serve(phone);
    const auto program = viewer();
    EXPECT_TRUE(server->waitForError("warning: The modem at " + phone.path() +
                                     " refuses the log codes 0xB000 to 0xBFFF\n"));
    const auto another = viewer();
    EXPECT_TRUE(another->waitForText("\"loading\":false"));
    expectNormalEnd(*server);
    const auto& errors = server->errors();
    EXPECT_EQ(errors.find("refuses"), errors.rfind("refuses"));
}

// Any two faults together: the server comes through, shows what there is to show, and leaves the
// modem with all codes off.
TEST_F(DiagnosticPortTest, FaultsInPairsAreComeThrough)
{
    const std::vector<std::string> faults = {"boot", "stale", "noise",    "drop",   "split",
                                             "late", "deaf",  "noranges", "refuse", "hangup=100"};
    for (std::size_t i = 0; i < faults.size(); ++i)
        for (std::size_t j = i + 1; j < faults.size(); ++j) {
            SCOPED_TRACE(faults[i] + " and " + faults[j]);
            const PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop", "--fault",
                                                               faults[i], "--fault", faults[j]});
            const auto server = serve(phone);
            const auto program = viewer();
            if (faults[i] == "refuse" || faults[j] == "refuse") {
                EXPECT_TRUE(server->waitForError(" refuses the log codes 0xB000 to 0xBFFF\n"));
            } else {
                EXPECT_TRUE(program->waitForText(kRow));
                if (faults[j] == "hangup=100") {
                    EXPECT_TRUE(server->waitForError("warning: No modem at "));
                    EXPECT_TRUE(phone.waitForCodes(kLteCodes));
                }
            }
            expectNormalEnd(*server);
            EXPECT_TRUE(phone.waitForCodes("[]"));
        }
}

} // namespace
} // namespace orvane
