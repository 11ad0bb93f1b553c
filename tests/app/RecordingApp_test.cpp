#include "app/RecordingApp.h"

#include "platform/base/PropertyValue.h"

#include "doubles/FakeScreen.h"
#include "doubles/ManualMainQueue.h"
#include "recordings/support/LogFiles.h"
#include "screens/toolkit/TableView.h"
#include "support/Recording.h"
#include "ui/OrvaneCell.h"
#include "ui/PaneStack.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

std::shared_ptr<ByteSource> drive()
{
    LogBuilder builder;
    for (std::uint16_t i = 0; i <= 60; ++i) {
        builder.measurement(kLogStart + i * kLogSecond, i);
        if (i == 30)
            builder.servingCell(kLogStart + i * kLogSecond, 5);
    }
    return builder.source();
}

OpenedRecording logOf(std::shared_ptr<ByteSource> source)
{
    OpenedRecording recording;
    recording.log = std::move(source);
    return recording;
}

OpenedRecording snapshotOf(std::shared_ptr<ByteSource> log)
{
    OpenedRecording recording;
    recording.snapshot.emplace();
    recording.snapshot->timestamp = "2026-11-21 10:00:06 +0000";
    recording.snapshot->description = "by the river";
    Snapshot::Entry entry;
    entry.description = "Snapshot (noon)";
    entry.date = "noon";
    entry.display = PropertyValue::dictionaryOf({
        {"Serving Cell Info", PropertyValue::dictionaryOf({{"Cell Identity", "7"}})}
    });
    recording.snapshot->entries.push_back(entry);
    entry = {};
    entry.description = "DLF";
    entry.log = std::move(log);
    recording.snapshot->entries.push_back(entry);
    return recording;
}

class RecordingAppTest : public ::testing::Test
{
protected:
    RecordingAppTest() { services.useShippedResources(); }

    void open(OpenedRecording recording)
    {
        app = std::make_unique<RecordingApp>(
            RecordingApp::Environment{
                queue, [this] { return queue.now(); }, files,
                [this](const std::string& text) { failures.push_back(text); }},
            std::move(recording), RecordingSettings{"a.dlf", {}});
        app->applicationDidFinishLaunching();
    }
    [[nodiscard]] OrvanePaneController& top() const { return *topPane(*screen.navigation()); }
    [[nodiscard]] std::shared_ptr<OrvaneCell> cell(std::size_t row) const
    {
        return std::dynamic_pointer_cast<OrvaneCell>(screen.row(row));
    }
    [[nodiscard]] std::vector<std::string> rows() const
    {
        std::vector<std::string> texts;
        for (std::size_t row = 0; row < screen.table()->numberOfRows(); ++row) {
            const bool isGroup = cell(row)->accessory() == CellAccessory::DisclosureIndicator;
            texts.push_back(cell(row)->key()->text() +
                            (isGroup ? " >" : ": " + cell(row)->value()->text()));
        }
        return texts;
    }
    void press(const std::string& name)
    {
        const std::vector<std::string> texts = rows();
        for (std::size_t row = 0; row < texts.size(); ++row)
            if (texts[row].starts_with(name)) {
                screen.pressRow(row);
                return;
            }
        FAIL() << "no row " << name;
    }

    TestServices services;
    FakeScreen screen;
    ManualMainQueue queue;
    FileSystem files;
    std::vector<std::string> failures;
    std::unique_ptr<RecordingApp> app;
};

TEST_F(RecordingAppTest, ALogIsReadThenShownWithItsTimeInTheStatusLine)
{
    open(logOf(drive()));
    EXPECT_EQ(screen.playback(), app->player());
    EXPECT_EQ(top().statusText(), "Reading...");
    EXPECT_TRUE(top().isBusy());
    EXPECT_THAT(rows(), IsEmpty());
    queue.runPending();
    EXPECT_EQ(top().statusText(), "2017-07-11 04:34:10 UTC");
    EXPECT_FALSE(top().isBusy());
    EXPECT_THAT(rows(), Contains("Serving Cell Measurements >"));
    press("Serving Cell Measurements");
    EXPECT_EQ(top().statusText(), "2017-07-11 04:34:10 UTC");
    EXPECT_THAT(rows(), Contains("E-ARFCN: 1"));
}

TEST_F(RecordingAppTest, PlayingReloadsThePaneInFrontAndItsStatus)
{
    open(logOf(drive()));
    queue.runPending();
    press("Serving Cell Measurements");
    screen.playback()->play();
    const int updates = screen.updateCount();
    queue.advance(2s);
    EXPECT_GT(screen.updateCount(), updates);
    EXPECT_THAT(rows(), Contains("E-ARFCN: 3"));
    EXPECT_EQ(top().statusText(), "2017-07-11 04:34:12 UTC");
    screen.pressBack();
    EXPECT_EQ(screen.title(), "Orvane");
    screen.playback()->jumpToEnd();
    press("Serving Cell Measurements");
    EXPECT_THAT(rows(), Contains("E-ARFCN: 60"));
}

