#pragma once

#include "screens/toolkit/Geometry.h"

#include <memory>
#include <vector>

namespace orvane
{

// A rectangle of the screen and its contents. It is plain data: a front end draws it and passes it
// the user's input. Every change tells the screen that it needs an update.
//
// A view shares the ownership of its subviews.
class View
{
public:
    View() = default;
    virtual ~View();
    View(const View&) = delete;
    View& operator=(const View&) = delete;

    // In the superview's coordinates.
    [[nodiscard]] const Rect& frame() const { return _frame; }
    virtual void setFrame(const Rect& frame);
    // In the view's own coordinates.
    [[nodiscard]] Rect bounds() const { return {0, 0, _frame.width, _frame.height}; }

    [[nodiscard]] virtual bool isHidden() const { return _isHidden; }
    void setHidden(bool isHidden);

    // Removes the view from its earlier superview. Does nothing for null.
    void addSubview(std::shared_ptr<View> view);
    void removeFromSuperview();
    // Null if the view has no superview, or if that was destroyed.
    [[nodiscard]] View* superview() const { return _superview; }
    [[nodiscard]] const std::vector<std::shared_ptr<View>>& subviews() const { return _subviews; }

    // Places the subviews within the bounds.
    virtual void layoutSubviews() {}

    // Gives the keyboard back. True if the view does not have it afterwards.
    virtual bool resignFirstResponder() { return true; }

protected:
    static void changed();

private:
    Rect _frame;
    bool _isHidden = false;
    View* _superview = nullptr;
    std::vector<std::shared_ptr<View>> _subviews;
};

} // namespace orvane
