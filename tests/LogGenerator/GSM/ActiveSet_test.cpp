#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0x417A;
constexpr std::uint32_t kZeroDecibels = 524288;
constexpr std::uint32_t kMinusFive = 166442; // the weakest ratio of the band of -5 dB

using ActiveSetTest = SectionTest<ActiveSet>;

// A packet of `count` cells with all records. Every cell is in set 7 until it is put elsewhere.
class ActiveSetPacket
{
public:
    explicit ActiveSetPacket(std::size_t count, int gain = 0)
        : _count(count), _packet(kCode, 16 + (15 + 44) * count)
    {
        _packet.put16(13, static_cast<std::uint32_t>(gain) & 0xFFFF);
        _packet.put8(15, static_cast<std::uint32_t>(count));
        for (std::size_t i = 0; i < count; ++i)
            cell(i, 0, 7);
    }

    ActiveSetPacket& cell(std::size_t index, std::uint32_t code, std::uint32_t set)
    {
        _packet.put16(16 + 15 * index + 7, code | set << 13);
        return *this;
    }
    ActiveSetPacket& readings(std::size_t index, std::uint32_t first, std::uint32_t second,
                              std::uint32_t third)
    {
        const std::size_t finger = 16 + 15 * _count + 44 * index;
        _packet.put32(finger + 32, first).put32(finger + 36, second).put32(finger + 40, third);
        return *this;
    }
    operator const Bytes&() const { return _packet; }

private:
    std::size_t _count;
    PacketBuilder _packet;
};

Rows cell(const char* code, const char* power, const char* energy)
{
    return {
        {"Scrambling Code", code  },
        {"RSCP",            power },
        {"Energy Per Chip", energy},
    };
}

} // namespace

TEST_F(ActiveSetTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "Active Set");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(ActiveSetTest, ActiveCellsShowTheirLevelsInOrder)
{
    send(kCode, ActiveSetPacket(3, -600)
                    .cell(0, 8191, 0)
                    .readings(0, kMinusFive, 0, 0)
                    .cell(1, 17, 1)
                    .readings(1, kZeroDecibels, 0, 0)
                    .cell(2, 300, 0)
                    .readings(2, kZeroDecibels, 0, 0));
    EXPECT_THAT(records(),
                ElementsAre(cell("8191", "-119 dB", "-5 dB"), cell("300", "-114 dB", "0 dB")));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "ActiveSet"}));
}

TEST_F(ActiveSetTest, TheReceiverGainIsCutTowardsZero)
{
    const std::pair<int, const char*> kPowers[] = {
        {-600,   "-114 dB" }, // -88 tenths
        {-521,   "-106 dB" }, // -9 tenths
        {-522,   "-107 dB" },
        {-512,   "-106 dB" },
        {-503,   "-106 dB" },
        {-502,   "-105 dB" },
        {0,      "-55 dB"  },
        {32767,  "3221 dB" },
        {-32768, "-3331 dB"},
    };
    for (const auto& [gain, power] : kPowers) {
        send(kCode, ActiveSetPacket(1, gain).cell(0, 0, 0).readings(0, kZeroDecibels, 0, 0));
        EXPECT_THAT(records(), ElementsAre(cell("0", power, "0 dB"))) << gain;
    }
}

TEST_F(ActiveSetTest, TheFirstReadingThatIsNotZeroCounts)
{
    const struct {
        std::uint32_t readings[3];
        const char* energy;
    } kCases[] = {
        {{kMinusFive, 814, 706}, "-5 dB" },
        {{0, 814, 706},          "-30 dB"},
        {{0, 0, 706},            "-31 dB"},
        {{0, 0, 0},              "0 dB"  },
    };
    for (const auto& [readings, energy] : kCases) {
        send(kCode,
             ActiveSetPacket(1).cell(0, 1, 0).readings(0, readings[0], readings[1], readings[2]));
        ASSERT_EQ(records().size(), 1U);
        EXPECT_EQ(records()[0][2].second, energy);
    }
}

TEST_F(ActiveSetTest, TheBandsOfTheEnergyRatioKeepTheirOddEnds)
{
    const std::pair<std::uint32_t, const char*> kEnergies[] = {
        {1,          "0 dB"  },
        {705,        "0 dB"  },
        {706,        "-31 dB"},
        {757,        "-31 dB"},
        {813,        "-31 dB"},
        {814,        "-30 dB"},
        {417647,     "-2 dB" },
        {417648,     "-1 dB" },
        {524287,     "-1 dB" },
        {524288,     "0 dB"  },
        {0xFFFFFFFF, "0 dB"  },
    };
    for (const auto& [ratio, energy] : kEnergies) {
        send(kCode, ActiveSetPacket(1).cell(0, 1, 0).readings(0, ratio, 0, 0));
        ASSERT_EQ(records().size(), 1U);
        EXPECT_EQ(records()[0][2].second, energy) << ratio;
    }
}

TEST_F(ActiveSetTest, CellsOfEveryOtherSetAreLeftOut)
{
    for (std::uint32_t set = 1; set < 8; ++set) {
        send(kCode, ActiveSetPacket(1).cell(0, 5, set));
        EXPECT_THAT(records(), IsEmpty()) << set;
    }
}

TEST_F(ActiveSetTest, NoCellsEmptyTheList)
{
    send(kCode, ActiveSetPacket(1).cell(0, 5, 0));
    send(kCode, ActiveSetPacket(0));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(ActiveSetTest, ShortPacketLeavesTheEarlierList)
{
    send(kCode, ActiveSetPacket(1).cell(0, 5, 0));
    expectShorterIsIgnored(kCode, ActiveSetPacket(0), 16);
    EXPECT_EQ(records().size(), 1U);
}

TEST_F(ActiveSetTest, ACellNeedsItsWholeFingerRecord)
{
    const Bytes full = ActiveSetPacket(2).cell(0, 1, 0).cell(1, 2, 0);
    const std::pair<std::size_t, std::size_t> kCells[] = {
        {16,               0},
        {16 + 30,          0},
        {16 + 30 + 43,     0},
        {16 + 30 + 44,     1},
        {16 + 30 + 88 - 1, 1},
        {16 + 30 + 88,     2},
    };
    for (const auto& [size, cells] : kCells) {
        sendCut(kCode, full, size);
        EXPECT_EQ(records().size(), cells) << size;
    }
}

TEST_F(ActiveSetTest, FingerRecordsAreFoundByTheClaimedCount)
{
    // The readings are at their places for one cell, but the packet claims two.
    PacketBuilder packet(kCode, 16 + 15 + 44);
    packet.put8(15, 2).put16(16 + 7, 9).put32(16 + 15 + 32, kMinusFive);
    send(kCode, packet);
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(ActiveSetTest, TheLargestCountIsShownWhole)
{
    ActiveSetPacket packet(255);
    for (std::size_t i = 0; i < 255; ++i)
        packet.cell(i, static_cast<std::uint32_t>(i), 0);
    send(kCode, packet);
    ASSERT_EQ(records().size(), 255U);
    EXPECT_EQ(records()[254], cell("254", "-55 dB", "0 dB"));
}

TEST_F(ActiveSetTest, OtherCodesAreReported)
{
    send(kCode, ActiveSetPacket(1).cell(0, 5, 0));
    expectReported(0x4005);
}

TEST_F(ActiveSetTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, ActiveSetPacket(1).cell(0, 5, 0));
    EXPECT_THAT(records(), IsEmpty());
}

} // namespace orvane
