#pragma once

#include "screens/toolkit/BarButtonItem.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Screen.h"
#include "screens/toolkit/TableViewCell.h"

#include <functional>
#include <map>
#include <memory>
#include <string>

namespace orvane
{

class TableView;

// A front end without a screen and with fixed font metrics, in which tests press, type and read
// frames. A code point is 8 points wide, 9 in bold; a line is 3 points higher than the font size.
// It is the main screen during its lifetime.
class FakeScreen final : public Screen
{
public:
    static constexpr double kCharacterWidth = 8;
    static constexpr double kBoldCharacterWidth = 9;

    explicit FakeScreen(Size size = {320, 480});

    [[nodiscard]] Rect bounds() const override { return {0, 0, _size.width, _size.height}; }
    // Below a status bar of 20 points.
    [[nodiscard]] Rect applicationFrame() const override
    {
        return {0, 20, _size.width, _size.height - 20};
    }
    [[nodiscard]] Size sizeWithFont(std::string_view text, const Font& font) const override;
    [[nodiscard]] std::unique_ptr<Interface> loadInterface(const std::string& name) override;
    void setNeedsUpdate() override
    {
        ++_updateCount;
        if (onUpdate)
            onUpdate();
    }
    // Called for each change, from within the call that makes it.
    std::function<void()> onUpdate;

    // The number of changes so far.
    [[nodiscard]] int updateCount() const { return _updateCount; }
    // The interface files that exist, by name.
    void setInterface(const std::string& name, std::function<std::unique_ptr<Interface>()> make)
    {
        _interfaces[name] = std::move(make);
    }

    // What a user sees and does. Null or empty if it is not on the screen.

    // The stack that fills the window.
    [[nodiscard]] NavigationController* navigation() const;
    [[nodiscard]] std::string title() const;
    // The table in front. From then on all its rows are visible.
    [[nodiscard]] TableView* table() const;
    [[nodiscard]] std::shared_ptr<TableViewCell> row(std::size_t index) const;
    void pressRow(std::size_t index);
    void pressBack();
    // The toolbar's standard button of that kind.
    void pressToolbar(BarButtonItem::Kind kind);

private:
    Size _size;
    int _updateCount = 0;
    std::map<std::string, std::function<std::unique_ptr<Interface>()>> _interfaces;
};

} // namespace orvane
