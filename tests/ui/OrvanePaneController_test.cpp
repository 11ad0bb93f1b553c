#include "ui/OrvanePaneController.h"

#include "platform/base/PropertyValue.h"

#include "doubles/FakeScreen.h"
#include "screens/toolkit/ActivityIndicator.h"
#include "screens/toolkit/Window.h"
#include "ui/OrvaneCell.h"
#include "ui/PaneStack.h"
#include "ui/support/FakeShell.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using Kind = BarButtonItem::Kind;

NodePointer tree(const PropertyValue& display)
{
    PathDictionary paths;
    return OrvaneModelNode::makeTreeFromObject(display, paths);
}

PropertyValue group(std::initializer_list<std::pair<std::string, PropertyValue>> rows)
{
    PropertyValue made = PropertyValue::newDictionary();
    for (const auto& [key, value] : rows)
        made.asDictionary()->set(key, value);
    return made;
}

// A root pane on the screen.
class OrvanePaneControllerTest : public ::testing::Test
{
protected:
    OrvanePaneControllerTest()
    {
        window.setRootViewController(navigation);
        window.makeKeyAndVisible();
    }

    void show(const PropertyValue& display) { root->reloadWithNode(tree(display)); }
    [[nodiscard]] OrvanePaneController& top() const { return *topPane(*navigation); }
    [[nodiscard]] std::shared_ptr<OrvaneCell> cell(std::size_t row) const
    {
        return std::dynamic_pointer_cast<OrvaneCell>(screen.row(row));
    }
    // "key: value", or "key >" for a group, of each row.
    [[nodiscard]] std::vector<std::string> rows() const
    {
        std::vector<std::string> texts;
        for (std::size_t row = 0; row < screen.table()->numberOfRows(); ++row) {
            const bool isGroup = cell(row)->accessory() == CellAccessory::DisclosureIndicator;
            const auto& value = cell(row)->value();
            texts.push_back(cell(row)->key()->text() +
                            (isGroup ? " >" : ": " + (value ? value->text() : "(no label)")));
        }
        return texts;
    }
    [[nodiscard]] std::vector<Kind> toolbarKinds() const
    {
        std::vector<Kind> kinds;
        for (const auto& item : top().toolbarItems())
            kinds.push_back(item->kind());
        return kinds;
    }
    template <typename V>
    [[nodiscard]] const V& toolbarView(std::size_t index) const
    {
        return dynamic_cast<const V&>(*top().toolbarItems().at(index)->customView());
    }

    FakeScreen screen;
    FakeShell shell;
    std::shared_ptr<OrvanePaneController> root =
        std::make_shared<OrvanePaneController>(nullptr, "/", shell);
    std::shared_ptr<NavigationController> navigation = std::make_shared<NavigationController>(root);
    Window window{screen.bounds()};
};

} // namespace

TEST_F(OrvanePaneControllerTest, WithoutANodeItIsCalledOrvaneAndHasNoRows)
{
    EXPECT_EQ(screen.title(), "Orvane");
    EXPECT_EQ(screen.table()->numberOfRows(), 0U);
    EXPECT_EQ(root->path(), "/");
    EXPECT_TRUE(root->isBusy());
    EXPECT_EQ(root->statusText(), "");
}

TEST_F(OrvanePaneControllerTest, ALeafHasNoRows)
{
    show("text");
    EXPECT_EQ(screen.table()->numberOfRows(), 0U);
}

TEST_F(OrvanePaneControllerTest, GroupsLeadOnAndValuesShowTheirText)
{
    show(group({
        {"Group", group({{"k", "v"}})},
        {"Key",   "value"            },
        {"Empty", group({})          }
    }));
    EXPECT_THAT(rows(), ElementsAre("Group >", "Key: value", "Empty >"));
    EXPECT_EQ(cell(0)->value(), nullptr);
    EXPECT_EQ(cell(1)->style(), CellStyle::Value);
    EXPECT_EQ(cell(1)->reuseIdentifier(), "OrvanePaneControllerCell");
    EXPECT_EQ(cell(0)->reuseIdentifier(), "OrvanePaneControllerCell");
}

