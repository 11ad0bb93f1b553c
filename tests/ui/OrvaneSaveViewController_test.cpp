#include "ui/OrvaneSaveViewController.h"

#include "platform/base/PropertyValue.h"

#include "doubles/FakeScreen.h"
#include "platform/plist/PropertyList.h"
#include "support/Recording.h"
#include "support/SaveScreen.h"
#include "support/TemporaryDirectory.h"
#include "ui/support/FakeShell.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

PropertyValue entry(const std::string& description)
{
    return PropertyValue::dictionaryOf({
        {"Description", description}
    });
}

class OrvaneSaveViewControllerTest : public ::testing::Test
{
protected:
    OrvaneSaveViewControllerTest() { offer(""); }

    void offer(const std::string& missing)
    {
        screen.setInterface("OrvaneSaveViewController",
                            [missing] { return makeSaveScreen(missing); });
    }
    void open(const PropertyValue& saveHistory)
    {
        controller = OrvaneSaveViewController::withSaveHistory(saveHistory, shell);
        static_cast<void>(controller->view());
        controller->viewWillAppear(true);
    }
    // A file stands where the log folder's parent should be.
    void forbidSaving() { ASSERT_TRUE(writeFile(root.path() + "/var", {})); }
    void allowSaving() { std::filesystem::remove(root.path() + "/var"); }
    void makeLogFolder() { std::filesystem::create_directories(folder()); }
    [[nodiscard]] std::string folder() const
    {
        return root.path() + "/var/mobile/Library/Logs/DiagDrop";
    }
    [[nodiscard]] PropertyValue savedAt(const std::string& seconds) const
    {
        const auto bytes = readFile(folder() + "/OrvaneSnapshot-" + seconds + ".orvane");
        return bytes ? readPropertyList(*bytes).value : PropertyValue();
    }
    [[nodiscard]] std::shared_ptr<TableViewCell> row(std::size_t index) const
    {
        return controller->saveContentTable()->cellForRow(index);
    }

    TestServices services;
    FakeScreen screen;
    TemporaryDirectory root;
    FakeShell shell{root.path()};
    std::shared_ptr<OrvaneSaveViewController> controller;
};

} // namespace

TEST_F(OrvaneSaveViewControllerTest, ListsTheEntriesByDescriptionAllChecked)
{
    open(PropertyValue::arrayOf({entry("Snapshot (one)"), entry("DLF binary (161 bytes)")}));
    ASSERT_EQ(controller->saveContentTable()->numberOfRows(), 2U);
    for (const auto& [index, text] :
         {std::pair(0U, "Snapshot (one)"), std::pair(1U, "DLF binary (161 bytes)")}) {
        EXPECT_EQ(row(index)->textLabel().text(), text);
        EXPECT_EQ(row(index)->textLabel().font(), (Font{"Helvetica", 13, false}));
        EXPECT_EQ(row(index)->accessory(), CellAccessory::Checkmark);
        EXPECT_EQ(row(index)->reuseIdentifier(), "SaveHistoryContentCell");
        EXPECT_EQ(row(index)->style(), CellStyle::Default);
    }
    EXPECT_EQ(controller->saveContentTable()->frame().height, 88);
}

TEST_F(OrvaneSaveViewControllerTest, FillsTheScreenBelowTheStatusBar)
{
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->view()->frame(), screen.applicationFrame());
}

TEST_F(OrvaneSaveViewControllerTest, SaveWritesTheThreeKeysAndCloses)
{
    makeLogFolder();
    const PropertyValue history = PropertyValue::arrayOf({entry("Snapshot (one)")});
    open(history);
    controller->saveDescription()->setText("by the river");
    controller->savePressed();
    EXPECT_THAT(shell.notes, IsEmpty());
    shell.queue.runPending();
    EXPECT_THAT(shell.notes, ElementsAre("close"));
    EXPECT_EQ(savedAt("1795255200"), PropertyValue::dictionaryOf({
                                         {"Timestamp",   "2026-11-21 10:00:00 +0000"},
                                         {"Data",        history                    },
                                         {"Description", "by the river"             }
    }));
    ASSERT_NE(screen.alert(), nullptr);
    EXPECT_EQ(screen.alert()->title(), "Saved");
    EXPECT_EQ(screen.alert()->message(), folder() + "/OrvaneSnapshot-1795255200.orvane");
    EXPECT_EQ(screen.alert()->buttonTitle(), "Close");
}

TEST_F(OrvaneSaveViewControllerTest, TheNameIsBySecondOfThePressAndTheTimestampOfTheOpening)
{
    makeLogFolder();
    open(PropertyValue::newArray());
    services.clock.now += 75.9;
    controller->savePressed();
    EXPECT_EQ(savedAt("1795255275")["Timestamp"], PropertyValue("2026-11-21 10:00:00 +0000"));
}

TEST_F(OrvaneSaveViewControllerTest, AnEmptyDescriptionAndEmptyContentsAreSavedAsSuch)
{
    makeLogFolder();
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->saveContentTable()->numberOfRows(), 0U);
    controller->savePressed();
    EXPECT_EQ(savedAt("1795255200")["Description"], PropertyValue(""));
    EXPECT_EQ(savedAt("1795255200")["Data"], PropertyValue::newArray());
}

