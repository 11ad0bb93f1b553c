#include "recordings/LogRecorder.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/PacketBuilder.h"
#include "dlf/DlfReader.h"
#include "dlf/VersionReport.h"
#include "doubles/ManualMainQueue.h"
#include "platform/services/FileSystem.h"
#include "support/Paths.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <filesystem>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xB0C2;

// A file in memory that can be full.
class MemoryFile final : public BlockFile
{
public:
    struct Content {
        Bytes bytes;
        int synchronisations = 0;
        int appendError = 0;
        int synchroniseError = 0;
        bool isOpen = true;
        bool isBehind = false;
    };

    explicit MemoryFile(Content& content) : _content(content) {}
    ~MemoryFile() override { _content.isOpen = false; }
    MemoryFile(const MemoryFile&) = delete;
    MemoryFile& operator=(const MemoryFile&) = delete;

    int append(ByteView block) override
    {
        if (_content.appendError == 0)
            _content.bytes.insert(_content.bytes.end(), block.begin(), block.end());
        return _content.appendError;
    }
    int synchronise() override
    {
        ++_content.synchronisations;
        return _content.synchroniseError;
    }
    [[nodiscard]] bool isBehind() const override { return _content.isBehind; }

private:
    Content& _content;
};

Bytes item(std::uint32_t code, std::size_t size, std::uint8_t last = 7)
{
    const Bytes message = PacketBuilder(code, size + 1).put8(size, last);
    return {message.begin() + 1, message.end()};
}

Bytes joined(std::initializer_list<Bytes> parts)
{
    Bytes whole;
    for (const Bytes& part : parts)
        whole.insert(whole.end(), part.begin(), part.end());
    return whole;
}

class LogRecorderTest : public ::testing::Test
{
protected:
    LogRecorderTest() { recorder->channelOpened(kTSLogChannelTechnology_Varnel_LTE); }

    TestServices services;
    ManualMainQueue queue;
    MemoryFile::Content file;
    std::vector<std::string> notices;
    std::unique_ptr<LogRecorder> recorder =
        std::make_unique<LogRecorder>(queue, std::make_unique<MemoryFile>(file), "drive.dlf",
                                      [this](const std::string& line) { notices.push_back(line); });
};

TEST_F(LogRecorderTest, ModemMessagesLoseTheirTypeByteAndStandEndToEnd)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    recorder->messageReceived(joined({{1}, item(0x1FFB, 12)}));
    EXPECT_EQ(file.bytes, joined({item(kCode, 20), item(0x1FFB, 12)}));
}

TEST_F(LogRecorderTest, WrappersAreRemoved)
{
    recorder->messageReceived(joined({
        {0x81, 0x55, 1},
        item(kCode, 20)
    }));
    EXPECT_EQ(file.bytes, item(kCode, 20));
}

TEST_F(LogRecorderTest, WhatIsNoModemItemHasNoPlaceInTheFile)
{
    recorder->messageReceived(joined({{0xFF}, item(2, 20)}));
    recorder->messageReceived(joined({
        {0x81, 0, 0xFF},
        item(2, 20)
    }));
    recorder->messageReceived(joined({{2}, item(kCode, 20)}));
    recorder->messageReceived(joined({{1}, item(0, 20)}));
    recorder->messageReceived(Bytes(12, 1));
    recorder->messageReceived(joined({
        {0x81, 0, 1},
        Bytes(11, 1)
    }));
    recorder->messageReceived(Bytes());
    EXPECT_THAT(file.bytes, IsEmpty());
}

TEST_F(LogRecorderTest, TheLengthFieldBecomesTheItemsTrueLength)
{
    Bytes message = joined({{1}, item(kCode, 300)});
    message[1] = 0xFF;
    message[2] = 0xFF;
    recorder->messageReceived(message);
    EXPECT_EQ(file.bytes, item(kCode, 300));
}

