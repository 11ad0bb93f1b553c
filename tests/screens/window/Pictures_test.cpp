#include "dlf/DlfReader.h"
#include "dlf/DlfTime.h"
#include "doubles/FakePlayback.h"
#include "screens/window/DesktopColours.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowedApplication.h"
#include "support/Paths.h"

#include <QLineEdit>
#include <QTest>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

// Draws the pictures of the docs from a recorded drive, and writes them to the directory in
// ORVANE_PICTURES if that is set.
class PicturesTest : public WindowedApplication
{
protected:
    PicturesTest()
        : WindowedApplication([] {
              auto settings = stillSettings();
              settings.waitingHint =
                  "Start telephonyd --port DEVICE for a modem, or try a simulated phone: "
                  "orvane --demo";
              return settings;
          }())
    {
    }

    void picture(const char* name)
    {
        constexpr double kScale = 2;
        const QImage image = pictureOf(frame(), kScale);
        EXPECT_EQ(image.size(), frame().size() * kScale);
        const QString directory = qEnvironmentVariable("ORVANE_PICTURES");
        if (!directory.isEmpty()) {
            EXPECT_TRUE(image.save(QStringLiteral("%1/window-%2.png").arg(directory, name)));
        }
    }

    // Runs the program for that many seconds of the drive.
    void drive(double seconds = 60)
    {
        launch();
        const auto file = readFile(testDataPath("lte-drive.dlf"));
        ASSERT_TRUE(file);
        DlfReader reader(*file);
        double start = 0;
        while (const auto item = reader.next()) {
            if (item->timestamp == 0)
                continue;
            const double time = dlfSecondsSince1970(item->timestamp);
            if (start == 0)
                services.clock.now = start = time;
            if (time > start + seconds)
                break;
            goOnTo(time);
            Bytes message(1, item->type);
            message.insert(message.end(), item->bytes.begin(), item->bytes.end());
            ASSERT_TRUE(server.sendLogMessage(message));
        }
        turn(0s);
    }
    void goOnTo(double time)
    {
        if (time <= services.clock.now)
            return;
        const std::chrono::duration<double> way(time - services.clock.now);
        services.clock.now = time;
        queue.advance(std::chrono::duration_cast<std::chrono::nanoseconds>(way));
    }
    void openSaveScreen()
    {
        QTest::mouseClick(frame().toolbar().itemWidget(3), Qt::LeftButton);
        turnEvents();
        ASSERT_TRUE(frame().sheet().isVisible());
    }
};

TEST_F(PicturesTest, RootPane)
{
    drive();
    picture("root");
}

TEST_F(PicturesTest, ServingCell)
{
    drive();
    openRow("Serving Cell Measurements");
    picture("serving-cell");
}

TEST_F(PicturesTest, LongValueScrolledSideways)
{
    drive();
    openRow("Serving Cell Measurements");
    QTest::keyClick(&table(), Qt::Key_End);
    const auto current = [this] { return table().rowWidget(table().currentRow()); };
    while (table().currentRow() > 0 && !current()->content().key().startsWith("Num of Consecutive"))
        QTest::keyClick(&table(), Qt::Key_Up);
    QTest::keyClick(&table(), Qt::Key_Right);
    EXPECT_GT(current()->sideways(), 0);
    picture("long-value");
}

TEST_F(PicturesTest, SaveScreen)
{
    drive();
    openSaveScreen();
    QTest::keyClicks(frame().focusWidget(), "Platform 3, northern end");
    picture("save");
}

TEST_F(PicturesTest, Alert)
{
    drive();
    screen.showAlert(
        std::make_unique<AlertView>("File Error", "Unable to write file to disk", "Close"));
    turnEvents();
    picture("alert");
}

TEST_F(PicturesTest, Dark)
{
    DesktopColours::apply(DesktopColours::Scheme::Dark);
    drive();
    picture("dark");
    DesktopColours::apply(DesktopColours::Scheme::NoPreference);
}

TEST_F(PicturesTest, Waiting)
{
    app.applicationDidFinishLaunching();
    turnEvents();
    picture("waiting");
}

TEST_F(PicturesTest, Recording)
{
    drive();
    constexpr double kFakesStart = 1795255200;
    FakePlayback playback;
    playback.at = services.clock.now - kFakesStart;
    playback.length = 2 * playback.at;
    playback.rate = 10;
    playback.plays = true;
    playback.note = "198 bytes could not be placed, the first at 0x1F40";
    openRow("Serving Cell Info");
    screen.setPlayback(&playback);
    turnEvents();
    picture("recording");
    screen.setPlayback(nullptr);
}

TEST_F(PicturesTest, Desktop)
{
    frame().resize(900, 600);
    drive();
    openRow("Serving Cell Info");
    openSaveScreen();
    picture("desktop");
}

} // namespace

} // namespace orvane