TEST_F(OrvaneSaveViewControllerTest, WhatComesLaterIsNotSaved)
{
    makeLogFolder();
    const PropertyValue history = PropertyValue::arrayOf({entry("one")});
    open(history);
    history.asArray()->append(entry("two"));
    controller->savePressed();
    EXPECT_EQ(savedAt("1795255200")["Data"].asArray()->size(), 1U);
}

TEST_F(OrvaneSaveViewControllerTest, AFailureShowsTheAlertAndCloses)
{
    forbidSaving();
    open(PropertyValue::newArray());
    controller->savePressed();
    shell.queue.runPending();
    EXPECT_THAT(shell.notes, ElementsAre("close"));
    ASSERT_NE(screen.alert(), nullptr);
    EXPECT_EQ(screen.alert()->title(), "File Error");
    EXPECT_EQ(screen.alert()->message(), "Unable to write file to disk");
    EXPECT_EQ(screen.alert()->buttonTitle(), "Close");
    EXPECT_THAT(services.log.errors(), ElementsAre("Unable to write snapshot to " + folder() +
                                                       "/OrvaneSnapshot-1795255200.orvane",
                                                   "The snapshot was not saved: Not a directory"));
}

TEST_F(OrvaneSaveViewControllerTest, ADescriptionThatWasNotSavedIsThereTheNextTime)
{
    forbidSaving();
    open(PropertyValue::newArray());
    controller->saveDescription()->setText("by the river");
    controller->savePressed();
    allowSaving();
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->saveDescription()->text(), "by the river");
    controller->savePressed();
    EXPECT_EQ(savedAt("1795255200")["Description"], PropertyValue("by the river"));
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->saveDescription()->text(), "");
}

TEST_F(OrvaneSaveViewControllerTest, ADescriptionThatWasCancelledIsGone)
{
    forbidSaving();
    open(PropertyValue::newArray());
    controller->saveDescription()->setText("by the river");
    controller->savePressed();
    open(PropertyValue::newArray());
    controller->cancelPressed();
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->saveDescription()->text(), "");
}

TEST_F(OrvaneSaveViewControllerTest, TheButtonsOfTheInterfaceSaveAndCancel)
{
    makeLogFolder();
    open(PropertyValue::newArray());
    const auto press = [this](const std::string& title) {
        for (const auto& view : controller->view()->subviews())
            if (const auto* button = dynamic_cast<Button*>(view.get());
                button && button->title() == title)
                button->press();
        shell.queue.runPending();
    };
    press("Cancel");
    EXPECT_THAT(shell.notes, ElementsAre("close"));
    EXPECT_TRUE(std::filesystem::is_empty(folder()));
    press("Save");
    EXPECT_THAT(shell.notes, ElementsAre("close", "close"));
    EXPECT_FALSE(std::filesystem::is_empty(folder()));
}

TEST_F(OrvaneSaveViewControllerTest, RowsCannotBeUnchecked)
{
    open(PropertyValue::arrayOf({entry("one")}));
    controller->saveContentTable()->selectRow(0);
    EXPECT_EQ(row(0)->accessory(), CellAccessory::Checkmark);
}

TEST_F(OrvaneSaveViewControllerTest, CancelClosesAndWritesNothing)
{
    makeLogFolder();
    open(PropertyValue::newArray());
    controller->cancelPressed();
    shell.queue.runPending();
    EXPECT_THAT(shell.notes, ElementsAre("close"));
    EXPECT_TRUE(std::filesystem::is_empty(folder()));
}

TEST_F(OrvaneSaveViewControllerTest, ReturnRowsAndTheBackgroundGiveTheKeyboardBack)
{
    open(PropertyValue::arrayOf({entry("one")}));
    TextField& field = *controller->saveDescription();
    const auto givesBack = [&](auto act) {
        field.becomeFirstResponder();
        act();
        return !field.isFirstResponder();
    };
    EXPECT_TRUE(givesBack([&] { field.pressReturn(); }));
    EXPECT_TRUE(givesBack([&] { controller->saveContentTable()->selectRow(0); }));
    EXPECT_TRUE(givesBack([&] { dynamic_cast<Control&>(*controller->view()).press(); }));
    EXPECT_TRUE(controller->textFieldShouldReturn(field));
    EXPECT_EQ(controller->numberOfSectionsInTableView(*controller->saveContentTable()), 1U);
}

TEST_F(OrvaneSaveViewControllerTest, EntriesWithoutADescriptionAreEmptyRows)
{
    open(PropertyValue::arrayOf({PropertyValue("no dictionary"), PropertyValue::newDictionary()}));
    EXPECT_EQ(row(0)->textLabel().text(), "");
    EXPECT_EQ(row(1)->textLabel().text(), "");
}

TEST_F(OrvaneSaveViewControllerTest, AnInterfaceThatLacksPartsDoesWhatItCan)
{
    makeLogFolder();
    offer("saveContentTable saveDescription cancelButton background");
    open(PropertyValue::newArray());
    controller->resignFirstResponder();
    controller->savePressed();
    EXPECT_EQ(savedAt("1795255200")["Description"], PropertyValue(""));
}

TEST_F(OrvaneSaveViewControllerTest, WithoutAnInterfaceThereIsNoView)
{
    screen.setInterface("OrvaneSaveViewController", [] { return nullptr; });
    open(PropertyValue::newArray());
    EXPECT_EQ(controller->view(), nullptr);
    controller->didReceiveMemoryWarning();
    controller->viewDidUnload();
}

} // namespace orvane