TEST_F(LogRecorderTest, AMessageLongerThanAnyItemIsLeftOutAndToldInTheLog)
{
    recorder->messageReceived(joined({{1}, item(kCode, 0xFFFF)}));
    EXPECT_EQ(file.bytes.size(), 0xFFFFU);
    recorder->messageReceived(joined({{1}, item(kCode, 0x10000)}));
    EXPECT_EQ(file.bytes.size(), 0xFFFFU);
    EXPECT_THAT(services.log.errors(), ElementsAre(HasSubstr("65537 bytes")));
}

TEST_F(LogRecorderTest, WhatCameIsMadeSafeWithinASecondAndNothingElse)
{
    queue.advance(10s);
    EXPECT_EQ(file.synchronisations, 0);
    for (int i = 0; i < 100; ++i)
        recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    EXPECT_EQ(file.synchronisations, 0) << "not by message";
    queue.advance(999ms);
    EXPECT_EQ(file.synchronisations, 1);
    queue.advance(10s);
    EXPECT_EQ(file.synchronisations, 1);
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    queue.advance(999ms);
    EXPECT_EQ(file.synchronisations, 2);
}

TEST_F(LogRecorderTest, WhatWaitsForAPipesReaderIsTriedAgainWithoutFurtherMessages)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    file.isBehind = true;
    queue.advance(2s);
    EXPECT_GE(file.synchronisations, 3);
    file.isBehind = false;
    queue.advance(1s);
    const int before = file.synchronisations;
    queue.advance(10s);
    EXPECT_EQ(file.synchronisations, before);
}

TEST_F(LogRecorderTest, ADeletedFileEndsTheRecordingAndIsTold)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    file.synchroniseError = ENOENT;
    queue.advance(1s);
    EXPECT_FALSE(recorder->isRecording());
    EXPECT_THAT(notices,
                ElementsAre("Recording to \"drive.dlf\" has ended: the file has been deleted."));
}

TEST_F(LogRecorderTest, TheEndMakesTheRestSafe)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    recorder.reset();
    EXPECT_EQ(file.synchronisations, 1);
    EXPECT_FALSE(file.isOpen);
    queue.advance(10s);
    EXPECT_EQ(file.synchronisations, 1);
}

TEST_F(LogRecorderTest, AFullDiskEndsTheRecordingWithOneLine)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    file.appendError = ENOSPC;
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    EXPECT_FALSE(recorder->isRecording());
    EXPECT_FALSE(file.isOpen);
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    queue.advance(10s);
    EXPECT_EQ(file.bytes, item(kCode, 20));
    EXPECT_THAT(
        notices,
        ElementsAre("Recording to \"drive.dlf\" has ended: No space left on device. What came "
                    "before is kept."));
}

TEST_F(LogRecorderTest, ADiskThatFailsLaterEndsTheRecordingToo)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    file.synchroniseError = EIO;
    queue.advance(999ms);
    EXPECT_FALSE(recorder->isRecording());
    EXPECT_THAT(notices, ElementsAre(HasSubstr("Input/output error")));
}

TEST_F(LogRecorderTest, ACellMonitorHasNothingToRecordAndThatIsSaidOnce)
{
    recorder->channelOpened(kTSLogChannelTechnology_IFX);
    recorder->channelOpened(kTSLogChannelTechnology_IFX);
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    EXPECT_THAT(file.bytes, IsEmpty());
    EXPECT_THAT(notices, ElementsAre("Nothing to record to \"drive.dlf\": a cell monitor "
                                     "has no messages of a modem."));
}

TEST_F(LogRecorderTest, AnotherTechnologyGoesOnInTheSameFile)
{
    recorder->messageReceived(joined({{1}, item(kCode, 20)}));
    recorder->channelOpened(kTSLogChannelTechnology_IFX);
    recorder->channelOpened(kTSLogChannelTechnology_Varnel_UTRAN2);
    recorder->messageReceived(joined({{1}, item(0xD0E0, 20)}));
    EXPECT_EQ(file.bytes, joined({item(kCode, 20), item(0xD0E0, 20)}));
}

