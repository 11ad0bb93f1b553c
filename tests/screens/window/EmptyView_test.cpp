#include "screens/window/EmptyView.h"

#include "screens/window/WindowTest.h"

#include <QScreen>
#include <QWindow>

namespace orvane
{

namespace
{

using EmptyViewTest = WindowTest;

// What has reached the screen so far of a part of the window.
QImage pictureOnScreen(const QWidget& window, const QWidget& part)
{
    const QImage whole = window.screen()->grabWindow(window.winId()).toImage();
    return whole.copy(QRect(part.mapTo(&window, QPoint()), part.size()))
        .convertToFormat(QImage::Format_RGB32);
}

TEST_F(EmptyViewTest, ChangeOfTheStateLeavesNothingOfTheEarlierPicture)
{
    show(nullptr);
    for (const bool isWaiting : {false, true, false}) {
        setStatus(isWaiting ? "Connecting" : "Updated", isWaiting);
        EXPECT_EQ(pictureOnScreen(frame(), topPane()), pictureOf(topPane())) << isWaiting;
    }
}

// The window system may ask for a picture at once, before events that have been posted are served.
TEST_F(EmptyViewTest, PictureThatIsAskedForAtOnceLeavesNothingBehind)
{
    show(nullptr);
    for (const bool isWaiting : {false, true, false}) {
        topPane().emptyView().setWaiting(isWaiting);
        frame().repaint();
        turnEvents();
        EXPECT_EQ(pictureOnScreen(frame(), topPane()), pictureOf(topPane())) << isWaiting;
    }
}

TEST_F(EmptyViewTest, AnotherSizeLeavesNothingOfTheEarlierPicture)
{
    show(nullptr);
    setStatus("Updated", false);
    frame().resize(500, 300);
    turnEvents();
    EXPECT_EQ(pictureOnScreen(frame(), topPane()), pictureOf(topPane()));
}

TEST_F(EmptyViewTest, NothingIsCutOnTheSmallestWindow)
{
    frame().resize(280, 300);
    show(nullptr);
    const EmptyView& view = topPane().emptyView();
    const QImage picture = pictureOf(topPane().emptyView());
    const QRgb background = picture.pixel(0, 0);
    for (int x = 0; x < view.width(); ++x)
        EXPECT_EQ(picture.pixel(x, view.height() - 1), background) << x;
}

} // namespace

} // namespace orvane
