#pragma once

#include "screens/toolkit/BarButtonItem.h"
#include "screens/toolkit/View.h"

#include <memory>
#include <string>
#include <vector>

namespace orvane
{

class NavigationController;

// What fills the screen at a time: a view, and how it behaves when it comes and goes. Owned by the
// navigation stack that it is on, or by what presented it, and by whoever made it.
class ViewController : public std::enable_shared_from_this<ViewController>
{
public:
    ViewController() = default;
    virtual ~ViewController();
    ViewController(const ViewController&) = delete;
    ViewController& operator=(const ViewController&) = delete;

    // Made when first asked for. Null where it could not be made.
    [[nodiscard]] const std::shared_ptr<View>& view();

    [[nodiscard]] const std::string& title() const { return _title; }
    void setTitle(std::string title);
    using ToolbarItems = std::vector<std::shared_ptr<BarButtonItem>>;
    [[nodiscard]] const ToolbarItems& toolbarItems() const { return _toolbarItems; }
    void setToolbarItems(ToolbarItems items, bool animated);

    // Null for one that is on no stack.
    [[nodiscard]] NavigationController* navigationController() const { return _navigation; }

    // Over this one, whose view stays beneath, until it is dismissed. One at a time: a second, or
    // none at all, is not presented.
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
    // Gives the keyboard back, whichever part of the view has it.
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
