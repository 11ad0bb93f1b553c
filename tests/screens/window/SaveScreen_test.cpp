#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"
#include "screens/window/AlertWidget.h"
#include "screens/window/FlatButton.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/Theme.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/UiInterface.h"
#include "screens/window/WindowTest.h"
#include "ui/SnapshotFile.h"

#include <QInputMethodEvent>
#include <QLabel>
#include <QLineEdit>
#include <QTest>

#include <filesystem>

namespace orvane
{

namespace
{

class SaveScreenTest : public WindowTest
{
protected:
    SaveScreenTest()
    {
        for (const char* description : {"Current", "Snapshot (2026-11-21 10:00:00 +0000)"}) {
            const PropertyValue entry = PropertyValue::newDictionary();
            entry.asDictionary()->set("Description", description);
            saveContents.asArray()->append(entry);
        }
        show(rootNode({valueNode("Technology", "LTE")}));
    }

    void open()
    {
        showSaveView();
        turnEvents();
    }
    void makeLogFolder() const { std::filesystem::create_directories(files().located(kLogFolder)); }
    [[nodiscard]] std::vector<std::string> savedFiles() const
    {
        std::vector<std::string> paths;
        for (const auto& entry : std::filesystem::directory_iterator(files().located(kLogFolder)))
            paths.push_back(entry.path().string());
        return paths;
    }
    template <typename Widget>
    [[nodiscard]] Widget* part(const char* name) const
    {
        const UiInterface* interface = frame().sheet().interface();
        return interface ? dynamic_cast<Widget*>(
                               interface->widget().findChild<QWidget*>(QLatin1String(name)))
                         : nullptr;
    }
    [[nodiscard]] QLineEdit& field() const { return *part<QLineEdit>("saveDescription"); }
    void click(const char* button)
    {
        QTest::mouseClick(part<FlatButton>(button), Qt::LeftButton);
        queue.runPending();
        turnEvents();
    }
    void type(const QString& text) { QTest::keyClicks(&field(), text); }
    [[nodiscard]] bool isOpen() const { return frame().sheet().isVisible(); }
};

TEST_F(SaveScreenTest, OpensFromTheToolbar)
{
    auto* button = dynamic_cast<FlatButton*>(frame().toolbar().itemWidget(3));
    ASSERT_TRUE(button);
    EXPECT_EQ(button->text(), "Save");
    QTest::mouseClick(button, Qt::LeftButton);
    turnEvents();
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, OpensWithControlS)
{
    QTest::keyClick(&table(), Qt::Key_S, Qt::ControlModifier);
    turnEvents();
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, ListsWhatIsSavedWithCheckMarks)
{
    open();
    auto* entries = part<TableWidget>("saveContentTable");
    ASSERT_TRUE(entries);
    ASSERT_EQ(entries->rowCount(), 2U);
    EXPECT_EQ(entries->rowWidget(0)->accessibleName(), "Current");
    EXPECT_EQ(entries->rowWidget(0)->content().accessory, CellAccessory::Checkmark);
    EXPECT_EQ(entries->rowWidget(0)->content().labels.front().alignment & Qt::AlignHorizontal_Mask,
              Qt::AlignLeft);
    EXPECT_EQ(field().placeholderText(), "Description");
}

TEST_F(SaveScreenTest, SavedFileHoldsTheTypedDescription)
{
    makeLogFolder();
    open();
    field().setFocus();
    type("by the river");
    EXPECT_EQ(saveScreen()->saveDescription()->text(), "by the river");
    click("saveButton");
    EXPECT_FALSE(isOpen());
    ASSERT_EQ(savedFiles().size(), 1U);
    const auto content = readFile(savedFiles().front());
    ASSERT_TRUE(content);
    const PropertyValue snapshot = readPropertyList(*content).value;
    ASSERT_TRUE(snapshot.asDictionary());
    EXPECT_EQ(*(*snapshot.asDictionary())["Description"].asString(), "by the river");
    EXPECT_EQ((*snapshot.asDictionary())["Data"].asArray()->size(), 2U);
}

TEST_F(SaveScreenTest, TheAlertSaysWhereTheSavedFileIs)
{
    open();
    click("saveButton");
    ASSERT_TRUE(frame().alert().isVisible());
    ASSERT_TRUE(screen.alert());
    EXPECT_EQ(screen.alert()->title(), "Saved");
    ASSERT_EQ(savedFiles().size(), 1U);
    EXPECT_EQ(screen.alert()->message(), savedFiles().front());
}

TEST_F(SaveScreenTest, WhereNothingCanBeWrittenTheAlertStaysAndTheScreenGoes)
{
    ASSERT_TRUE(writeFile(files().located("/var"), {})); // so that the folder cannot be made
    open();
    click("saveButton");
    EXPECT_FALSE(isOpen());
    ASSERT_TRUE(frame().alert().isVisible());
    QStringList texts;
    for (const QLabel* label : frame().alert().findChildren<QLabel*>())
        texts += label->text();
    EXPECT_TRUE(texts.contains("File Error"));
    EXPECT_TRUE(texts.contains("Unable to write file to disk"));
    EXPECT_EQ(frame().alert().button().text(), "Close");
    QTest::mouseClick(&frame().alert().button(), Qt::LeftButton);
    turnEvents();
    EXPECT_FALSE(frame().alert().isVisible());
}

TEST_F(SaveScreenTest, EscapeAnswersTheAlertAndThenCancels)
{
    open();
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    QTest::keyClick(&frame().alert().button(), Qt::Key_Escape);
    turnEvents();
    EXPECT_FALSE(frame().alert().isVisible());
    EXPECT_TRUE(isOpen());
    QTest::keyClick(&frame(), Qt::Key_Escape);
    queue.runPending();
    turnEvents();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(saveScreen());
}

TEST_F(SaveScreenTest, EnterPressesTheAlertsButton)
{
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    EXPECT_EQ(frame().focusWidget(), &frame().alert().button());
    QTest::keyClick(&frame().alert().button(), Qt::Key_Return);
    turnEvents();
    EXPECT_FALSE(frame().alert().isVisible());
    EXPECT_EQ(frame().focusWidget(), &table()) << "the keyboard is the pane's again";
}

TEST_F(SaveScreenTest, AlertsButtonShowsTheKeyboardsRingToThoseWhoUseTheKeyboard)
{
    const FlatButton& button = frame().alert().button();
    clickRow(0);
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    EXPECT_FALSE(button.hasRing()) << "the mouse brought it";
    QTest::keyClick(frame().focusWidget(), Qt::Key_Tab);
    EXPECT_EQ(frame().focusWidget(), &button);
    EXPECT_TRUE(button.hasRing());
    screen.dismissAlert();
    turnEvents();
    QTest::keyClick(&table(), Qt::Key_Down);
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    EXPECT_TRUE(button.hasRing());
}

TEST_F(SaveScreenTest, AlertsTextsAreInTheThemesColour)
{
    QPalette dark;
    dark.setColor(QPalette::Window, QColor(30, 30, 30));
    frame().setPalette(dark);
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    for (const QLabel* label : frame().alert().findChildren<QLabel*>())
        EXPECT_EQ(label->palette().color(QPalette::WindowText), Theme::of(frame()).text);
}

TEST_F(SaveScreenTest, MousesBackButtonAnswersTheAlertAndThenCancels)
{
    open();
    screen.showAlert(std::make_unique<AlertView>("Title", "Message", "Close"));
    turnEvents();
    QTest::mouseClick(&frame().alert(), Qt::BackButton, {}, {5, 5});
    turnEvents();
    EXPECT_FALSE(frame().alert().isVisible());
    ASSERT_TRUE(isOpen());
    QTest::mouseClick(&frame().sheet(), Qt::BackButton, {}, {5, 5});
    queue.runPending();
    turnEvents();
    EXPECT_FALSE(isOpen());
}

TEST_F(SaveScreenTest, TypingRightAfterControlSIsTheDescription)
{
    QTest::keyClick(&table(), Qt::Key_S, Qt::ControlModifier);
    turnEvents();
    ASSERT_TRUE(isOpen());
    QTest::keyClicks(frame().focusWidget(), "north");
    EXPECT_EQ(field().text(), "north");
    EXPECT_EQ(saveScreen()->saveDescription()->text(), "north");
    EXPECT_TRUE(saveScreen()->saveDescription()->isFirstResponder());
}

TEST_F(SaveScreenTest, TabGoesFromTheFieldOverTheListToTheButtonsAndRound)
{
    open();
    QStringList reached;
    for (int i = 0; i < 4; ++i) {
        QTest::keyClick(frame().focusWidget(), Qt::Key_Tab);
        reached += frame().focusWidget()->objectName();
    }
    EXPECT_EQ(reached,
              QStringList({"saveContentTable", "cancelButton", "saveButton", "saveDescription"}));
}

TEST_F(SaveScreenTest, ReturnAndEnterPressItsButtons)
{
    makeLogFolder();
    open();
    QTest::keyClick(part<FlatButton>("cancelButton"), Qt::Key_Return);
    queue.runPending();
    turnEvents();
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(savedFiles().empty());
    open();
    QTest::keyClick(part<FlatButton>("saveButton"), Qt::Key_Enter);
    queue.runPending();
    turnEvents();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(savedFiles().size(), 1U);
}

TEST_F(SaveScreenTest, ReturnOpensItFromTheToolbar)
{
    QTest::keyClick(frame().toolbar().itemWidget(3), Qt::Key_Return);
    turnEvents();
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, HeldReturnPressesAButtonOnce)
{
    QWidget* button = frame().toolbar().itemWidget(3);
    QKeyEvent press(QEvent::KeyPress, Qt::Key_Return, {});
    QKeyEvent repeated(QEvent::KeyPress, Qt::Key_Return, {}, {}, true);
    for (QKeyEvent* event : {&press, &repeated, &repeated})
        QCoreApplication::sendEvent(button, event);
    turnEvents();
    EXPECT_FALSE(isOpen());
    QTest::keyRelease(button, Qt::Key_Return);
    turnEvents();
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, TextsHaveTheSizesOfThePanes)
{
    open();
    EXPECT_EQ(field().font().pixelSize(), 15);
    EXPECT_EQ(part<QLabel>("captionLabel")->font().pixelSize(), 13);
    EXPECT_EQ(part<QLabel>("titleLabel")->font().pixelSize(), 16);
}

TEST_F(SaveScreenTest, PressedEntryIsNotLeftMarked)
{
    open();
    auto* entries = part<TableWidget>("saveContentTable");
    const RowWidget* entry = entries->rowWidget(1);
    QTest::mouseClick(entries, Qt::LeftButton, {}, entry->geometry().center());
    turnEvents();
    EXPECT_FALSE(entry->isPressed());
}

TEST_F(SaveScreenTest, CancelWritesNothing)
{
    makeLogFolder();
    open();
    click("cancelButton");
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(savedFiles().empty());
}

TEST_F(SaveScreenTest, InputMethodTypesTheDescription)
{
    open();
    field().setFocus();
    QInputMethodEvent composing(QStringLiteral("mün"), {});
    QCoreApplication::sendEvent(&field(), &composing);
    EXPECT_EQ(saveScreen()->saveDescription()->text(), "");
    QInputMethodEvent done;
    done.setCommitString(QStringLiteral("münchen 中"));
    QCoreApplication::sendEvent(&field(), &done);
    EXPECT_EQ(saveScreen()->saveDescription()->text(), "münchen 中");
}

TEST_F(SaveScreenTest, RefreshDisturbsNoTyping)
{
    open();
    field().setFocus();
    type("abc");
    field().setCursorPosition(1);
    QInputMethodEvent composing(QStringLiteral("x"), {});
    QCoreApplication::sendEvent(&field(), &composing);
    refresh(rootNode({valueNode("Technology", "UMTS")}));
    setStatus("Updated", false);
    EXPECT_EQ(field().text(), "abc");
    EXPECT_EQ(frame().focusWidget(), &field());
    QInputMethodEvent done;
    done.setCommitString(QStringLiteral("x"));
    QCoreApplication::sendEvent(&field(), &done);
    EXPECT_EQ(field().text(), "axbc") << "composed where the cursor was";
}

TEST_F(SaveScreenTest, ReturnGivesTheKeyboardBack)
{
    open();
    field().setFocus();
    turnEvents();
    EXPECT_TRUE(saveScreen()->saveDescription()->isFirstResponder());
    QTest::keyClick(&field(), Qt::Key_Return);
    turnEvents();
    EXPECT_FALSE(saveScreen()->saveDescription()->isFirstResponder());
    EXPECT_NE(frame().focusWidget(), &field());
    EXPECT_TRUE(frame().sheet().isAncestorOf(frame().focusWidget()));
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, PressBesideEverythingGivesTheKeyboardBack)
{
    open();
    field().setFocus();
    turnEvents();
    auto* caption = part<QLabel>("captionLabel");
    ASSERT_TRUE(caption);
    QTest::mouseClick(caption, Qt::LeftButton);
    turnEvents();
    EXPECT_NE(frame().focusWidget(), &field());
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, PanesBeneathAreOutOfReach)
{
    open();
    field().setFocus();
    for (int i = 0; i < 8; ++i) {
        QTest::keyClick(frame().focusWidget(), Qt::Key_Tab);
        EXPECT_TRUE(frame().sheet().isAncestorOf(frame().focusWidget()));
    }
    QTest::keyClick(&frame(), Qt::Key_S, Qt::ControlModifier);
    turnEvents();
    EXPECT_TRUE(isOpen());
}

TEST_F(SaveScreenTest, OpensAnewAfterItWasClosed)
{
    open();
    type("first");
    click("cancelButton");
    open();
    EXPECT_TRUE(isOpen());
    EXPECT_EQ(field().text(), "");
}

TEST_F(SaveScreenTest, MissingInterfaceFileIsTold)
{
    EXPECT_FALSE(screen.loadInterface("Nothing"));
    ASSERT_EQ(services.log.errors().size(), 1U);
    EXPECT_EQ(services.log.errors().front(), "There is no interface file \"Nothing.ui\"\n");
}

TEST_F(SaveScreenTest, MalformedInterfaceFileIsToldAndOpensNothing)
{
    Services::current().setResources(&services.memoryResources);
    services.memoryResources.put("OrvaneSaveViewController.ui", "<ui><widget class=\"QWidget\"");
    open();
    EXPECT_FALSE(isOpen());
    bool isTold = false;
    for (const std::string& line : services.log.errors())
        isTold |= line.starts_with("The interface file \"OrvaneSaveViewController.ui\"");
    EXPECT_TRUE(isTold);
}

} // namespace

} // namespace orvane
