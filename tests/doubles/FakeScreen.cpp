#include "doubles/FakeScreen.h"

#include "screens/toolkit/TableView.h"
#include "screens/toolkit/Window.h"

#include <algorithm>

namespace orvane
{

FakeScreen::FakeScreen(Size size) : _size(size) { setMain(this); }

Size FakeScreen::sizeWithFont(std::string_view text, const Font& font) const
{
    const auto characters = std::count_if(text.begin(), text.end(), [](char byte) {
        return (static_cast<unsigned char>(byte) & 0xC0) != 0x80;
    });
    return {static_cast<double>(characters) * (font.isBold ? kBoldCharacterWidth : kCharacterWidth),
            font.size + 3};
}

std::unique_ptr<Interface> FakeScreen::loadInterface(const std::string& name)
{
    const auto found = _interfaces.find(name);
    return found == _interfaces.end() ? nullptr : found->second();
}

NavigationController* FakeScreen::navigation() const
{
    return keyWindow()
               ? dynamic_cast<NavigationController*>(keyWindow()->rootViewController().get())
               : nullptr;
}

std::string FakeScreen::title() const
{
    const auto* stack = navigation();
    return stack && stack->topViewController() ? stack->topViewController()->title() : "";
}

TableView* FakeScreen::table() const
{
    const auto* stack = navigation();
    if (!stack || !stack->topViewController())
        return nullptr;
    auto* table = dynamic_cast<TableView*>(stack->topViewController()->view().get());
    if (table)
        table->setVisibleRows(0, SIZE_MAX);
    return table;
}

std::shared_ptr<TableViewCell> FakeScreen::row(std::size_t index) const
{
    const TableView* shown = table();
    return shown ? shown->cellForRow(index) : nullptr;
}

void FakeScreen::pressRow(std::size_t index)
{
    if (TableView* shown = table())
        shown->selectRow(index);
}

void FakeScreen::pressBack()
{
    if (NavigationController* stack = navigation())
        stack->popViewController(true);
}

void FakeScreen::pressToolbar(BarButtonItem::Kind kind)
{
    const auto* stack = navigation();
    if (!stack || !stack->topViewController())
        return;
    const auto items = stack->topViewController()->toolbarItems();
    const auto found = std::find_if(items.begin(), items.end(),
                                    [&](const auto& item) { return item->kind() == kind; });
    if (found != items.end())
        (*found)->press();
}

} // namespace orvane
