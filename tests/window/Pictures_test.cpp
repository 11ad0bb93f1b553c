#include "platform/fake/FakePlayback.h"
#include "window/WindowTest.h"

#include <QApplication>
#include <QLineEdit>
#include <QTest>

namespace orvane
{

namespace
{

// The pictures of the docs, written to the directory that ORVANE_PICTURES names; without it, the
// windows are drawn all the same.
class PicturesTest : public WindowTest
{
protected:
    PicturesTest()
        : WindowTest([] {
              auto settings = stillSettings();
              settings.isSimulated = true;
              settings.waitingHint =
                  "Start telephonyd, or look at the simulated phone: orvane --demo";
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

    void showPhone()
    {
        show(phone());
        setStatus("Updated 2026-11-21 at 10:00:00", false);
    }

    static std::vector<NodePointer> servingCell()
    {
        return {
            valueNode("MCC", "262"),
            valueNode("MNC", "02"),
            valueNode("Tracking Area Code", "4711"),
            valueNode("Cell Identity", "27447297"),
            valueNode("Physical Cell ID", "301"),
            valueNode("Downlink EARFCN", "1300"),
            valueNode("Downlink Bandwidth", "20 MHz"),
            valueNode("Measured RSRP", "-95.50 dBm"),
            valueNode("Measured RSRQ", "-10.25 dB"),
            valueNode("Neighbour Cells", "302, 17, 488, 251, 93, 120, 6, 341, 77, 215, 460"),
        };
    }
    static NodePointer phone()
    {
        const std::vector<NodePointer> none;
        return rootNode({groupNode("Serving Cell Info", servingCell()),
                         groupNode("Serving Cell Measurements", none),
                         groupNode("Neighbor Measurements", none),
                         groupNode("Reselection Candidates", none),
                         groupNode("HSDPA Information", none), groupNode("Version Info", none)});
    }
};

TEST_F(PicturesTest, RootPane)
{
    showPhone();
    picture("root");
}

TEST_F(PicturesTest, ServingCell)
{
    showPhone();
    clickRow(0);
    picture("serving-cell");
}

TEST_F(PicturesTest, LongValueScrolledSideways)
{
    showPhone();
    clickRow(0);
    QTest::keyClick(&table(), Qt::Key_End);
    for (int i = 0; i < 3; ++i)
        QTest::keyClick(&table(), Qt::Key_Right);
    picture("long-value");
}

TEST_F(PicturesTest, SaveScreen)
{
    for (const char* text : {"Current", "Snapshot (2026-11-21 09:59:58 +0000)",
                             "Snapshot (2026-11-21 09:59:56 +0000)"}) {
        const PropertyValue entry = PropertyValue::newDictionary();
        entry.asDictionary()->set("Description", text);
        saveContents.asArray()->append(entry);
    }
    showPhone();
    showSaveView();
    turnEvents();
    QTest::keyClicks(frame().findChild<QLineEdit*>("saveDescription"), "Platform 3, northern end");
    picture("save");
}

TEST_F(PicturesTest, Alert)
{
    showPhone();
    screen.showAlert(
        std::make_unique<AlertView>("File Error", "Unable to write file to disk", "Close"));
    turnEvents();
    picture("alert");
}

TEST_F(PicturesTest, Dark)
{
    const QPalette earlier = QApplication::palette();
    QPalette dark;
    dark.setColor(QPalette::Window, QColor(30, 30, 30));
    dark.setColor(QPalette::WindowText, Qt::white);
    QApplication::setPalette(dark);
    showPhone();
    clickRow(0);
    picture("dark");
    QApplication::setPalette(earlier);
}

TEST_F(PicturesTest, Waiting)
{
    show(nullptr);
    picture("waiting");
}

TEST_F(PicturesTest, Recording)
{
    FakePlayback playback;
    playback.at = 37;
    playback.rate = 10;
    playback.plays = true;
    playback.note = "198 bytes could not be placed, the first at 0x1F40";
    showPhone();
    clickRow(0);
    screen.setPlayback(&playback);
    turnEvents();
    picture("recording");
    screen.setPlayback(nullptr);
}

TEST_F(PicturesTest, Desktop)
{
    frame().resize(900, 600);
    showPhone();
    clickRow(0);
    showSaveView();
    turnEvents();
    picture("desktop");
}

} // namespace

} // namespace orvane
