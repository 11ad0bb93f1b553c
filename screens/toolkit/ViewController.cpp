#include "screens/toolkit/ViewController.h"

#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

ViewController::~ViewController() = default;

const std::shared_ptr<View>& ViewController::view()
{
    if (!_isViewLoaded) {
        _isViewLoaded = true;
        _view = loadView();
        viewDidLoad();
    }
    return _view;
}

void ViewController::setTitle(std::string title)
{
    _title = std::move(title);
    Screen::main().setNeedsUpdate();
}

void ViewController::setToolbarItems(ToolbarItems items, bool)
{
    _toolbarItems = std::move(items);
    Screen::main().setNeedsUpdate();
}

void ViewController::presentModalViewController(std::shared_ptr<ViewController> controller,
                                                bool animated)
{
    if (_modal || !controller)
        return;
    _modal = std::move(controller);
    static_cast<void>(_modal->view());
    _modal->viewWillAppear(animated);
    Screen::main().setNeedsUpdate();
}

void ViewController::dismissModalViewController(bool animated)
{
    if (!_modal)
        return;
    const auto dismissed = std::exchange(_modal, nullptr);
    dismissed->viewWillDisappear(animated);
    Screen::main().setNeedsUpdate();
}

void ViewController::viewWillAppear(bool) {}

void ViewController::viewWillDisappear(bool) {}

} // namespace orvane
