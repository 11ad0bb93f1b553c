#include "processes/support/ChildProcess.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

namespace orvane
{

namespace
{

using ::testing::HasSubstr;

// A simulated phone and the panes that it fills.
struct Demo {
    const char* name;
    std::vector<std::string> filled; // panes that have rows
    std::vector<std::string> empty;  // panes that have none, because their sections keep none
};

void PrintTo(const Demo& demo, std::ostream* stream) { *stream << demo.name; }

std::string named(const std::string& pane) { return "{\"name\":\"" + pane + "\",\"children\":["; }

bool isFilled(const std::string& line, const std::string& pane)
{
    const std::string start = named(pane);
    const std::size_t at = line.find(start);
    return at != std::string::npos && line.compare(at + start.size(), 1, "{") == 0;
}

// The whole path: packets from a phone over real ports, through the generator, into the panes.
class DemoTechnologiesTest : public ::testing::TestWithParam<Demo>
{
protected:
    TemporaryDirectory directory;
    ChildProcess viewer{
        {ORVANE_PROGRAM, std::string("--demo=") + GetParam().name, "--ui", "json", "--refresh",
         "0.2", "--log", "none"},
        {"XDG_STATE_HOME=" + directory.path()       }
    };

    std::optional<std::string> waitForFilledPanes()
    {
        return viewer.waitForLine([](const std::string& line) {
            return std::all_of(GetParam().filled.begin(), GetParam().filled.end(),
                               [&](const std::string& pane) { return isFilled(line, pane); });
        });
    }
};

} // namespace

TEST_P(DemoTechnologiesTest, FillsEveryPaneThatIsNotEmptyByDesign)
{
    const auto line = waitForFilledPanes();
    ASSERT_TRUE(line) << (viewer.lines().empty() ? "nothing" : viewer.lines().back());
    for (const std::string& pane : GetParam().empty)
        EXPECT_THAT(*line, HasSubstr(named(pane) + "]"));
    EXPECT_THAT(*line, HasSubstr("\"simulated\":true"));
    viewer.writeLine("quit");
    EXPECT_EQ(viewer.waitForEnd(), 0);
}

TEST_P(DemoTechnologiesTest, ShowsValuesThatMove)
{
    const auto tree = [](const std::string& line) { return line.substr(line.find("\"tree\"")); };
    const auto first = waitForFilledPanes();
    ASSERT_TRUE(first);
    EXPECT_TRUE(viewer.waitForLine([&](const std::string& line) {
        return line.find("\"status\":\"Updated ") != std::string::npos &&
               tree(line) != tree(*first);
    }));
}

INSTANTIATE_TEST_SUITE_P(
    Demo, DemoTechnologiesTest,
    ::testing::Values(
        Demo{
            "lte",
            {"Serving Cell Info",                               "Serving Cell Measurements", "Neighbor Measurements",
              "Neighbor Cells List", "Connected mode LTE Intra-frequency Measurement",
              "Measured Neighbor Cells", "Reselection Candidates", "Reselection Candidates List",
              "PDP Context Info", "SIM Info"},
            {}
},
        Demo{
            "umts",
            {"Serving PLMN",
             "GSM Serving Cell",
             "UMTS RR Info",
             "GSM RR Info",
             "Process CS",
             "Process PS",
             "Process CO",
             "Active Set",
             "UMTS Set",
             "GSM Set",
             "Neighboring Cells",
             "Mobile Allocation",
             "ARFCNs",
             "GPRS Information",
             "HSDPA Info",
             "Primary HARQ Process",
             "Secondary HARQ Process",
             "BLER",
             "Transport Channels",
             "Equivalent PLMN List",
             "SIM Info",
             "PDP Context Info"},
            {"Monitored Set", "Detected Set", "Virtual Active Set", "Non-Ranked UMTS Set",
             "Non-Ranked GSM Set", "UMTS RR Measurement", "Cell Change Counters", "Coding Scheme"},
        },
        Demo{
            "utran",
            {"Serving Cell Info", "RRC Info", "Neighbor Cell List", "TRCH BLER", "CCTRCH SIR",
             "SIR", "PDP Context Info", "SIM Info"},
            {"GSM Neighbor Cell List"},
        },
        Demo{"cdma", {"1x", "1xEV-DO", "System Identity", "Data Rates"}, {}},
        Demo{"cellmonitor", {"Network", "Serving Cell", "Neighbor Cells"}, {}}),
    [](const auto& test) { return std::string(test.param.name); });

} // namespace orvane
