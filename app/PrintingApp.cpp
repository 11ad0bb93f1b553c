#include "app/PrintingApp.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

bool hasRow(const OrvaneModelNode& group)
{
    const auto* children = group.childNodes();
    return children && std::any_of(children->begin(), children->end(), [](const auto& child) {
               return child->value() || hasRow(*child);
           });
}

} // namespace

void PrintingApp::showTree()
{
    const NodePointer tree = model()->topLevelNodes();
    _hasRows = tree && hasRow(*tree);
    _printer.reloadWithNode(tree);
}

void PrintingApp::show(const Status& status)
{
    _isBusy = status.isBusy;
    if (_isOnce && (!_printedOnce || !_hasRows))
        return;
    _printer.setStatus(status.text, status.isBusy);
    if (_isOnce)
        std::exchange(_printedOnce, nullptr)();
}

} // namespace orvane
