#pragma once

#include "screens/toolkit/BarButtonItem.h"
#include "screens/toolkit/View.h"

#include <memory>
#include <string>
#include <vector>

namespace orvane
{

class NavigationController;

// A view that fills the screen, and its behaviour when it appears and disappears. The navigation
// stack that it is on, the controller that presented it, and its creator share the ownership.
class ViewController : public std::enable_shared_from_this<ViewController>
{
public:
    ViewController() = default;
    virtual ~ViewController();
    ViewController(const ViewController&) = delete;
    ViewController& operator=(const ViewController&) = delete;

    // Made at the first call. Null if it could not be made.
    [[nodiscard]] const std::shared_ptr<View>& view();

    [[nodiscard]] const std::string& title() const { return _title; }
    void setTitle(std::string title);
    using ToolbarItems = std::vector<std::shared_ptr<BarButtonItem>>;
    [[nodiscard]] const ToolbarItems& toolbarItems() const { return _toolbarItems; }
    void setToolbarItems(ToolbarItems items, bool animated);

    // Null if the controller is not on a stack.
    [[nodiscard]] NavigationController* navigationController() const { return _navigation; }

    // Shows the controller in front of this one, whose view stays behind it, until it is dismissed.
    // Does nothing for null, or while another one is presented.
    void presentModalViewController(std::shared_ptr<ViewController> controller, bool animated);
    void dismissModalViewController(bool animated);
    [[nodiscard]] const std::shared_ptr<ViewController>& modalViewController() const
    {
        return _modal;
    }

    virtual void viewDidLoad() {}
    virtual void viewWillAppear(bool animated);
    virtual void viewWillDisappear(bool animated);
    virtual void didReceiveMemoryWarning() {}
    virtual void viewDidUnload() {}
    // Gives the keyboard back if any part of the view has it.
    virtual bool resignFirstResponder() { return true; }

protected:
    [[nodiscard]] virtual std::shared_ptr<View> loadView() { return std::make_shared<View>(); }

private:
    friend class NavigationController;

    std::shared_ptr<View> _view;
    bool _isViewLoaded = false;
    std::string _title;
    ToolbarItems _toolbarItems;
    NavigationController* _navigation = nullptr;
    std::shared_ptr<ViewController> _modal;
};

} // namespace orvane
