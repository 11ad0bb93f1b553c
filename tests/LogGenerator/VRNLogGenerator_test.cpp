#include "LogGenerator/VRNLogGenerator.h"

#include "LogGenerator/KeptMessages.h"
#include "LogGenerator/StateKeys.h"
#include "dlf/VersionReport.h"
#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::size_t kVersion = 16; // offsets in the version report
constexpr std::size_t kProgram = 23;
constexpr std::size_t kBuildDate = 63;
constexpr std::size_t kTime = 81;
constexpr std::size_t kZone = 85;
constexpr std::size_t kDaylightSaving = 87;

// Gives tests the buffer.
class OpenGenerator final : public VRNLogGenerator
{
public:
    using VRNLogGenerator::appendToBinData;
    using VRNLogGenerator::moveBinDataToState;
    using VRNLogGenerator::recordSnapshot;
};

class VRNLogGeneratorTest : public ::testing::Test
{
protected:
    ~VRNLogGeneratorTest() override { Services::current().setVersion(std::nullopt); }

    void addSnapshot(const PropertyValue& displayState)
    {
        if (!state[kHistoryKey])
            state.set(kHistoryKey, PropertyValue::newArray());
        PropertyValue snapshot = PropertyValue::newDictionary();
        if (displayState)
            snapshot.asDictionary()->set(kDisplayStateKey, displayState);
        state[kHistoryKey].asArray()->append(snapshot);
    }
    // The bytes after the version report.
    [[nodiscard]] Bytes items() const
    {
        const auto dlf = VRNLogGenerator::generateDlfFromState(state);
        return dlf ? Bytes(dlf->begin() + kDlfVersionReportBytes, dlf->end()) : Bytes{0xEE};
    }
    [[nodiscard]] Bytes report() const
    {
        return VRNLogGenerator::generateDlfFromState(state).value_or(Bytes());
    }
    [[nodiscard]] std::string textAt(std::size_t offset) const
    {
        return reinterpret_cast<const char*>(&report().at(offset));
    }
    [[nodiscard]] std::uint64_t numberAt(std::size_t offset, std::size_t width) const
    {
        const Bytes bytes = report();
        return PacketView(bytes).unsignedAt(offset, width).value_or(0xEEEEEEEE);
    }

    TestServices services;
    PropertyDictionary state;
};

} // namespace

TEST_F(VRNLogGeneratorTest, WithoutHistoryTheFileIsTheVersionReport)
{
    EXPECT_EQ(report().size(), 161U);
    state.set(kHistoryKey, PropertyValue::newArray());
    EXPECT_EQ(report().size(), 161U);
    EXPECT_EQ(numberAt(0, 2), 161U);
    EXPECT_EQ(numberAt(2, 2), 0x1FFDU);
    EXPECT_EQ(numberAt(12, 2), 1U);
    EXPECT_EQ(numberAt(14, 2), 1U);
}

TEST_F(VRNLogGeneratorTest, TheReportNamesTheProgramAndItsBuild)
{
    EXPECT_EQ(textAt(kProgram), "EXECUTABLE_NAME");
    EXPECT_EQ(textAt(kBuildDate), "Jun 13 2017 22:04");
}

TEST_F(VRNLogGeneratorTest, TheReportsVersionIsCutShort)
{
    EXPECT_EQ(textAt(kVersion), "(none)");
    Services::current().setVersion("2.5");
    EXPECT_EQ(textAt(kVersion), "Orvane");
}

TEST_F(VRNLogGeneratorTest, TheReportTellsTheTimeInWholeSeconds)
{
    services.clock.now = 1795255200.9;
    EXPECT_EQ(numberAt(kTime, 4), 1795255200U);
}

TEST_F(VRNLogGeneratorTest, TheReportTellsTheZoneInMinutesEastOfGmt)
{
    const std::pair<int, std::uint64_t> kZones[] = {
        {0,      0     },
        {19800,  330   },
        {-12600, 0xFF2E},
        {59,     0     },
        {-59,    0     }, // towards zero
    };
    for (const auto& [seconds, minutes] : kZones) {
        services.clock.zone.secondsFromGmt = seconds;
        EXPECT_EQ(numberAt(kZone, 2), minutes) << seconds;
    }
    EXPECT_EQ(numberAt(kDaylightSaving, 2), 0U);
    services.clock.zone.isDaylightSaving = true;
    EXPECT_EQ(numberAt(kDaylightSaving, 2), 1U);
}

