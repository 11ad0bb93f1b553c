#pragma once

#include "doubles/ManualMainQueue.h"
#include "platform/base/PropertyValue.h"
#include "screens/terminal/GridDevice.h"
#include "screens/terminal/LineWidth.h"
#include "screens/terminal/TerminalScreen.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Window.h"
#include "ui/OrvanePaneController.h"
#include "ui/OrvaneSaveViewController.h"
#include "ui/PaneStack.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// Shows panes on a terminal screen that is a grid, and presses keys.
class TerminalScreenTest : public ::testing::Test, public Shell
{
protected:
    using Row = std::pair<std::string, PropertyValue>;

    explicit TerminalScreenTest(int lines = 24, int columns = 80) : device(lines, columns)
    {
        TerminalScreen::Settings settings;
        settings.isSimulated = true;
        settings.waitingHint = "Start the server.";
        settings.onQuit = [this] { ++quits; };
        screen = std::make_unique<TerminalScreen>(device, queue, settings);
        root = std::make_shared<OrvanePaneController>(nullptr, "/", *this);
        navigation = std::make_shared<NavigationController>(root);
        window = std::make_unique<Window>(screen->bounds());
        window->setRootViewController(navigation);
        window->makeKeyAndVisible();
        root->setStatus("Connecting", true);
        queue.runPending();
    }
    ~TerminalScreenTest() override
    {
        window.reset();
        navigation.reset();
        root.reset();
    }

    static PropertyValue dictionary(const std::vector<Row>& rows)
    {
        auto made = PropertyValue::newDictionary();
        for (const auto& [key, value] : rows)
            made.asDictionary()->set(key, value);
        return made;
    }
    static std::vector<Row> numberedRows(int count)
    {
        std::vector<Row> rows;
        for (int i = 0; i < count; ++i)
            rows.emplace_back("Row " + std::to_string(i), "value " + std::to_string(i));
        return rows;
    }
    // Does what the shell does after a refresh of the model.
    void refresh(const std::vector<Row>& rows)
    {
        PathDictionary paths;
        const NodePointer tree = OrvaneModelNode::makeTreeFromObject(dictionary(rows), paths);
        reloadPanes(*navigation, tree, [&](const std::string& path) { return paths.at(path); });
        if (OrvanePaneController* pane = topPane(*navigation))
            pane->setStatus("Updated now", false);
        queue.runPending();
    }
    void press(Key key)
    {
        device.keys.push_back(key);
        screen->inputIsReady();
        queue.runPending();
    }
    void press(Key::Kind kind) { press(keyOfKind(kind)); }
    void type(const std::string& text)
    {
        for (const char32_t character : decoded(text))
            press(keyOfCharacter(character));
    }
    void click(int line, int column)
    {
        Key key = keyOfKind(Key::Kind::Click);
        key.line = line;
        key.column = column;
        press(key);
    }
    void resize(int lines, int columns)
    {
        device.nextLines = lines;
        device.nextColumns = columns;
        screen->sizeHasChanged();
        queue.runPending();
    }
    // The text of the selected line; empty if no line is selected.
    [[nodiscard]] std::string selected() const
    {
        for (int line = 0; line < device.shown.lines(); ++line)
            if (device.shown.at(line, 1).style.isSelected)
                return device.text(line);
        return "";
    }
    [[nodiscard]] Style styleOf(const std::string& part) const
    {
        const int line = device.lineOf(part);
        const std::string text = device.text(line);
        return device.shown.at(line, columnsOf(text.substr(0, text.find(part)))).style;
    }
    void showSaveView() override
    {
        auto contents = PropertyValue::newArray();
        contents.asArray()->append(dictionary({
            {"Description", "Snapshot one"}
        }));
        contents.asArray()->append(dictionary({
            {"Description", "Snapshot two"}
        }));
        saveView = OrvaneSaveViewController::withSaveHistory(contents, *this);
        navigation->presentModalViewController(saveView, true);
    }
    void closeSaveView() override
    {
        navigation->dismissModalViewController(true);
        saveView.reset();
    }
    [[nodiscard]] bool allowSaveButton() const override { return isSavingOffered; }
    [[nodiscard]] MainQueue& mainQueue() override { return queue; }
    [[nodiscard]] const FileSystem& files() const override { return fileSystem; }

    GridDevice device;
    ManualMainQueue queue;
    FileSystem fileSystem{"/nonexistent"};
    std::unique_ptr<TerminalScreen> screen;
    std::shared_ptr<OrvanePaneController> root;
    std::shared_ptr<NavigationController> navigation;
    std::unique_ptr<Window> window;
    std::shared_ptr<OrvaneSaveViewController> saveView;
    bool isSavingOffered = true;
    int quits = 0;
};

} // namespace orvane
