#pragma once

#include "screens/toolkit/ViewController.h"

#include <memory>
#include <vector>

namespace orvane
{

class NavigationControllerDelegate
{
public:
    virtual ~NavigationControllerDelegate() = default;
    // That controller is about to be the top one.
    virtual void willShowViewController(NavigationController& navigation,
                                        ViewController& controller, bool animated) = 0;
};

// A stack of view controllers, of which the top one is seen, with a title bar that leads back and a
// toolbar below. It never loses its root.
class NavigationController : public ViewController
{
public:
    explicit NavigationController(std::shared_ptr<ViewController> root);
    ~NavigationController() override;

    // Not owned; may be null.
    void setDelegate(NavigationControllerDelegate* delegate) { _delegate = delegate; }

    // From the root upwards.
    [[nodiscard]] const std::vector<std::shared_ptr<ViewController>>& viewControllers() const
    {
        return _controllers;
    }
    // Null for a stack that was made without a root.
    [[nodiscard]] ViewController* topViewController() const
    {
        return _controllers.empty() ? nullptr : _controllers.back().get();
    }

    // None at all, or one that is on the stack already, is not pushed.
    void pushViewController(std::shared_ptr<ViewController> controller, bool animated);
    // Nothing at the root.
    void popViewController(bool animated);
    // Takes all that are above it off the stack. Nothing for one that is not on it.
    void popToViewController(const ViewController& controller, bool animated);
    // Whether the last push or pop is to be seen as a movement.
    [[nodiscard]] bool isLastChangeAnimated() const { return _isLastChangeAnimated; }

    [[nodiscard]] bool isToolbarHidden() const { return _isToolbarHidden; }
    void setToolbarHidden(bool isHidden);

    // Pass on to the top controller.
    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;

private:
    void showTop(bool animated);

    std::vector<std::shared_ptr<ViewController>> _controllers;
    NavigationControllerDelegate* _delegate = nullptr;
    bool _isToolbarHidden = true;
    bool _isLastChangeAnimated = false;
};

} // namespace orvane