TEST_F(VRNLogGeneratorTest, OnlyTheFirstMessageOfASnapshotLosesItsTypeByte)
{
    addSnapshot(PropertyValue::data({1, 10, 11, 1, 20, 21}));
    addSnapshot(PropertyValue::data({0x81, 0, 1, 30}));
    EXPECT_EQ(items(), Bytes({10, 11, 1, 20, 21, 0, 1, 30}));
}

TEST_F(VRNLogGeneratorTest, SnapshotsOfLessThanTwoBytesAddNothing)
{
    addSnapshot(PropertyValue::data({}));
    addSnapshot(PropertyValue::data({1}));
    addSnapshot(PropertyValue());
    EXPECT_EQ(items(), Bytes());
    addSnapshot(PropertyValue::data({1, 2}));
    EXPECT_EQ(items(), Bytes({2}));
}

TEST_F(VRNLogGeneratorTest, ASnapshotOfAnotherTypeGivesNoFileAtAll)
{
    addSnapshot(PropertyValue::data({1, 2}));
    addSnapshot("text");
    EXPECT_EQ(VRNLogGenerator::generateDlfFromState(state), std::nullopt);
    EXPECT_THAT(
        services.log.errors(),
        ElementsAre("Got wrong class writing history to DLF; aborting writing the DLF file"));
}

TEST_F(VRNLogGeneratorTest, SaveContentsAreTheHistoryAndTheFile)
{
    addSnapshot(PropertyValue::data({1, 2, 3}));
    addSnapshot(PropertyValue());
    OpenGenerator generator;
    const PropertyValue contents = generator.getSaveContentsFromState(state);
    ASSERT_EQ(contents.asArray()->size(), 3U);
    EXPECT_EQ((*contents.asArray())[0], (*state[kHistoryKey].asArray())[0]);
    EXPECT_EQ((*contents.asArray())[1], PropertyValue::newDictionary());
    const PropertyValue& file = (*contents.asArray())[2];
    EXPECT_EQ(file["Description"], PropertyValue("DLF binary (163 bytes)"));
    EXPECT_EQ(file["DLF"].asData()->size(), 163U);
    EXPECT_EQ(file.asDictionary()->size(), 2U);
    EXPECT_EQ(state[kHistoryKey].asArray()->size(), 2U);
}

TEST_F(VRNLogGeneratorTest, SaveContentsLackAFileThatCouldNotBeMade)
{
    addSnapshot("text");
    OpenGenerator generator;
    EXPECT_EQ(generator.getSaveContentsFromState(state).asArray()->size(), 1U);
}

TEST_F(VRNLogGeneratorTest, SaveContentsWithoutHistoryAreTheReportAlone)
{
    OpenGenerator generator;
    const PropertyValue contents = generator.getSaveContentsFromState(state);
    ASSERT_EQ(contents.asArray()->size(), 1U);
    EXPECT_EQ((*contents.asArray())[0]["Description"], PropertyValue("DLF binary (161 bytes)"));
}

TEST_F(VRNLogGeneratorTest, MessagesAreGatheredUntilTheyMoveToTheState)
{
    OpenGenerator generator;
    generator.init();
    generator.appendToBinData(Bytes{1, 2});
    generator.appendToBinData(Bytes{3});
    generator.moveBinDataToState(state);
    EXPECT_EQ(*state[kDisplayStateKey].asData(), Bytes({1, 2, 3}));
    generator.moveBinDataToState(state);
    EXPECT_EQ(*state[kDisplayStateKey].asData(), Bytes());
    generator.appendToBinData(Bytes{4});
    generator.moveBinDataToState(state);
    EXPECT_EQ(*state[kDisplayStateKey].asData(), Bytes({4}));
}

