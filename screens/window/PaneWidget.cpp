#include "screens/window/PaneWidget.h"

#include "screens/toolkit/ActivityIndicator.h"
#include "screens/window/EmptyView.h"
#include "screens/window/PlainText.h"
#include "screens/window/TableWidget.h"

#include <algorithm>

namespace orvane
{

namespace
{

bool isBusy(const ViewController& controller)
{
    const auto& items = controller.toolbarItems();
    return std::any_of(items.begin(), items.end(), [](const auto& item) {
        const auto* indicator = dynamic_cast<ActivityIndicator*>(item->customView().get());
        return indicator && indicator->isAnimating();
    });
}

} // namespace

PaneWidget::PaneWidget(QWidget* parent, const std::shared_ptr<ViewController>& controller,
                       const QString& waitingHint, EdgeSwipe swipe)
    : QWidget(parent), _controller(controller), _table(new TableWidget(this)),
      _empty(new EmptyView(this, waitingHint))
{
    _table->setEdgeSwipe(std::move(swipe));
    _empty->hide();
}

void PaneWidget::sync()
{
    const auto shown = controller();
    if (!shown)
        return;
    _table->setTable(std::dynamic_pointer_cast<TableView>(shown->view()));
    setAccessibleName(lineOf(shown->title()));
    _table->setAccessibleName(accessibleName());
    _table->sync();
    _empty->setWaiting(isBusy(*shown));
    _empty->setVisible(_table->rowCount() == 0);
}

void PaneWidget::resizeEvent(QResizeEvent*)
{
    _table->setGeometry(rect());
    _empty->setGeometry(rect());
}

} // namespace orvane
