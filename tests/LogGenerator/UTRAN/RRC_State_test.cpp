#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xD0E0;

using RRC_StateTest = SectionTest<RRC_State>;

PacketBuilder packet(std::uint32_t isValid, std::uint32_t state)
{
    PacketBuilder builder(kCode, 15);
    return builder.put8(13, isValid).put8(14, state);
}

} // namespace

TEST_F(RRC_StateTest, ListsItsNameAndCode)
{
    EXPECT_EQ(section.getSectionName(), "RRC Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode));
}

TEST_F(RRC_StateTest, ShowsTheStateAndLogsTheCall)
{
    send(kCode, packet(1, 3));
    EXPECT_EQ(rows(), (Rows{
                          {"State", "Cell DCH"}
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "RRC Info"}));
}

TEST_F(RRC_StateTest, NamesSixStatesAndNoOther)
{
    const std::vector<std::string> kNames = {"Disconnected", "Connecting", "Cell Fach",
                                             "Cell DCH",     "Cell PCH",   "Cell URA PCH"};
    for (std::uint32_t state = 0; state < 256; ++state) {
        send(kCode, packet(1, state));
        EXPECT_EQ(row("State"), state < kNames.size() ? kNames[state] : "Unknown RRC Mode")
            << state;
    }
}

TEST_F(RRC_StateTest, AStateIsUnknownUnlessItsFlagIsOne)
{
    for (const std::uint32_t flag : {0U, 2U, 3U, 255U}) {
        send(kCode, packet(1, 2));
        send(kCode, packet(flag, 2));
        EXPECT_EQ(row("State"), "Unknown RRC Mode") << flag;
    }
}

TEST_F(RRC_StateTest, EveryPacketIsToldOnTheConsole)
{
    send(kCode, packet(1, 3));
    send(kCode, packet(0, 2));
    send(kCode, packet(1, 6));
    EXPECT_THAT(
        services.console.lines,
        ElementsAre("Display Dict = {State = Cell DCH}, rrc mode = 3 Cell DCH",
                    "Display Dict = {State = Unknown RRC Mode}, rrc mode = 255 Unknown RRC Mode",
                    "Display Dict = {State = Unknown RRC Mode}, rrc mode = 6 Unknown RRC Mode"));
}

TEST_F(RRC_StateTest, WithoutAPartOfTheDisplayTheConsoleTellsTheStateAllTheSame)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, packet(1, 0));
    EXPECT_THAT(services.console.lines,
                ElementsAre("Display Dict = (null), rrc mode = 0 Disconnected"));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(RRC_StateTest, AShortPacketWarnsAndAMissingByteMakesTheStateUnknown)
{
    for (std::size_t size = 0; size < 15; ++size) {
        send(kCode, packet(1, 3));
        services.log.lines.clear();
        sendCut(kCode, packet(1, 3), size);
        EXPECT_EQ(row("State"), "Unknown RRC Mode") << size;
        EXPECT_THAT(
            services.log.lines,
            ElementsAre(RecordingLog::Line{LogPriority::Warning, "RRC Info"},
                        RecordingLog::Line{LogPriority::Warning, "LogCode_0xD0E0 is length is " +
                                                                     std::to_string(size) +
                                                                     " expected size 15"}));
    }
    EXPECT_EQ(services.console.lines.back(),
              "Display Dict = {State = Unknown RRC Mode}, rrc mode = 255 Unknown RRC Mode");
}

TEST_F(RRC_StateTest, ALongerPacketDoesNotWarn)
{
    send(kCode, PacketBuilder(kCode, 16).put8(13, 1).put8(14, 1));
    EXPECT_EQ(row("State"), "Connecting");
    EXPECT_EQ(services.log.lines.size(), 1U);
}

TEST_F(RRC_StateTest, OtherCodesAreIgnoredSilently)
{
    send(0xD0E1, packet(1, 3));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.console.lines, IsEmpty());
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "RRC Info"}));
}

} // namespace orvane
