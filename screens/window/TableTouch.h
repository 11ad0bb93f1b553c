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

// What one finger, or the left mouse button, does on a table: a press of a row; a pan along one
// axis, with momentum; a swipe from the left edge.
class TableTouch
{
public:
    // What it asks of the table. Positions are in the widget's coordinates; what is scrolled
    // sideways is the row that the pan began on.
    class Table
    {
    public:
        virtual ~Table() = default;
        [[nodiscard]] virtual std::optional<std::size_t> rowAt(const QPointF& position) const = 0;
        [[nodiscard]] virtual QString keyOf(std::size_t row) const = 0;
        [[nodiscard]] virtual QPointF scrollRange(std::optional<std::size_t> row) const = 0;
        [[nodiscard]] virtual QPointF scrollPosition(std::optional<std::size_t> row) const = 0;
        virtual void scrollTo(std::optional<std::size_t> row, const QPointF& position) = 0;
        // The row that is drawn as pressed is another one.
        virtual void showPress() = 0;
        // May destroy the table.
        virtual void pressRow(std::size_t row) = 0;
    };

    TableTouch(QWidget& widget, Table& table);
    ~TableTouch();
    TableTouch(const TableTouch&) = delete;
    TableTouch& operator=(const TableTouch&) = delete;

    void setEdgeSwipe(EdgeSwipe swipe) { _edgeSwipe = std::move(swipe); }

    // Whether the event was one of its own; then nothing else may take it.
    bool takeEvent(QEvent& event);
    // Rows were reloaded: a press of a row that is no longer there is over.
    void rowsChanged();
    // Ends momentum, as before the table is scrolled by other means.
    void stop();

    // The row to be drawn as pressed.
    [[nodiscard]] std::optional<std::size_t> pressedRow() const;

private:
    struct Press {
        std::size_t row;
        QString key;
    };
    enum class Swipe { None, Possible, UnderWay };

    // Where the finger or the mouse is, and when, in milliseconds.
    struct Finger {
        QPointF position; // in the widget's coordinates
        QPointF onScreen; // there a swipe is measured: it moves the widget
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
