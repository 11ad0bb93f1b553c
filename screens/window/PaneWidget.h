#pragma once

#include "screens/toolkit/ViewController.h"
#include "screens/window/EdgeSwipe.h"

#include <QWidget>

#include <memory>

namespace orvane
{

class EmptyView;
class TableWidget;

// One view controller of the navigation stack: its table, or an EmptyView if that has no rows.
class PaneWidget final : public QWidget
{
public:
    PaneWidget(QWidget* parent, const std::shared_ptr<ViewController>& controller,
               const QString& waitingHint, EdgeSwipe swipe);

    // Null once the controller was destroyed.
    [[nodiscard]] std::shared_ptr<ViewController> controller() const { return _controller.lock(); }
    void sync();

    [[nodiscard]] TableWidget& table() const { return *_table; }
    [[nodiscard]] EmptyView& emptyView() const { return *_empty; }

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    std::weak_ptr<ViewController> _controller;
    TableWidget* _table; // children
    EmptyView* _empty;
};

} // namespace orvane