TEST_F(OrvanePaneControllerTest, AGroupsCellReusedForAValueShowsNoValue)
{
    show(group({
        {"a", group({})}
    }));
    const auto groupCell = cell(0);
    show(group({
        {"a", "value"}
    }));
    EXPECT_EQ(cell(0), groupCell);
    EXPECT_THAT(rows(), ElementsAre("a: (no label)"));
    EXPECT_EQ(cell(0)->accessory(), CellAccessory::None);
}

// The accessory takes room from the content, so the layout must already know it.
TEST_F(OrvanePaneControllerTest, AValueInACellThatWasAGroupsIsFlushAgainstTheEdgeWithoutAccessory)
{
    const PropertyValue value = group({
        {"a", "value"}
    });
    show(value);
    const auto valueCell = cell(0);
    const Rect alone = valueCell->value()->frame();
    show(group({
        {"a", group({})}
    }));
    ASSERT_EQ(cell(0), valueCell);
    ASSERT_EQ(cell(0)->accessory(), CellAccessory::DisclosureIndicator);
    show(value);
    ASSERT_EQ(cell(0), valueCell);
    EXPECT_EQ(cell(0)->value()->frame(), alone);
}

TEST_F(OrvanePaneControllerTest, AValuesCellReusedForAGroupShowsTheKeyAlone)
{
    show(group({
        {"a", "value"}
    }));
    static_cast<void>(rows());
    show(group({
        {"a", group({})}
    }));
    EXPECT_THAT(rows(), ElementsAre("a >"));
    EXPECT_EQ(cell(0)->value()->text(), "");
}

TEST_F(OrvanePaneControllerTest, ScrollingAMixedPaneBlanksNoValue)
{
    const auto display = PropertyValue::newDictionary();
    for (int index = 0; index < 20; ++index)
        display.asDictionary()->set("group " + std::to_string(index), PropertyValue::newArray());
    for (int index = 0; index < 20; ++index)
        display.asDictionary()->set("value " + std::to_string(index), "v");
    TableView& table = root->tableView();
    for (std::size_t first : {0U, 15U, 30U, 15U, 0U, 30U}) {
        show(display);
        table.setVisibleRows(first, 10);
        for (std::size_t row = std::max<std::size_t>(first, 20); row < first + 10; ++row) {
            const auto shown = std::dynamic_pointer_cast<OrvaneCell>(table.cellForRow(row));
            ASSERT_TRUE(shown->value()) << row;
            EXPECT_EQ(shown->value()->text(), "v");
        }
    }
}

TEST_F(OrvanePaneControllerTest, ARefreshKeepsTheCellsOfAnUnchangedPane)
{
    const auto display = group({
        {"Group", group({})},
        {"Key",   "1"      }
    });
    show(display);
    const auto before = cell(1);
    display.asDictionary()->set("Key", "2");
    show(display);
    EXPECT_EQ(cell(1), before);
    EXPECT_THAT(rows(), ElementsAre("Group >", "Key: 2"));
}

TEST_F(OrvanePaneControllerTest, TheToolbarHasIndicatorStatusSpaceAndSaveInThisOrder)
{
    root->setStatus("Updated", true);
    EXPECT_THAT(toolbarKinds(),
                ElementsAre(Kind::CustomView, Kind::CustomView, Kind::FlexibleSpace, Kind::Save));
    const auto& label = toolbarView<Label>(1);
    EXPECT_EQ(label.text(), "Updated");
    EXPECT_EQ(label.font(), Font::system(14));
    EXPECT_EQ(label.backgroundColour(), Colour::Clear);
    EXPECT_EQ(label.textColour(), Colour::DarkText);
    EXPECT_EQ(label.frame(), (Rect{0, 0, 7 * 8, 17}));
    EXPECT_FALSE(navigation->isToolbarHidden());
}

TEST_F(OrvanePaneControllerTest, WhereSavingIsNotOfferedTheToolbarHasThreeItems)
{
    shell.isSavingOffered = false;
    root->setStatus("x", false);
    EXPECT_THAT(toolbarKinds(),
                ElementsAre(Kind::CustomView, Kind::CustomView, Kind::FlexibleSpace));
}

