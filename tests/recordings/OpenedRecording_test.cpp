#include "recordings/OpenedRecording.h"

#include "platform/services/FileSystem.h"
#include "recordings/support/LogFiles.h"
#include "support/PropertyListBytes.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::HasSubstr;
using testing::StartsWith;

class OpenedRecordingTest : public ::testing::Test
{
protected:
    OpenedRecording open(const Bytes& content, const std::string& name = "file")
    {
        const std::string path = directory.path() + "/" + name;
        EXPECT_TRUE(writeFile(path, content));
        return openRecording(path);
    }
    OpenedRecording open(std::string_view text) { return open(bytesOf(text)); }

    TemporaryDirectory directory;
};

constexpr const char* kSnapshot =
    "<plist version=\"1.0\"><dict><key>Data</key><array/></dict></plist>";

TEST_F(OpenedRecordingTest, ContentCountsAndNotTheName)
{
    const OpenedRecording log = open(recordedFile("lte-drive.dlf"), "a.orvane");
    ASSERT_TRUE(log.log);
    EXPECT_EQ(log.log->size(), 70343U);
    EXPECT_FALSE(log.snapshot);
    EXPECT_FALSE(log.error);

    const OpenedRecording snapshot = open(bytesOf(kSnapshot), "a.dlf");
    EXPECT_TRUE(snapshot.snapshot);
    EXPECT_FALSE(snapshot.log);
    EXPECT_FALSE(snapshot.error);
}

TEST_F(OpenedRecordingTest, SnapshotsMayBeAnyKindOfPropertyList)
{
    EXPECT_TRUE(open(std::string("<?xml version=\"1.0\"?>\n") + kSnapshot).snapshot);
    EXPECT_TRUE(open(std::string("\xEF\xBB\xBF") + kSnapshot).snapshot);
    EXPECT_TRUE(open(std::string(" \r\n\t") + kSnapshot).snapshot);
    Bytes wide = {0xFE, 0xFF};
    for (const char* letter = kSnapshot; *letter; ++letter) {
        wide.push_back(0);
        wide.push_back(static_cast<std::uint8_t>(*letter));
    }
    EXPECT_TRUE(open(wide).snapshot);
    BinaryListBuilder binary;
    const auto key = binary.ascii("Data");
    const auto data = binary.array({});
    binary.dictionary({key}, {data});
    EXPECT_TRUE(open(binary.bytes()).snapshot);
}

TEST_F(OpenedRecordingTest, AFileThatCannotBeReadSaysWhyAndWhatToDo)
{
    const OpenedRecording none = openRecording(directory.path() + "/none");
    EXPECT_EQ(none.error, "cannot read \"" + directory.path() +
                              "/none\" (No such file or directory): name a diagnostic log (.dlf) "
                              "or a snapshot (.orvane) that may be read");
    EXPECT_THAT(openRecording(directory.path()).error.value_or(""), HasSubstr("Is a directory"));
}

TEST_F(OpenedRecordingTest, EveryTruncationOfASnapshotIsAnErrorThatSaysWhere)
{
    const std::string whole = kSnapshot;
    for (std::size_t length = 6; length < whole.size(); ++length) {
        const OpenedRecording cut = open(whole.substr(0, length));
        EXPECT_FALSE(cut.snapshot);
        EXPECT_THAT(cut.error.value_or(""), HasSubstr("cannot be read as a snapshot ("));
        EXPECT_THAT(cut.error.value_or(""), HasSubstr("it may have been cut short"));
    }
}

TEST_F(OpenedRecordingTest, OtherPropertyListsAreNoSnapshots)
{
    EXPECT_THAT(open("<plist version=\"1.0\"><array/></plist>").error.value_or(""),
                HasSubstr("is a property list, but no snapshot of this program"));
}

TEST_F(OpenedRecordingTest, AllElseMayBeALog)
{
    for (const char* text : {"", "<", "<html>", "hello", "bplist"}) {
        const OpenedRecording opened = open(text);
        EXPECT_TRUE(opened.log) << text;
        EXPECT_FALSE(opened.error);
    }
}

} // namespace
} // namespace orvane
