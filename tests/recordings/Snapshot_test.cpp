#include "recordings/Snapshot.h"

#include "platform/base/PropertyValue.h"

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/LogTechnology.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/RecordedMessages.h"
#include "platform/plist/PropertyList.h"
#include "recordings/LogDecoder.h"
#include "recordings/OpenedRecording.h"
#include "recordings/support/LogFiles.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"
#include "ui/SnapshotFile.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace orvane
{
namespace
{

using testing::HasSubstr;

// Saves a live view of the recording as the program does, and opens the file.
class SavedSnapshotTest : public ::testing::TestWithParam<RecordedDrive>
{
protected:
    SavedSnapshotTest()
    {
        services.useShippedResources();
        std::filesystem::create_directories(files.located(kLogFolder));
    }

    TestServices services;
    TemporaryDirectory directory;
    FileSystem files{directory.path()};
};

TEST_P(SavedSnapshotTest, WhatWasSavedOpensToTheSameDisplaysAndItsLogToTheLastOne)
{
    const auto generator = LogGenerator::generatorFromTechnology(GetParam().technology);
    PropertyDictionary state;
    std::vector<PropertyValue> shown;
    std::size_t count = 0;
    for (const Bytes& message : recordedMessages(GetParam().file)) {
        generator->updateState(state, message);
        if (++count % 100 == 0) {
            services.clock.now += 2;
            shown.push_back(generator->generateLogUsingState(state).deepCopy());
        }
        if (count == 300)
            break;
    }
    const PropertyValue contents = generator->getSaveContentsFromState(state);
    const SnapshotResult saved =
        writeSnapshotFile(files, contents, services.clock.now, "by the river");
    ASSERT_TRUE(saved.isWritten);

    const OpenedRecording opened = openRecording(saved.path);
    ASSERT_TRUE(opened.snapshot) << opened.error.value_or("");
    EXPECT_FALSE(opened.log);
    const Snapshot& snapshot = *opened.snapshot;
    EXPECT_EQ(snapshot.description, "by the river");
    EXPECT_EQ(snapshot.timestamp, "2026-11-21 10:00:06 +0000");
    ASSERT_EQ(snapshot.entries.size(), 4U);
    for (std::size_t i = 0; i < 3; ++i) {
        const Snapshot::Entry& entry = snapshot.entries[i];
        const std::string date = "2026-11-21 10:00:0" + std::to_string(2 * (i + 1)) + " +0000";
        EXPECT_EQ(entry.date, date);
        EXPECT_EQ(entry.description, "Snapshot (" + date + ")");
        EXPECT_EQ(entry.secondsOfDate, 1795255200 + 2 * (static_cast<std::int64_t>(i) + 1));
        EXPECT_EQ(entry.display.description(), shown[i].description());
        EXPECT_FALSE(entry.log);
    }
    const Snapshot::Entry& last = snapshot.entries[3];
    EXPECT_THAT(last.description, HasSubstr("DLF binary ("));
    EXPECT_EQ(last.date, "");
    EXPECT_FALSE(last.secondsOfDate);
    EXPECT_FALSE(last.display);
    ASSERT_TRUE(last.log);

    LogDecoder play(last.log, GetParam().technology);
    play.lookAhead();
    while (play.hasNext())
        play.takeNext();
    EXPECT_GT(play.itemsTaken(), 1U);
    EXPECT_EQ(play.display().description(), shown.back().description());
    const ByteView log = last.log->bytes(0, last.log->size());
    EXPECT_EQ(technologyOfLog(log), GetParam().technology);
}

std::string nameOf(const ::testing::TestParamInfo<RecordedDrive>& info)
{
    std::string name = info.param.file;
    name.resize(name.find('-'));
    return name;
}

INSTANTIATE_TEST_SUITE_P(Technologies, SavedSnapshotTest,
                         ::testing::Values(kDrives[0], kDrives[2], kDrives[3], kDrives[4]), nameOf);

TEST(SnapshotTest, WhatIsMissingOrOfTheWrongKindIsEmpty)
{
    const auto snapshot = snapshotFrom(PropertyValue::dictionaryOf({
        {"Timestamp", PropertyValue::date({1795255200})},
        {"Data",      PropertyValue::arrayOf({
                     "no dictionary",
                     PropertyValue::newDictionary(),
                     PropertyValue::dictionaryOf({
                         {"Description", PropertyValue::integer(5)},
                         {"Date", PropertyValue::newArray()},
                         {"Display", "a text"},
                         {"DLF", "no bytes"},
                     }),
                     PropertyValue::dictionaryOf({
                         {"Date", "2026-02-30 10:00:00 +0000"},
                         {"DLF", PropertyValue::data({})},
                     }),
                 })                    },
    }));
    ASSERT_TRUE(snapshot);
    EXPECT_EQ(snapshot->timestamp, "2026-11-21 10:00:00 +0000");
    EXPECT_EQ(snapshot->description, "");
    ASSERT_EQ(snapshot->entries.size(), 4U);
    for (std::size_t i : {0U, 1U}) {
        EXPECT_EQ(snapshot->entries[i].description, "");
        EXPECT_FALSE(snapshot->entries[i].display);
        EXPECT_FALSE(snapshot->entries[i].log);
    }
    EXPECT_EQ(snapshot->entries[2].description, "5");
    EXPECT_EQ(snapshot->entries[2].date, "()");
    EXPECT_EQ(snapshot->entries[2].display, PropertyValue("a text"));
    EXPECT_FALSE(snapshot->entries[2].log);
    EXPECT_FALSE(snapshot->entries[3].secondsOfDate);
    ASSERT_TRUE(snapshot->entries[3].log);
    EXPECT_EQ(snapshot->entries[3].log->size(), 0U);
}

TEST(SnapshotTest, DatesAreReadOnlyInTheirOwnForm)
{
    const auto secondsOf = [](const char* date) {
        return snapshotFrom(PropertyValue::dictionaryOf({
                                {"Data", PropertyValue::arrayOf(
                                             {PropertyValue::dictionaryOf({{"Date", date}})})}
        }))
            ->entries.front()
            .secondsOfDate;
    };
    EXPECT_EQ(secondsOf("2026-11-21 10:00:00 +0000"), 1795255200);
    EXPECT_EQ(secondsOf("1970-01-01 00:00:00 +0000"), 0);
    for (const char* other :
         {"", "2026-11-21 10:00:00", "2026-11-21 10:00:00 +0100", "2026-11-21T10:00:00 +0000",
          "2026-13-21 10:00:00 +0000", "2026-11-21 25:00:00 +0000", "yesterday",
          "2026-11-21 10:00:00 +0000 ", "99999-11-21 10:00:00 +0000", "-1-11-21 10:00:00 +0000"})
        EXPECT_FALSE(secondsOf(other)) << other;
}

TEST(SnapshotTest, OtherPropertyListsAreNoSnapshots)
{
    EXPECT_FALSE(snapshotFrom({}));
    EXPECT_FALSE(snapshotFrom("text"));
    EXPECT_FALSE(snapshotFrom(PropertyValue::newArray()));
    EXPECT_FALSE(snapshotFrom(PropertyValue::newDictionary()));
    EXPECT_FALSE(snapshotFrom(PropertyValue::dictionaryOf({
        {"Data", "no array"}
    })));
    EXPECT_TRUE(snapshotFrom(PropertyValue::dictionaryOf({
        {"Data", PropertyValue::newArray()}
    })));
    EXPECT_TRUE(snapshotFrom(PropertyValue::dictionaryOf({
        {"Description", "by the river"}
    })));
}

} // namespace
} // namespace orvane
