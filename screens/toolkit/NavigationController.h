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

// A stack of view controllers. The top one is shown, between a title bar with a way back and a
// toolbar. The root is never removed.
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
    // Null if the stack was made without a root.
    [[nodiscard]] ViewController* topViewController() const
    {
        return _controllers.empty() ? nullptr : _controllers.back().get();
    }

    // Does nothing for null and for a controller that is on the stack already.
    void pushViewController(std::shared_ptr<ViewController> controller, bool animated);
    // Does nothing if only the root is left.
    void popViewController(bool animated);
    // Removes all controllers above this one. Does nothing if it is not on the stack.
    void popToViewController(const ViewController& controller, bool animated);
    // Whether the last push or pop is to be animated.
    [[nodiscard]] bool isLastChangeAnimated() const { return _isLastChangeAnimated; }

    [[nodiscard]] bool isToolbarHidden() const { return _isToolbarHidden; }
    void setToolbarHidden(bool isHidden);

    // Passed on to the top controller.
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
