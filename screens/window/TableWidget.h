#pragma once

#include "screens/toolkit/TableView.h"
#include "screens/window/RowWidget.h"
#include "screens/window/TableTouch.h"

#include <QWidget>

#include <map>
#include <memory>
#include <optional>
#include <vector>

class QHelpEvent;
class QScrollBar;

namespace orvane
{

// A table on the screen. It has widgets for the visible rows, which are reused while it scrolls.
//
// A reload keeps how far it is scrolled in both directions, which row has the keyboard, and a press
// under way as long as the same row is under the finger.
class TableWidget final : public QWidget, private TableTouch::Table
{
public:
    explicit TableWidget(QWidget* parent = nullptr);
    ~TableWidget() override;

    // Shows that table from the next sync() on, for as long as the table exists.
    void setTable(const std::shared_ptr<TableView>& table) { _table = table; }
    // Shows the current contents of the table. Changes only what differs.
    void sync();

    void setEdgeSwipe(EdgeSwipe swipe) { _touch.setEdgeSwipe(std::move(swipe)); }

    // As high as all rows together.
    [[nodiscard]] QSize sizeHint() const override;

    // The widget of a visible row; null for any other row.
    [[nodiscard]] RowWidget* rowWidget(std::size_t row) const;
    [[nodiscard]] std::size_t rowCount() const;
    // The row that has the keyboard.
    [[nodiscard]] std::size_t currentRow() const { return _currentRow; }
    // In points.
    [[nodiscard]] QScrollBar& scrollBar() const { return *_bar; }
    // Does the same as a press on the row.
    void pressRow(std::size_t row) override;

protected:
    bool event(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    struct Sideways {
        QString key;
        double offset;
    };

    [[nodiscard]] std::optional<std::size_t> rowAt(const QPointF& position) const override;
    [[nodiscard]] QString keyOf(std::size_t row) const override;
    [[nodiscard]] QPointF scrollRange(std::optional<std::size_t> row) const override;
    [[nodiscard]] QPointF scrollPosition(std::optional<std::size_t> row) const override;
    void scrollTo(std::optional<std::size_t> row, const QPointF& position) override;
    void showPress() override;

    void showToolTip(const QHelpEvent& event);
    void placeRows();
    std::unique_ptr<RowWidget> takeSpare();
    void showRow(std::size_t row, const std::shared_ptr<TableViewCell>& cell);
    void updateMarks();
    void moveTo(std::size_t row);
    void scrollSideways(std::size_t row, double by);
    [[nodiscard]] int rowHeight() const;

    std::weak_ptr<TableView> _table;
    TableTouch _touch;
    QScrollBar* _bar; // a child
    std::map<std::size_t, std::unique_ptr<RowWidget>> _rows;
    std::vector<std::unique_ptr<RowWidget>> _spares;
    std::map<std::size_t, Sideways> _sideways;
    std::size_t _currentRow = 0;
    bool _isKeyboardUsed = false;
};

} // namespace orvane
