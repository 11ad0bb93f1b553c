#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;

constexpr std::uint32_t kCode = 0xB186;

using ReselectionCandidatesMiscTest = SectionTest<ReselectionCandidatesMisc>;

} // namespace

TEST_F(ReselectionCandidatesMiscTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Reselection Candidates");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(ReselectionCandidatesMiscTest, FillsItsRowsInOrderAndLogsItsName)
{
    send(kCode, PacketBuilder(kCode, 21).put8(13, 255).put16(15, 1300).put16(17, 65535));
    EXPECT_EQ(rows(),
              (Rows{
                  {"Version",         "255"  },
                  {"Serving EARFCN",  "1300" },
                  {"Serving Cell ID", "65535"}
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Reselection Candidates"}));
}

TEST_F(ReselectionCandidatesMiscTest, ShorterPacketsChangeNothing)
{
    send(kCode, PacketBuilder(kCode, 21));
    expectShorterIsIgnored(kCode, PacketBuilder(kCode, 21).put8(13, 1).put16(15, 2).put16(17, 3),
                           21);
}

TEST_F(ReselectionCandidatesMiscTest, OtherCodesAreReported) { expectReported(0xB185); }

} // namespace orvane