TEST_F(OrvanePaneControllerTest, TheIndicatorTurnsWhileBusyAndIsHiddenElse)
{
    root->setStatus("x", true);
    EXPECT_TRUE(toolbarView<ActivityIndicator>(0).isAnimating());
    EXPECT_FALSE(toolbarView<ActivityIndicator>(0).isHidden());
    root->setStatus("x", false);
    EXPECT_FALSE(toolbarView<ActivityIndicator>(0).isAnimating());
    EXPECT_TRUE(toolbarView<ActivityIndicator>(0).isHidden());
}

TEST_F(OrvanePaneControllerTest, NoToolbarItemOutlivesAStatusAReloadOrAnAppearance)
{
    const auto isNew = [this](auto change) {
        const auto before = root->toolbarItems();
        change();
        for (const auto& item : before)
            for (const auto& now : root->toolbarItems())
                if (item == now || (item->customView() && item->customView() == now->customView()))
                    return false;
        return true;
    };
    EXPECT_TRUE(isNew([this] { root->setStatus("x", false); }));
    EXPECT_TRUE(isNew([this] { root->reloadWithNode(nullptr); }));
    EXPECT_TRUE(isNew([this] { root->viewWillAppear(false); }));
}

TEST_F(OrvanePaneControllerTest, NoStatusIsAnEmptyOne)
{
    root->setStatus(std::nullopt, false);
    EXPECT_EQ(root->statusText(), "");
}

TEST_F(OrvanePaneControllerTest, SaveAsksTheShellForTheSaveScreen)
{
    screen.pressToolbar(Kind::Save);
    EXPECT_THAT(shell.notes, ElementsAre("show"));
}

TEST_F(OrvanePaneControllerTest, AGroupIsPushedWithItsPathAndItsParentsStatus)
{
    show(group({
        {"Group", group({{"Sub", group({{"k", "v"}})}})}
    }));
    root->setStatus("Updated", false);
    screen.pressRow(0);
    EXPECT_EQ(top().path(), "/Group");
    EXPECT_EQ(screen.title(), "Group");
    EXPECT_EQ(top().statusText(), "Updated");
    EXPECT_FALSE(top().isBusy());
    EXPECT_TRUE(navigation->isLastChangeAnimated());
    screen.pressRow(0);
    EXPECT_EQ(top().path(), "/Group/Sub");
    EXPECT_THAT(rows(), ElementsAre("k: v"));
    screen.pressBack();
    screen.pressBack();
    EXPECT_EQ(&top(), root.get());
    EXPECT_EQ(screen.table()->selectedRow(), std::nullopt);
}

TEST_F(OrvanePaneControllerTest, AValueRowIsOnlyDeselected)
{
    show(group({
        {"Key", "value"}
    }));
    screen.pressRow(0);
    EXPECT_EQ(&top(), root.get());
    EXPECT_EQ(screen.table()->selectedRow(), std::nullopt);
}

TEST_F(OrvanePaneControllerTest, WithoutAnIndexPathNothingHappens)
{
    show(group({
        {"Group", group({})}
    }));
    root->didSelectRowAtIndexPath(*screen.table(), std::nullopt);
    root->didSelectRowAtIndexPath(*screen.table(), IndexPath{0, 7});
    EXPECT_EQ(&top(), root.get());
    EXPECT_EQ(root->cellForRowAtIndexPath(*screen.table(), {0, 7}), nullptr);
}

TEST_F(OrvanePaneControllerTest, OffAnyStackAGroupLeadsNowhere)
{
    OrvanePaneController alone(tree(group({
                                   {"Group", group({})}
    })),
                               "/", shell);
    alone.tableView().reloadData();
    alone.viewWillAppear(true);
    alone.tableView().selectRow(0);
    EXPECT_EQ(alone.title(), "Orvane");
}

TEST_F(OrvanePaneControllerTest, ANewWindowWidthLaysTheRowsOutAnew)
{
    show(group({
        {"Key", "value"}
    }));
    static_cast<void>(rows());
    screen.table()->setFrame({0, 0, 640, 320});
    EXPECT_EQ(cell(0)->strip()->frame().width, 640 - TableViewCell::kMargin);
}

} // namespace orvane
