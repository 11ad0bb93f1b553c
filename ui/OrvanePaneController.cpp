#include "ui/OrvanePaneController.h"

#include "screens/toolkit/ActivityIndicator.h"
#include "screens/toolkit/NavigationController.h"
#include "ui/OrvaneCell.h"

#include <utility>

namespace orvane
{

namespace
{

constexpr const char* kNoNodeTitle = "Orvane";
// Deliberate: both kinds of row share one identifier. A cell made for a group, which has no value
// label, may be reused for a value, which it then does not show.
constexpr const char* kCellIdentifier = "OrvanePaneControllerCell";
constexpr double kStatusFontSize = 14.0;

std::shared_ptr<BarButtonItem> busyIndicator(bool isLoading)
{
    const auto indicator = std::make_shared<ActivityIndicator>();
    indicator->setHidesWhenStopped(true);
    if (isLoading)
        indicator->startAnimating();
    return std::make_shared<BarButtonItem>(indicator);
}

std::shared_ptr<BarButtonItem> statusLabel(const std::string& text)
{
    const auto label = std::make_shared<Label>();
    label->setText(text);
    label->setFont(Font::system(kStatusFontSize));
    label->setBackgroundColour(Colour::Clear);
    label->setTextColour(Colour::DarkText);
    label->sizeToFit();
    return std::make_shared<BarButtonItem>(label);
}

} // namespace

OrvanePaneController::OrvanePaneController(NodePointer node, std::string path, Shell& shell)
    : _nodes(std::move(node)), _keyPath(std::move(path)), _shell(shell)
{
}

void OrvanePaneController::reloadWithNode(NodePointer node)
{
    _nodes = std::move(node);
    showTitle();
    tableView().reloadData();
    createToolbarItems();
}

void OrvanePaneController::setStatus(std::optional<std::string> text, bool isBusy)
{
    status = std::move(text).value_or("");
    isLoading = isBusy;
    createToolbarItems();
}

void OrvanePaneController::createToolbarItems()
{
    ToolbarItems items = {busyIndicator(isLoading), statusLabel(status),
                          std::make_shared<BarButtonItem>(BarButtonItem::Kind::FlexibleSpace)};
    if (_shell.allowSaveButton())
        items.push_back(std::make_shared<BarButtonItem>(
            BarButtonItem::Kind::Save, [&shell = _shell] { shell.showSaveView(); }));
    setToolbarItems(std::move(items), true);
}

void OrvanePaneController::viewWillAppear(bool animated)
{
    TableViewController::viewWillAppear(animated);
    showTitle();
    if (NavigationController* navigation = navigationController())
        navigation->setToolbarHidden(false);
    createToolbarItems();
}

void OrvanePaneController::viewWillDisappear(bool) { resignFirstResponder(); }

std::size_t OrvanePaneController::numberOfRowsInSection(TableView&, std::size_t)
{
    const auto* children = _nodes ? _nodes->childNodes() : nullptr;
    return children ? children->size() : 0;
}

std::shared_ptr<TableViewCell>
OrvanePaneController::cellForRowAtIndexPath(TableView& table, const IndexPath& indexPath)
{
    const OrvaneModelNode* node = nodeAt(indexPath);
    if (!node)
        return nullptr;
    const bool isGroup = node->childNodes() != nullptr;
    auto cell = std::static_pointer_cast<OrvaneCell>(table.dequeueReusableCell(kCellIdentifier));
    if (!cell)
        cell = isGroup ? OrvaneCell::withStyleKey(CellStyle::Value, kCellIdentifier)
                       : OrvaneCell::withStyle(CellStyle::Value, kCellIdentifier);
    cell->setAccessory(isGroup ? CellAccessory::DisclosureIndicator : CellAccessory::None);
    const std::string* value = node->value();
    cell->setTexts(node->displayName(), value ? *value : "");
    if (isGroup)
        cell->setLayoutKey();
    else
        cell->setLayout();
    return cell;
}

void OrvanePaneController::didSelectRowAtIndexPath(TableView& table,
                                                   const std::optional<IndexPath>& indexPath)
{
    const NodePointer node = indexPath ? sharedNodeAt(*indexPath) : nullptr;
    if (!node)
        return;
    if (!node->childNodes()) {
        table.deselectRow(*indexPath, false);
        return;
    }
    const auto pane = std::make_shared<OrvanePaneController>(
        node, pathByAppending(_keyPath, node->displayName()), _shell);
    pane->setStatus(status, isLoading);
    if (NavigationController* navigation = navigationController())
        navigation->pushViewController(pane, true);
}

NodePointer OrvanePaneController::sharedNodeAt(const IndexPath& indexPath) const
{
    const auto* children = _nodes ? _nodes->childNodes() : nullptr;
    const std::size_t index = indexPath.lastIndex();
    return children && index < children->size() ? (*children)[index] : nullptr;
}

const OrvaneModelNode* OrvanePaneController::nodeAt(const IndexPath& indexPath) const
{
    return sharedNodeAt(indexPath).get();
}

void OrvanePaneController::showTitle() { setTitle(_nodes ? _nodes->displayName() : kNoNodeTitle); }

} // namespace orvane
