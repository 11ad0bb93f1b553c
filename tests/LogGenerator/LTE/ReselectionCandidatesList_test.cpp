#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xB186;
constexpr std::size_t kFirst = 21;

using ReselectionCandidatesListTest = SectionTest<ReselectionCandidatesList>;

// The packet says `count` and holds `payload` bytes after the fixed part.
PacketBuilder packet(std::uint32_t count, std::size_t payload)
{
    PacketBuilder builder(kCode, kFirst + payload);
    return builder.put16(19, count);
}

// One candidate of the technology, with its whole body.
PacketBuilder candidate(std::uint32_t technology, std::size_t bodyBytes)
{
    PacketBuilder builder = packet(1, 4 + bodyBytes);
    return builder.put16(kFirst, 6).put16(kFirst + 2, technology);
}

} // namespace

TEST_F(ReselectionCandidatesListTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Reselection Candidates List");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
    EXPECT_EQ(section.subtreeType(), PropertyValue::Type::Array);
}

TEST_F(ReselectionCandidatesListTest, ShowsLteCandidates)
{
    send(kCode, candidate(0, 4).put16(25, 1300).put16(27, 0x0280));
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"Candidate Priority", "6"   },
                               {"Candidate RAT Type", "LTE" },
                               {"E ARFCN",            "1300"},
                               {"Cell ID",            "5"   }
    }));
    EXPECT_THAT(services.log.lines, ElementsAre(RecordingLog::Line{LogPriority::Warning,
                                                                   "Reselection Candidates List"}));
}

TEST_F(ReselectionCandidatesListTest, AnLteCellIsTheUpperNineBitsOfItsWord)
{
    send(kCode, candidate(0, 4).put16(27, 0x007F));
    EXPECT_EQ((*display.asArray())[0]["Cell ID"].description(), "0");
    send(kCode, candidate(0, 4).put16(27, 0xFFFF));
    EXPECT_EQ((*display.asArray())[0]["Cell ID"].description(), "511");
}

TEST_F(ReselectionCandidatesListTest, ShowsUtranCandidates)
{
    send(kCode, candidate(1, 4).put16(25, 10588).put16(27, 511));
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"Candidate Priority", "6"    },
                               {"Candidate RAT Type", "UTRAN"},
                               {"U ARFCN",            "10588"},
                               {"PSC",                "511"  }
    }));
}

TEST_F(ReselectionCandidatesListTest, ShowsGeranCandidates)
{
    send(kCode, candidate(2, 4).put16(25, 512).put8(27, 3).put8(28, 63));
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"Candidate Priority", "6"    },
                               {"Candidate RAT Type", "GERAN"},
                               {"ARFCN",              "512"  },
                               {"Band",               "3"    },
                               {"BSIC ID",            "63"   }
    }));
}

TEST_F(ReselectionCandidatesListTest, ShowsCdmaCandidatesOfBothKinds)
{
    for (const auto& [technology, name] : {std::pair(3U, "CDMA1XRTT"), std::pair(4U, "CDMAHRPD")}) {
        send(kCode, candidate(technology, 8).put8(25, 10).put16(29, 1019).put16(31, 511));
        EXPECT_THAT(records(), ElementsAre(Rows{
                                   {"Candidate Priority", "6"   },
                                   {"Candidate RAT Type", name  },
                                   {"Band",               "10"  },
                                   {"Channel",            "1019"},
                                   {"Pilot",              "511" }
        }));
    }
}

TEST_F(ReselectionCandidatesListTest, OtherTechnologiesHaveNoNameAndNoFields)
{
    for (const std::uint32_t technology : {5U, 7U, 0x0100U, 0xFFFFU}) {
        send(kCode, candidate(technology, 8));
        EXPECT_THAT(records(), ElementsAre(Rows{
                                   {"Candidate Priority", "6" },
                                   {"Candidate RAT Type", "??"}
        }))
            << technology;
    }
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(ReselectionCandidatesListTest, ACandidatesBodyLiesWhereTheNextOnesHeaderIs)
{
    send(kCode, packet(3, 12)
                    .put16(21, 7)
                    .put16(23, 1) // UTRAN
                    .put16(25, 5)
                    .put16(27, 2) // GERAN, and the first one's scrambling code
                    .put16(29, 4)
                    .put16(31, 9));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
                                   {"Candidate Priority", "7"    },
                                   {"Candidate RAT Type", "UTRAN"},
                                   {"U ARFCN",            "5"    },
                                   {"PSC",                "2"    }
    },
                               Rows{{"Candidate Priority", "5"},
                                    {"Candidate RAT Type", "GERAN"},
                                    {"ARFCN", "4"},
                                    {"Band", "9"},
                                    {"BSIC ID", "0"}},
                               Rows{{"Candidate Priority", "4"}, {"Candidate RAT Type", "??"}}));
}

TEST_F(ReselectionCandidatesListTest, NoCandidatesEmptyTheList)
{
    send(kCode, candidate(1, 4));
    send(kCode, packet(0, 8));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(ReselectionCandidatesListTest, OnlyTheLowByteOfTheCountIsWalked)
{
    send(kCode, packet(0x0102, 2000).put16(23, 7).put16(27, 7));
    EXPECT_EQ(records().size(), 2U);
    send(kCode, packet(0x0100, 2000));
    EXPECT_THAT(records(), IsEmpty());
    send(kCode, packet(0xFFFF, 2000));
    EXPECT_EQ(records().size(), 255U);
}

TEST_F(ReselectionCandidatesListTest, ACandidateWhoseBodyIsNotWholeEndsTheWalk)
{
    const std::pair<std::uint32_t, std::size_t> kBodies[] = {
        {0, 4},
        {1, 4},
        {2, 4},
        {3, 8},
        {4, 8},
        {5, 0},
    };
    for (const auto& [technology, bytes] : kBodies) {
        const Bytes whole = candidate(technology, bytes);
        for (std::size_t size = kFirst; size <= whole.size(); ++size) {
            sendCut(kCode, whole, size);
            EXPECT_EQ(records().size(), size == whole.size() ? 1U : 0U)
                << technology << " cut to " << size;
        }
    }
}

TEST_F(ReselectionCandidatesListTest, ACountBeyondThePacketShowsItsWholeCandidates)
{
    // A whole candidate, one whose body is cut off, and one of which only the header would be
    // whole.
    send(kCode, packet(255, 14).put16(23, 1).put16(27, 3).put16(31, 7));
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(ReselectionCandidatesListTest, ShorterPacketsKeepTheList)
{
    send(kCode, candidate(1, 4));
    expectShorterIsIgnored(kCode, packet(0, 0), kFirst);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(ReselectionCandidatesListTest, OtherCodesAreReportedAndKeepTheList)
{
    send(kCode, candidate(1, 4));
    expectReported(0xB187);
}

} // namespace orvane
