#include "LogGenerator/GSM/VRN_GSMClassIndex.h"

#include "LogGenerator/support/IndexOrder.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

struct ExpectedSection {
    const char* name;
    std::vector<std::uint32_t> codes;
};

// In the order in which the sections are made.
const ExpectedSection kSections[] = {
    {"Active Set",           {0x417A}                                                },
    {"Coding Scheme",        {}                                                      },
    {"GPRS Information",     {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137}},
    {"GSM Serving Cell",     {0x5134, 0x5137, 0x5076, 0xFF0001}                      },
    {"Mobile Allocation",    {0x51F8}                                                },
    {"Neighboring Cells",    {0x5137, 0x51FF, 0xFF0001}                              },
    {"PDP Context Info",     {0xFF0002}                                              },
    {"Process PS",           {0x7130, 0x7132}                                        },
    {"UMTS RR Measurement",  {}                                                      },
    {"Cell Change Counters", {}                                                      },
    {"Detected Set",         {0x417A}                                                },
    {"GSM Set",              {0x4005}                                                },
    {"Non-Ranked GSM Set",   {}                                                      },
    {"Process CO",           {0x7131, 0x7132}                                        },
    {"Serving PLMN",         {0x7135, 0x7132, 0xFF0001}                              },
    {"UMTS Set",             {0x4005, 0xFF0001}                                      },
    {"Equivalent PLMN List", {0x7150}                                                },
    {"GSM RR Info",          {0x512C, 0x5137, 0x5072, 0x51F6}                        },
    {"Monitored Set",        {0x417A}                                                },
    {"Non-Ranked UMTS Set",  {}                                                      },
    {"Process CS",           {0x7131, 0x7132}                                        },
    {"UMTS RR Info",         {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001}              },
    {"BLER",                 {0x4116}                                                },
    {"Virtual Active Set",   {0x417A}                                                },
    {"SIM Info",             {0xFF0000}                                              },
    {"HSDPA Info",           {0x4221}                                                },
};

class VRN_GSMClassIndexTest : public ::testing::Test
{
protected:
    VRN_GSMClassIndexTest() { index.init(); }

    [[nodiscard]] std::vector<std::string> subscribers(std::uint32_t code) const
    {
        return orvane::subscribers(index, code);
    }

    TestServices services;
    VRN_GSMClassIndex index;
};

} // namespace

TEST_F(VRN_GSMClassIndexTest, MakesItsSectionsInOrder)
{
    std::vector<std::string> names;
    for (const auto& [name, section] : index.sections())
        names.push_back(name);
    std::vector<std::string> expected;
    for (const ExpectedSection& section : kSections)
        expected.emplace_back(section.name);
    EXPECT_EQ(onlyThose(expected, names), expected);
}

TEST_F(VRN_GSMClassIndexTest, SectionsListTheirCodesInOrder)
{
    for (const ExpectedSection& expected : kSections) {
        const Base* section = index.getClass(expected.name);
        ASSERT_TRUE(section) << expected.name;
        EXPECT_EQ(section->getSectionName(), expected.name);
        EXPECT_EQ(section->getLogCodeArray(), expected.codes) << expected.name;
    }
}

TEST_F(VRN_GSMClassIndexTest, SharedCodesHaveTheirSectionsInOrder)
{
    EXPECT_THAT(subscribers(0x417A),
                ElementsAre("Active Set", "Detected Set", "Monitored Set", "Virtual Active Set"));
    EXPECT_THAT(subscribers(0x5137), ElementsAre("GPRS Information", "GSM Serving Cell",
                                                 "Neighboring Cells", "GSM RR Info"));
    EXPECT_THAT(subscribers(0x7132),
                ElementsAre("Process PS", "Process CO", "Serving PLMN", "Process CS"));
    EXPECT_THAT(subscribers(0xFF0001), ElementsAre("GSM Serving Cell", "Neighboring Cells",
                                                   "Serving PLMN", "UMTS Set", "UMTS RR Info"));
    EXPECT_THAT(subscribers(0x4005), ElementsAre("GSM Set", "UMTS Set"));
    EXPECT_THAT(subscribers(0x7131), ElementsAre("Process CO", "Process CS"));
    EXPECT_THAT(subscribers(0x7135), ElementsAre("GPRS Information", "Serving PLMN"));
    EXPECT_THAT(subscribers(0x51F6), ElementsAre("GPRS Information", "GSM RR Info"));
}

TEST_F(VRN_GSMClassIndexTest, CodesThatNoSectionListsHaveNoSubscribers)
{
    EXPECT_EQ(index.getSubscribers(0x417B), nullptr);
    EXPECT_EQ(index.getSubscribers(0xFF0003), nullptr);
}

TEST(VRN_GSMClassIndexLifeTest, SaysWhenItGoesBeforeItsBaseDoes)
{
    TestServices services;
    {
        VRN_GSMClassIndex index;
        index.init();
    }
    EXPECT_THAT(services.console.lines,
                ElementsAre("Deallocing VRN_GSMClassIndex", "Deallocing ClassIndex"));
}

} // namespace orvane