TEST_F(RecordingAppTest, PanesWhosePathIsGoneAreLeft)
{
    open(logOf(recordedLog("lte-drive.dlf")));
    queue.runPending();
    screen.playback()->jumpToEnd();
    press("Neighbor Cells List");
    press("3"); // the fourth neighbour
    const std::size_t depth = screen.navigation()->viewControllers().size();
    EXPECT_EQ(depth, 3U);
    screen.playback()->jumpTo(0);
    EXPECT_LT(screen.navigation()->viewControllers().size(), depth);
    EXPECT_EQ(screen.title(), "Neighbor Cells List");
}

TEST_F(RecordingAppTest, ALogThatCannotBePlayedFails)
{
    open(logOf(sourceOf(Bytes(1000, 0))));
    queue.runPending();
    EXPECT_THAT(failures, ElementsAre(HasSubstr("neither a diagnostic log")));
}

TEST_F(RecordingAppTest, AFailureMayEndTheApplication)
{
    app = std::make_unique<RecordingApp>(
        RecordingApp::Environment{queue, [this] { return queue.now(); }, files,
                                  [this](const std::string&) { app.reset(); }},
        logOf(sourceOf(Bytes(1000, 0))), RecordingSettings{"a.dlf", {}});
    app->applicationDidFinishLaunching();
    queue.runPending();
    EXPECT_FALSE(app);
    EXPECT_EQ(screen.playback(), nullptr);
}

TEST_F(RecordingAppTest, SavingIsNotOffered)
{
    open(logOf(drive()));
    EXPECT_FALSE(app->allowSaveButton());
    EXPECT_EQ(top().toolbarItems().size(), 3U);
}

TEST_F(RecordingAppTest, ASnapshotShowsItsEntriesAndWhatTheUserWrote)
{
    open(snapshotOf(drive()));
    EXPECT_THAT(rows(), ElementsAre("Description: by the river", "Saved: 2026-11-21 10:00:06 +0000",
                                    "Snapshot (noon) >", "DLF >"));
    EXPECT_EQ(top().statusText(), "2026-11-21 10:00:06 +0000");
    EXPECT_FALSE(top().isBusy());
    EXPECT_EQ(screen.playback(), nullptr);
    press("Snapshot (noon)");
    EXPECT_EQ(top().statusText(), "noon");
    press("Serving Cell Info");
    EXPECT_THAT(rows(), ElementsAre("Cell Identity: 7"));
    EXPECT_EQ(top().statusText(), "noon");
    EXPECT_EQ(screen.playback(), nullptr);
}

TEST_F(RecordingAppTest, ASnapshotsLogIsPlayedWhileOneIsInsideOfIt)
{
    open(snapshotOf(drive()));
    press("DLF");
    ASSERT_TRUE(screen.playback());
    EXPECT_EQ(screen.title(), "DLF");
    EXPECT_EQ(top().statusText(), "Reading...");
    queue.runPending();
    EXPECT_EQ(screen.title(), "DLF");
    EXPECT_EQ(top().statusText(), "2017-07-11 04:34:10 UTC");
    press("Serving Cell Measurements");
    EXPECT_THAT(rows(), Contains("E-ARFCN: 1"));
    screen.playback()->play();
    queue.advance(2s);
    EXPECT_THAT(rows(), Contains("E-ARFCN: 3"));
    screen.pressBack();
    EXPECT_TRUE(screen.playback());
    EXPECT_TRUE(screen.playback()->isPlaying());
    screen.pressBack();
    EXPECT_EQ(screen.playback(), nullptr);
    queue.advance(60s);
    EXPECT_THAT(rows(), Contains("DLF >"));
    press("DLF");
    EXPECT_TRUE(screen.playback());
}

TEST_F(RecordingAppTest, ASnapshotsLogThatCannotBePlayedSaysSo)
{
    open(snapshotOf(sourceOf(Bytes(1000, 0))));
    press("DLF");
    queue.runPending();
    ASSERT_TRUE(screen.alert());
    EXPECT_THAT(screen.alert()->message(), HasSubstr("neither a diagnostic log"));
    EXPECT_THAT(failures, IsEmpty());
    EXPECT_FALSE(top().isBusy());
    screen.dismissAlert();
    screen.playback()->faster();
    EXPECT_EQ(screen.alert(), nullptr);
    screen.pressBack();
    EXPECT_THAT(rows(), Contains("DLF >"));
}

TEST_F(RecordingAppTest, NothingIsLeftOnTheScreenAfterTheEnd)
{
    open(logOf(drive()));
    queue.runPending();
    screen.playback()->play();
    app->applicationWillTerminate();
    EXPECT_EQ(screen.playback(), nullptr);
    EXPECT_EQ(screen.keyWindow(), nullptr);
    queue.advance(60s);
    app.reset();
}

} // namespace
} // namespace orvane
