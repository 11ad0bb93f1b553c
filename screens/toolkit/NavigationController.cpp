#include "screens/toolkit/NavigationController.h"

#include "screens/toolkit/Screen.h"

#include <algorithm>
#include <utility>

namespace orvane
{

NavigationController::NavigationController(std::shared_ptr<ViewController> root)
{
    if (!root)
        return;
    root->_navigation = this;
    _controllers.push_back(std::move(root));
}

NavigationController::~NavigationController()
{
    for (const auto& controller : _controllers)
        controller->_navigation = nullptr;
}

void NavigationController::pushViewController(std::shared_ptr<ViewController> controller,
                                              bool animated)
{
    if (!controller ||
        std::find(_controllers.begin(), _controllers.end(), controller) != _controllers.end())
        return;
    if (ViewController* top = topViewController())
        top->viewWillDisappear(animated);
    controller->_navigation = this;
    _controllers.push_back(std::move(controller));
    showTop(animated);
}

void NavigationController::popViewController(bool animated)
{
    if (_controllers.size() > 1)
        popToViewController(*_controllers[_controllers.size() - 2], animated);
}

void NavigationController::popToViewController(const ViewController& controller, bool animated)
{
    const auto found = std::find_if(_controllers.begin(), _controllers.end(),
                                    [&](const auto& other) { return other.get() == &controller; });
    if (found == _controllers.end() || *found == _controllers.back())
        return;
    // Kept alive until the change was announced: the caller may be one of them.
    const std::vector popped(std::next(found), _controllers.end());
    popped.back()->viewWillDisappear(animated);
    _controllers.erase(std::next(found), _controllers.end());
    for (const auto& gone : popped)
        gone->_navigation = nullptr;
    showTop(animated);
}

void NavigationController::setToolbarHidden(bool isHidden)
{
    _isToolbarHidden = isHidden;
    Screen::main().setNeedsUpdate();
}

void NavigationController::viewWillAppear(bool animated) { showTop(animated); }

void NavigationController::viewWillDisappear(bool animated)
{
    if (ViewController* top = topViewController())
        top->viewWillDisappear(animated);
}

void NavigationController::showTop(bool animated)
{
    _isLastChangeAnimated = animated;
    Screen::main().setNeedsUpdate();
    const auto top = _controllers.empty() ? nullptr : _controllers.back();
    if (!top)
        return;
    static_cast<void>(top->view());
    top->viewWillAppear(animated);
    if (_delegate)
        _delegate->willShowViewController(*this, *top, animated);
}

} // namespace orvane
