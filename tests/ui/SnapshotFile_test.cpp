#include "ui/SnapshotFile.h"

#include "platform/base/PropertyValue.h"

#include "platform/plist/PropertyList.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <filesystem>
#include <sys/inotify.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr const char* kFolder = "/var/mobile/Library/Logs/DiagDrop";

class SnapshotFileTest : public ::testing::Test
{
protected:
    void makeFolder() { std::filesystem::create_directories(root.path() + kFolder); }
    static PropertyValue read(const std::string& path)
    {
        const auto content = readFile(path);
        return content ? readPropertyList(*content).value : PropertyValue();
    }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
};

} // namespace

TEST_F(SnapshotFileTest, HoldsTheThreeKeysAndTheEntriesUnchanged)
{
    makeFolder();
    const PropertyValue history = PropertyValue::arrayOf({
        PropertyValue::newDictionary(),
        PropertyValue::dictionaryOf(
            {{"Description", "DLF binary (3 bytes)"}, {"DLF", PropertyValue::data({1, 2, 3})}}
            )
    });
    const SnapshotResult result = writeSnapshotFile(files, history, 0, "at the <bridge> & beyond");
    EXPECT_TRUE(result.isWritten);
    EXPECT_EQ(read(result.path), PropertyValue::dictionaryOf({
                                     {"Timestamp",   "1970-01-01 00:00:00 +0000"},
                                     {"Data",        history                    },
                                     {"Description", "at the <bridge> & beyond" }
    }));
}

TEST_F(SnapshotFileTest, IsWrittenDirectlyNotThroughATemporaryFile)
{
    makeFolder();
    const int watch = ::inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
    ASSERT_GE(::inotify_add_watch(watch, (root.path() + kFolder).c_str(), IN_CREATE | IN_MOVED_TO),
              0);
    EXPECT_TRUE(writeSnapshotFile(files, PropertyValue::newArray(), 0, "").isWritten);
    alignas(inotify_event) std::array<char, 4096> events{};
    const auto length = ::read(watch, events.data(), events.size());
    ::close(watch);
    const auto* event = reinterpret_cast<const inotify_event*>(events.data());
    ASSERT_EQ(length, static_cast<ssize_t>(sizeof *event + event->len)) << "one name appears";
    EXPECT_EQ(event->mask, static_cast<std::uint32_t>(IN_CREATE));
    EXPECT_STREQ(event->name, "OrvaneSnapshot-1795255200.orvane");
}

TEST_F(SnapshotFileTest, IsNeverWrittenThroughASymbolicLinkOrIntoAPipe)
{
    makeFolder();
    const std::string path = root.path() + kFolder + "/OrvaneSnapshot-1795255200.orvane";
    const std::string target = root.path() + "/precious";
    ASSERT_TRUE(writeFile(target, Bytes{1, 2, 3}));
    std::filesystem::create_symlink(target, path);
    EXPECT_FALSE(writeSnapshotFile(files, PropertyValue::newArray(), 0, "").isWritten);
    EXPECT_EQ(readFile(target), (Bytes{1, 2, 3}));

    std::filesystem::remove(path);
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    EXPECT_FALSE(writeSnapshotFile(files, PropertyValue::newArray(), 0, "").isWritten);
}

TEST_F(SnapshotFileTest, IsNamedByTheTimeOfSavingNotByTheTimestamp)
{
    makeFolder();
    services.clock.now = 1795255201.9;
    const SnapshotResult result =
        writeSnapshotFile(files, PropertyValue::newArray(), 1795255100, "");
    EXPECT_EQ(result.path, root.path() + kFolder + "/OrvaneSnapshot-1795255201.orvane");
    EXPECT_EQ(read(result.path)["Timestamp"], PropertyValue("2026-11-21 09:58:20 +0000"));
}

TEST_F(SnapshotFileTest, EmptyContentsAndDescriptionAreSavedAsSuch)
{
    makeFolder();
    const PropertyValue saved =
        read(writeSnapshotFile(files, PropertyValue::newArray(), 0, "").path);
    EXPECT_EQ(saved["Data"], PropertyValue::newArray());
    EXPECT_EQ(saved["Description"], PropertyValue(""));
}

TEST_F(SnapshotFileTest, AMissingFolderIsMadeForTheUserAloneWhereWhatLiesAboveIsTheUsers)
{
    const SnapshotResult result = writeSnapshotFile(files, PropertyValue::newArray(), 0, "");
    EXPECT_TRUE(result.isWritten);
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_EQ(std::filesystem::status(root.path() + kFolder).permissions(),
              std::filesystem::perms::owner_all);
}

TEST_F(SnapshotFileTest, AFolderThatCannotBeMadeFailsWithItsReason)
{
    std::filesystem::create_directories(root.path() + "/var/mobile/Library");
    ASSERT_TRUE(writeFile(root.path() + "/var/mobile/Library/Logs", {}));
    const SnapshotResult result = writeSnapshotFile(files, PropertyValue::newArray(), 0, "");
    EXPECT_FALSE(result.isWritten);
    EXPECT_THAT(services.log.errors(), ElementsAre("Unable to write snapshot to " + result.path,
                                                   "The snapshot was not saved: Not a directory"));
}

TEST_F(SnapshotFileTest, AFileThatCannotBeWrittenFailsWithItsReason)
{
    makeFolder();
    std::filesystem::create_directory(root.path() + kFolder + "/OrvaneSnapshot-1795255200.orvane");
    const SnapshotResult result = writeSnapshotFile(files, PropertyValue::newArray(), 0, "");
    EXPECT_FALSE(result.isWritten);
    EXPECT_THAT(services.log.errors(), ElementsAre("Unable to write snapshot to " + result.path,
                                                   "The snapshot was not saved: File exists"));
}

TEST_F(SnapshotFileTest, ASecondSaveWithinTheSecondReplacesTheFirst)
{
    makeFolder();
    const std::string first =
        writeSnapshotFile(files, PropertyValue::newArray(), 0, "a longer description").path;
    const std::string second = writeSnapshotFile(files, PropertyValue::newArray(), 0, "b").path;
    EXPECT_EQ(first, second);
    EXPECT_EQ(read(second)["Description"], PropertyValue("b"));
}

TEST_F(SnapshotFileTest, ATextThatXmlCannotHoldDoesNotKeepTheRestFromBeingSaved)
{
    makeFolder();
    PropertyValue deep = "bottom";
    for (int level = 0; level < 600; ++level)
        deep = PropertyValue::arrayOf({deep});
    const PropertyValue history = PropertyValue::arrayOf({
        PropertyValue::dictionaryOf({{"APN", std::string("net\0x", 5)},
                                     {"bad\x01key", "kept"},
                                     {"When", PropertyValue::date({1e300})},
                                     {"Good", PropertyValue::integer(7)}}
        ),
        deep
    });
    const SnapshotResult result = writeSnapshotFile(files, history, 0, "");
    ASSERT_TRUE(result.isWritten);
    const PropertyValue data = read(result.path)["Data"];
    const PropertyValue& entry = (*data.asArray())[0];
    EXPECT_EQ(entry["APN"], PropertyValue("net x"));
    EXPECT_EQ(entry["bad key"], PropertyValue("kept"));
    EXPECT_TRUE(entry["When"].asString());
    EXPECT_EQ(entry["Good"], PropertyValue::integer(7));
}

} // namespace orvane
