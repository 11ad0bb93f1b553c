#pragma once

#include "screens/window/EdgeSwipe.h"

#include <QPointF>
#include <QString>
#include <QTimer>

#include <cstddef>
#include <optional>

class QEvent;
class QMouseEvent;
class QTouchEvent;
class QWidget;

namespace orvane
{

// Handles one finger, or the left mouse button, on a table: the press of a row, a pan along one
// axis with momentum, and a swipe from the left edge.
class TableTouch
{
public:
    // The table as this class uses it. Positions are in the coordinates of the widget. Sideways,
    // the row is scrolled on which the pan began.
    class Table
    {
    public:
        virtual ~Table() = default;
        [[nodiscard]] virtual std::optional<std::size_t> rowAt(const QPointF& position) const = 0;
        [[nodiscard]] virtual QString keyOf(std::size_t row) const = 0;
        [[nodiscard]] virtual QPointF scrollRange(std::optional<std::size_t> row) const = 0;
        [[nodiscard]] virtual QPointF scrollPosition(std::optional<std::size_t> row) const = 0;
        virtual void scrollTo(std::optional<std::size_t> row, const QPointF& position) = 0;
        // pressedRow() has changed.
        virtual void showPress() = 0;
        // May destroy the table.
        virtual void pressRow(std::size_t row) = 0;
    };

    TableTouch(QWidget& widget, Table& table);
    ~TableTouch();
    TableTouch(const TableTouch&) = delete;
    TableTouch& operator=(const TableTouch&) = delete;

    void setEdgeSwipe(EdgeSwipe swipe) { _edgeSwipe = std::move(swipe); }

    // Handles the event. True if it was handled; then nothing else may handle it.
    bool takeEvent(QEvent& event);
    // Rows were reloaded. Drops the press of a row that no longer exists.
    void rowsChanged();
    // Stops momentum. To be called before the table is scrolled in another way.
    void stop();

    // The row to be drawn as pressed; nullopt for none.
    [[nodiscard]] std::optional<std::size_t> pressedRow() const;

private:
    struct Press {
        std::size_t row;
        QString key;
    };
    enum class Swipe { None, Possible, UnderWay };

    // A position of the finger or the mouse, and its time in milliseconds.
    struct Finger {
        QPointF position; // in the widget's coordinates
        QPointF onScreen; // for swipes, which move the widget itself
        qint64 time;
    };

    bool takeMouse(const QMouseEvent& event, QEvent& accepted);
    void takeTouch(QTouchEvent& event);
    void begin(const Finger& finger);
    void move(const Finger& finger);
    void end(const Finger& finger);
    void cancel(qint64 time);
    void dropPress();

    QWidget& _widget;
    Table& _table;
    EdgeSwipe _edgeSwipe;
    bool _isDown = false;
    Finger _start{};
    Swipe _swipe = Swipe::None;
    std::optional<Press> _press;
    std::optional<std::size_t> _panRow;
    bool _isPressShown = false;
    QTimer _showTimer;
};

} // namespace orvane
