#pragma once

#include "doubles/ManualMainQueue.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/FileSystem.h"
#include "screens/toolkit/Window.h"
#include "screens/window/PaneDeck.h"
#include "screens/window/QtScreen.h"
#include "screens/window/RowWidget.h"
#include "screens/window/TableWidget.h"
#include "screens/window/WindowFrame.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"
#include "ui/OrvanePaneController.h"
#include "ui/OrvaneSaveViewController.h"
#include "ui/Shell.h"

#include <gtest/gtest.h>

#include <QImage>
#include <QPointingDevice>
#include <QWidget>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// The device of QTest's touch events.
QPointingDevice* touchScreen();

// Processes all pending events.
void turnEvents();
// Processes events until that is true; false after 30 seconds.
bool turnEventsUntil(const std::function<bool()>& done);

// Renders the widget at that many pixels a point.
QImage pictureOf(QWidget& widget, double scale = 1);

NodePointer valueNode(const std::string& name, const std::string& value);
NodePointer groupNode(const std::string& name, std::vector<NodePointer> children);
// A tree as a refresh makes it.
NodePointer rootNode(std::vector<NodePointer> children);

// Shows panes of a test's nodes in the real window, 360 points wide and 640 high. Animations are
// off by default.
class WindowTest : public ::testing::Test, public Shell
{
protected:
    explicit WindowTest(QtScreen::Settings settings = stillSettings());
    ~WindowTest() override;

    static QtScreen::Settings stillSettings();

    // Opens the window with one pane that shows the node.
    void show(NodePointer root);
    // Reloads each pane with the node of its path, as a refresh does, and draws it.
    void refresh(const NodePointer& root);
    void setStatus(const std::string& text, bool isBusy);

    [[nodiscard]] OrvanePaneController& topController() const;
    [[nodiscard]] PaneWidget& topPane() const { return *frame().deck().top(); }
    [[nodiscard]] TableWidget& table() const { return topPane().table(); }
    [[nodiscard]] RowWidget* row(std::size_t index) const { return table().rowWidget(index); }
    [[nodiscard]] QString title() const;
    [[nodiscard]] WindowFrame& frame() const { return screen.frame(); }
    [[nodiscard]] OrvaneSaveViewController* saveScreen() const { return _saveScreen.get(); }

    // Clicks with the mouse in the middle of the row.
    void clickRow(std::size_t index);
    [[nodiscard]] QPoint middleOf(std::size_t index) const;

    [[nodiscard]] bool allowSaveButton() const override { return isSavingOffered; }
    void showSaveView() override;
    void closeSaveView() override;
    [[nodiscard]] MainQueue& mainQueue() override { return queue; }
    [[nodiscard]] const FileSystem& files() const override { return _files; }

    TestServices services;
    TemporaryDirectory rootDirectory;
    ManualMainQueue queue;
    QtScreen screen;
    bool isSavingOffered = true;
    int closeCount = 0; // how often the user asked the program to end
    PropertyValue saveContents = PropertyValue::newArray();

private:
    FileSystem _files{rootDirectory.path()};
    std::unique_ptr<Window> _window;
    std::shared_ptr<NavigationController> _navigation;
    std::shared_ptr<OrvaneSaveViewController> _saveScreen;
};

} // namespace orvane
