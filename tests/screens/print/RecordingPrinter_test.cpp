#include "screens/print/RecordingPrinter.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include "doubles/ManualMainQueue.h"
#include "recordings/support/LiveView.h"
#include "screens/print/JsonPrinter.h"
#include "screens/print/TextPrinter.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

OpenedRecording log(std::shared_ptr<ByteSource> source)
{
    OpenedRecording recording;
    recording.log = std::move(source);
    return recording;
}

OpenedRecording snapshot()
{
    OpenedRecording recording;
    recording.snapshot = snapshotFrom(PropertyValue::dictionaryOf({
        {"Timestamp",   "2026-11-21 10:00:06 +0000"},
        {"Description", "by the river"             },
        {"Data",        PropertyValue::newArray()  }
    }));
    Snapshot::Entry entry;
    entry.description = "Snapshot (2026-11-21 10:00:00 +0000)";
    entry.date = "2026-11-21 10:00:00 +0000";
    entry.secondsOfDate = 1795255200;
    entry.display = PropertyValue::dictionaryOf({
        {"Cell ID", "7"}
    });
    recording.snapshot->entries.push_back(entry);
    entry = {};
    entry.description = "DLF binary (161 bytes)";
    entry.log = sourceOf(Bytes(161, 1));
    recording.snapshot->entries.push_back(entry);
    return recording;
}

class RecordingPrinterTest : public ::testing::Test
{
protected:
    RecordingPrinterTest() { services.useShippedResources(); }

    void printAs(Printer& pane, OpenedRecording recording,
                 RecordingSettings settings = {"a.dlf", {}})
    {
        printer = std::make_unique<RecordingPrinter>(
            queue, std::move(recording), std::move(settings), pane, [this] { ++changes; });
        queue.runPending();
    }
    std::vector<std::string> json(OpenedRecording recording,
                                  RecordingSettings settings = {"a.dlf", {}})
    {
        JsonPrinter pane([this](std::string_view text) { lines.emplace_back(text); }, false);
        printAs(pane, std::move(recording), std::move(settings));
        return lines;
    }

    TestServices services;
    ManualMainQueue queue;
    std::vector<std::string> lines;
    int changes = 0;
    std::unique_ptr<RecordingPrinter> printer;
};

TEST_F(RecordingPrinterTest, ALogIsALineARefreshPeriod)
{
    json(log(LogBuilder()
                 .measurement(kLogStart, 1)
                 .measurement(kLogStart + kLogSecond + 3 * kLogStep, 2)
                 .measurement(kLogStart + 99 * kLogSecond, 3)
                 .source()));
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_THAT(lines[0], StartsWith("{\"status\":\"2017-07-11 04:34:09 UTC\",\"loading\":false,"
                                     "\"tree\":{\"name\":\"Orvane\",\"children\":["));
    EXPECT_THAT(lines[0], HasSubstr("{\"name\":\"E-ARFCN\",\"value\":\"2\"}"));
    EXPECT_THAT(lines[0], EndsWith("]},\"time\":\"2017-07-11T04:34:09.003Z\"}\n"));
    EXPECT_THAT(lines[1], EndsWith(",\"time\":\"2017-07-11T04:35:47.000Z\"}\n"));
    EXPECT_TRUE(printer->hasEnded());
    EXPECT_FALSE(printer->failure());
    EXPECT_EQ(printer->progress(), 1);
    EXPECT_THAT(printer->remark(), IsEmpty());
    EXPECT_GT(changes, 3);
}

TEST_F(RecordingPrinterTest, EveryRecordingHasItsPeriods)
{
    for (const RecordedDrive& drive : kDrives) {
        lines.clear();
        const LiveView& live = liveViewOf(drive);
        EXPECT_EQ(json(log(recordedLog(drive.file)), {drive.file, {}, 1s}).size(),
                  live.periods(1s).size());
        EXPECT_EQ(printer->remark().empty(), drive.file != std::string("lte-drive-damaged.dlf"));
    }
}

TEST_F(RecordingPrinterTest, ASnapshotIsALineAnEntry)
{
    EXPECT_THAT(
        json(snapshot()),
        ElementsAre("{\"status\":\"Snapshot (2026-11-21 10:00:00 +0000)\",\"loading\":false,"
                    "\"tree\":{\"name\":\"Orvane\",\"children\":[{\"name\":\"Cell ID\",\"value\":"
                    "\"7\"}]},\"time\":\"2026-11-21T10:00:00.000Z\"}\n",
                    "{\"status\":\"DLF binary (161 bytes)\",\"loading\":false,\"tree\":null}\n"));
    EXPECT_TRUE(printer->hasEnded());
}

TEST_F(RecordingPrinterTest, AsTextASnapshotBeginsWithWhatTheUserWroteAboutIt)
{
    TextPrinter pane([this](std::string_view text) { lines.emplace_back(text); }, false);
    printAs(pane, snapshot());
    EXPECT_THAT(lines, ElementsAre("Snapshot of 2026-11-21 10:00:06 +0000: by the river\n\n",
                                   "Snapshot (2026-11-21 10:00:00 +0000)\nOrvane\n  Cell ID: 7\n\n",
                                   "DLF binary (161 bytes)\n\n"));
}

TEST_F(RecordingPrinterTest, ASnapshotWithoutEntriesHasNoLines)
{
    OpenedRecording empty = snapshot();
    empty.snapshot->entries.clear();
    EXPECT_THAT(json(std::move(empty)), IsEmpty());
    EXPECT_TRUE(printer->hasEnded());
}

TEST_F(RecordingPrinterTest, ALogOfNoTechnologyFailsUnlessItIsNamed)
{
    const auto unknown = [] {
        LogBuilder builder;
        builder.item(0x1234, kLogStart, {}).item(0x1234, kLogStart + kLogStep, {});
        return log(builder.source());
    };
    EXPECT_THAT(json(unknown()), IsEmpty());
    EXPECT_TRUE(printer->hasEnded());
    EXPECT_THAT(printer->failure().value_or(""), HasSubstr("name it with --technology"));

    EXPECT_EQ(json(unknown(), {"a.dlf", kTSLogChannelTechnology_Varnel_LTE}).size(), 1U);
    EXPECT_FALSE(printer->failure());
}

TEST_F(RecordingPrinterTest, APrinterThatGoesPrintsNoMore)
{
    JsonPrinter pane([this](std::string_view text) { lines.emplace_back(text); }, false);
    printer = std::make_unique<RecordingPrinter>(queue, log(recordedLog("lte-drive.dlf")),
                                                 RecordingSettings{"a.dlf", {}}, pane, nullptr);
    printer.reset();
    queue.runPending();
    EXPECT_THAT(lines, IsEmpty());
}

} // namespace
} // namespace orvane
