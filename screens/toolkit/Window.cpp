#include "screens/toolkit/Window.h"

#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

Window::Window(const Rect& frame) { View::setFrame(frame); }

Window::~Window() { orderOut(); }

void Window::setRootViewController(std::shared_ptr<ViewController> controller)
{
    _rootViewController = std::move(controller);
    changed();
}

void Window::makeKeyAndVisible()
{
    setHidden(false);
    Screen::main().setKeyWindow(this);
    if (const auto controller = _rootViewController)
        controller->viewWillAppear(false);
}

void Window::orderOut()
{
    if (Screen::main().keyWindow() != this)
        return;
    setHidden(true);
    Screen::main().setKeyWindow(nullptr);
}

} // namespace orvane
