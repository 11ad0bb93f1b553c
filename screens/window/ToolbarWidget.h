#pragma once

#include "screens/toolkit/ViewController.h"

#include <QWidget>

#include <functional>
#include <vector>

class QHBoxLayout;

namespace orvane
{

// The bar below a pane. The toolkit makes new items at every change. Their widgets are kept as long
// as the kinds of the items stay the same.
class ToolbarWidget final : public QWidget
{
public:
    // `press` is called with the index of the item whose button was pressed.
    ToolbarWidget(QWidget* parent, std::function<void(std::size_t)> press);

    void sync(const ViewController::ToolbarItems& items);
    // The widget of an item; null for a flexible space and for an index without an item.
    [[nodiscard]] QWidget* itemWidget(std::size_t index) const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    enum class Kind { Busy, Text, Space, Save, Other };
    struct Item {
        Kind kind;
        QWidget* widget; // a child, or null
    };

    static Kind kindOf(const BarButtonItem* item);
    void rebuild(const std::vector<Kind>& kinds);
    QWidget* makeWidget(Kind kind, std::size_t index);
    static void update(const Item& item, View& view);

    std::function<void(std::size_t)> _press;
    QHBoxLayout* _layout;
    std::vector<Item> _items;
};

} // namespace orvane
