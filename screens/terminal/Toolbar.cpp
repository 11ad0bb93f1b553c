#include "screens/terminal/Toolbar.h"

#include "screens/terminal/LineWidth.h"
#include "screens/toolkit/ActivityIndicator.h"
#include "screens/toolkit/Label.h"

#include <algorithm>

namespace orvane
{

int drawToolbar(Canvas& canvas, int line, const ViewController& controller)
{
    int column = 1;
    const auto& turns = canvas.marks.indicator;
    for (const auto& item : controller.toolbarItems()) {
        const View* view = item->customView().get();
        if (!view || view->isHidden())
            continue;
        if (const auto* indicator = dynamic_cast<const ActivityIndicator*>(view)) {
            if (!indicator->isAnimating())
                continue;
            const std::size_t turn = static_cast<std::size_t>(canvas.turn) % turns.size();
            column = canvas.grid.put(line, column, turns[turn] + " ", {Ink::Bar, false});
        } else if (const auto* label = dynamic_cast<const Label*>(view)) {
            column = canvas.grid.put(
                line, column,
                shortened(label->text(), canvas.columns() - column - 1, canvas.marks.cut) + " ",
                {Ink::BarQuiet, false});
        }
    }
    return column;
}

bool isBusy(const ViewController& controller)
{
    const auto& items = controller.toolbarItems();
    return std::any_of(items.begin(), items.end(), [](const auto& item) {
        const auto* indicator = dynamic_cast<const ActivityIndicator*>(item->customView().get());
        return indicator && !indicator->isHidden() && indicator->isAnimating();
    });
}

const BarButtonItem* saveItem(const ViewController& controller)
{
    const auto& items = controller.toolbarItems();
    const auto found = std::find_if(items.begin(), items.end(), [](const auto& item) {
        return item->kind() == BarButtonItem::Kind::Save;
    });
    return found == items.end() ? nullptr : found->get();
}

} // namespace orvane
