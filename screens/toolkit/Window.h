#pragma once

#include "screens/toolkit/View.h"
#include "screens/toolkit/ViewController.h"

#include <memory>

namespace orvane
{

// What the application fills the screen with. Shown from makeKeyAndVisible() until orderOut() or
// its end.
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

    // Makes it the screen's window; its root controller appears.
    void makeKeyAndVisible();
    // Takes it off the screen.
    void orderOut();

private:
    std::shared_ptr<ViewController> _rootViewController;
};

} // namespace orvane