class RecordedFileTest : public ::testing::Test
{
protected:
    std::unique_ptr<LogRecorder> create() { return create(DiskBlockFile::Existing::Refused); }
    std::unique_ptr<LogRecorder> create(DiskBlockFile::Existing existing)
    {
        return LogRecorder::create(
            queue, path, existing, [](const std::string&) {}, error);
    }

    TestServices services;
    ManualMainQueue queue;
    TemporaryDirectory directory;
    std::string path = directory.path() + "/drive.dlf";
    std::string error;
};

TEST_F(RecordedFileTest, BeginsWithTheVersionReport)
{
    const auto recorder = create();
    ASSERT_TRUE(recorder) << error;
    const Bytes file = readFile(path).value();
    EXPECT_EQ(file.size(), kDlfVersionReportBytes);
    DlfReader reader(file);
    EXPECT_EQ(reader.next()->logCode, kDlfVersionReportCode);
}

TEST_F(RecordedFileTest, AFileThatCannotBeMadeIsAnError)
{
    path = directory.path() + "/nowhere/drive.dlf";
    EXPECT_FALSE(create());
    EXPECT_THAT(error, HasSubstr("No such file or directory"));
}

TEST_F(RecordedFileTest, ADiskThatIsFullFromTheStartIsAnError)
{
    path = "/dev/full";
    EXPECT_FALSE(create(DiskBlockFile::Existing::Overwritten));
    EXPECT_THAT(error, HasSubstr("\"/dev/full\" cannot be written (No space left on device)"));
    EXPECT_TRUE(std::filesystem::exists("/dev/full"));
}

struct Drive {
    const char* file;
    const char* technology;
};

// The display that the messages make.
PropertyValue displayOf(const char* technology, const std::vector<Bytes>& messages)
{
    PropertyDictionary state;
    const auto generator = LogGenerator::generatorFromTechnology(technology);
    for (const Bytes& message : messages)
        generator->updateState(state, message);
    return state[kDisplayKey];
}

std::vector<Bytes> messagesOf(const Bytes& file)
{
    std::vector<Bytes> messages;
    DlfReader reader(file);
    while (const auto found = reader.next()) {
        messages.push_back({found->type});
        messages.back().insert(messages.back().end(), found->bytes.begin(), found->bytes.end());
    }
    EXPECT_EQ(reader.unplacedBytes(), 0U);
    return messages;
}

class RecordedDriveTest : public RecordedFileTest, public ::testing::WithParamInterface<Drive>
{
};

TEST_P(RecordedDriveTest, ReplaysToTheSameRows)
{
    services.useShippedResources();
    const auto messages = messagesOf(readFile(testDataPath(GetParam().file)).value());
    auto recorder = create();
    ASSERT_TRUE(recorder) << error;
    recorder->channelOpened(GetParam().technology);
    bool isWrapped = false;
    for (const Bytes& message : messages) {
        isWrapped = !isWrapped;
        recorder->messageReceived(isWrapped ? joined({
                                                  {0x81, 0},
                                                  message
        })
                                            : message);
        recorder->messageReceived(PacketBuilder::withText(0xFF0002, "<plist/>"));
    }
    recorder.reset();

    const PropertyValue rows = displayOf(GetParam().technology, messages);
    ASSERT_TRUE(rows);
    EXPECT_EQ(displayOf(GetParam().technology, messagesOf(readFile(path).value())), rows);
}

INSTANTIATE_TEST_SUITE_P(
    Technologies, RecordedDriveTest,
    ::testing::Values(Drive{"lte-drive.dlf", kTSLogChannelTechnology_Varnel_LTE},
                      Drive{"umts-city.dlf", kTSLogChannelTechnology_Varnel_GSM},
                      Drive{"utran-walk.dlf", kTSLogChannelTechnology_Varnel_UTRAN2},
                      Drive{"cdma-evening.dlf", kTSLogChannelTechnology_Varnel_CDMA}),
    [](const auto& test) {
        std::string name = test.param.file;
        return name.substr(0, name.find('-'));
    });

} // namespace

} // namespace orvane