TEST_F(VRNLogGeneratorTest, WithoutInitNothingIsGathered)
{
    OpenGenerator generator;
    generator.appendToBinData(Bytes{1, 2});
    generator.moveBinDataToState(state);
    EXPECT_TRUE(state.empty());
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(VRNLogGeneratorTest, RawMessagesOfAllSnapshotsAreBoundedAndTheOldestGoFirst)
{
    constexpr std::size_t kItem = 60'000;
    constexpr std::size_t kMessages = 20U << 20;
    OpenGenerator generator;
    generator.init();
    state.set(kDisplayKey, PropertyValue::newDictionary());
    state.set(kExtraInfoKey, PropertyValue::newDictionary());
    std::uint8_t mark = 0;
    for (int snapshot = 0; snapshot < 5; ++snapshot) {
        for (std::size_t bytes = 0; bytes < kMessages; bytes += kItem + 1) {
            Bytes message(kItem + 1, mark++);
            message[0] = 1;
            message[1] = kItem & 0xFF;
            message[2] = kItem >> 8;
            generator.appendToBinData(message);
        }
        generator.recordSnapshot(state);
    }
    std::size_t total = 0;
    std::vector<bool> incomplete;
    for (const PropertyValue& entry : *state[kHistoryKey].asArray()) {
        const Bytes& bytes = *entry[kDisplayStateKey].asData();
        EXPECT_EQ(bytes.size() % (kItem + 1), 0U) << "whole messages";
        total += bytes.size();
        incomplete.push_back(isIncompleteEntry(entry));
    }
    EXPECT_THAT(incomplete, ElementsAre(true, true, false, false, false));
    EXPECT_LE(total, kMostKeptBytes);
    EXPECT_GT(total, kMostKeptBytes - 2 * kItem);
    EXPECT_EQ(state[kHistoryKey].asArray()->elements().back()[kDisplayStateKey].asData()->back(),
              static_cast<std::uint8_t>(mark - 1));
    const PropertyValue contents = generator.getSaveContentsFromState(state);
    EXPECT_THAT((*contents.asArray())[0][kDescriptionKey].description(),
                ::testing::EndsWith("(oldest raw messages left out)"));
    EXPECT_THAT(contents.asArray()->elements().back()[kDescriptionKey].description(),
                ::testing::EndsWith(" bytes, oldest messages left out)"));
}

TEST_F(VRNLogGeneratorTest, OnePeriodKeepsNoMoreThanAllTogetherMay)
{
    OpenGenerator generator;
    generator.init();
    Bytes message(60'001, 7);
    message[0] = 1;
    message[1] = 60'000 & 0xFF;
    message[2] = 60'000 >> 8;
    for (std::size_t bytes = 0; bytes < 2 * kMostKeptBytes; bytes += message.size())
        generator.appendToBinData(message);
    state.set(kDisplayKey, PropertyValue::newDictionary());
    generator.recordSnapshot(state);
    const PropertyValue& entry = (*state[kHistoryKey].asArray())[0];
    EXPECT_LE(entry[kDisplayStateKey].asData()->size(), kMostKeptBytes);
    EXPECT_EQ(entry[kDisplayStateKey].asData()->size() % message.size(), 0U);
    EXPECT_TRUE(isIncompleteEntry(entry));
}

TEST_F(VRNLogGeneratorTest, MessagesWithoutAUsableLengthGoTogether)
{
    const Bytes message = {1, 13, 0, 9, 9, 9, 9, 9, 9, 9, 9, 9, 9, 9};
    Bytes messages = message;
    messages.insert(messages.end(), {0x81, 0});
    messages.insert(messages.end(), message.begin(), message.end());
    messages.insert(messages.end(), {1, 2, 0});
    const struct {
        std::size_t count;
        std::size_t length;
    } cases[] = {
        {0,    0 },
        {1,    14},
        {14,   14},
        {15,   30},
        {30,   30},
        {31,   33},
        {1000, 33}
    };
    for (const auto& each : cases)
        EXPECT_EQ(lengthOfFirstMessages(messages, each.count), each.length) << each.count;
    for (std::size_t length = 0; length <= messages.size(); ++length) {
        const Bytes cut(messages.begin(), messages.begin() + static_cast<std::ptrdiff_t>(length));
        EXPECT_EQ(lengthOfFirstMessages(cut, 1000), length);
    }
}

} // namespace orvane
