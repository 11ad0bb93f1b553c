#pragma once

#include "screens/toolkit/View.h"
#include "screens/toolkit/ViewController.h"

#include <memory>

namespace orvane
{

// The contents of the application's screen. Shown from makeKeyAndVisible() until orderOut() or
// until it is destroyed.
class Window : public View
{
public:
    explicit Window(const Rect& frame);
    ~Window() override;

    [[nodiscard]] const std::shared_ptr<ViewController>& rootViewController() const
    {
        return _rootViewController;
    }
    void setRootViewController(std::shared_ptr<ViewController> controller);

    // Makes it the window of the screen. Its root controller appears.
    void makeKeyAndVisible();
    // Removes it from the screen.
    void orderOut();

private:
    std::shared_ptr<ViewController> _rootViewController;
};

} // namespace orvane
