#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x7150;

using EquivalentPLMNListTest = SectionTest<EquivalentPLMNList>;

Rows network(const char* country, const char* code)
{
    return {
        {"Mobile Country Code", country},
        {"Mobile Network Code", code   },
    };
}

// `bytes` stand from offset 17 on.
Bytes packet(std::uint32_t count, const std::vector<std::uint32_t>& bytes)
{
    PacketBuilder builder(kCode, 17 + bytes.size());
    builder.put8(16, count);
    for (std::size_t i = 0; i < bytes.size(); ++i)
        builder.put8(17 + i, bytes[i]);
    return builder;
}

} // namespace

TEST_F(EquivalentPLMNListTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Equivalent PLMN List");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(EquivalentPLMNListTest, TheDigitsOfTheTwoCodesAlternate)
{
    send(kCode, packet(1, {2, 0, 6, 0, 0, 3}));
    EXPECT_THAT(records(), ElementsAre(network("260", "3")));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Equivalent PLMN List"}));
}

TEST_F(EquivalentPLMNListTest, EntriesOfSixBytesBeginThreeBytesApart)
{
    send(kCode, packet(2, {1, 2, 3, 4, 5, 6, 7, 8, 9}));
    EXPECT_THAT(records(), ElementsAre(network("135", "246"), network("468", "579")));
}

TEST_F(EquivalentPLMNListTest, BytesThatAreNoDigitsCountWithTheirWholeValue)
{
    send(kCode, packet(1, {255, 0, 255, 0, 255, 0}));
    EXPECT_THAT(records(), ElementsAre(network("28305", "0")));
}

TEST_F(EquivalentPLMNListTest, ACountOfZeroEmptiesTheList)
{
    send(kCode, packet(1, {2, 0, 6, 0, 0, 3}));
    send(kCode, packet(0, {2, 0, 6, 0, 0, 3}));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(EquivalentPLMNListTest, ACountBeyondThePacketShowsTheWholeEntries)
{
    const Bytes full = packet(255, {1, 2, 3, 4, 5, 6, 7, 8, 9});
    const std::pair<std::size_t, std::size_t> kEntries[] = {
        {17, 0},
        {22, 0},
        {23, 1},
        {25, 1},
        {26, 2},
    };
    for (const auto& [size, entries] : kEntries) {
        sendCut(kCode, full, size);
        EXPECT_EQ(records().size(), entries) << size;
    }
}

TEST_F(EquivalentPLMNListTest, TheLargestCountIsShownWhole)
{
    send(kCode, packet(255, std::vector<std::uint32_t>(3 * 254 + 6, 1)));
    EXPECT_EQ(records(), std::vector<Rows>(255, network("111", "111")));
}

TEST_F(EquivalentPLMNListTest, ShortPacketLeavesTheEarlierList)
{
    send(kCode, packet(1, {2, 0, 6, 0, 0, 3}));
    expectShorterIsIgnored(kCode, packet(0, {}), 17);
    EXPECT_THAT(records(), ElementsAre(network("260", "3")));
}

TEST_F(EquivalentPLMNListTest, OtherCodesAreReported)
{
    send(kCode, packet(1, {2, 0, 6, 0, 0, 3}));
    expectReported(0x7151);
}

} // namespace orvane
