#pragma once

#include "screens/toolkit/Geometry.h"

#include <memory>
#include <vector>

namespace orvane
{

// A rectangle of the screen and what is in it. Plain data: a front end draws it and feeds it what
// the user does. Every change tells the screen that it needs an update.
//
// A view owns its subviews, which others may own as well.
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

    // Takes it out of where it was before. A null view is not added.
    void addSubview(std::shared_ptr<View> view);
    void removeFromSuperview();
    // Null for a view that is in no other, or whose superview has gone.
    [[nodiscard]] View* superview() const { return _superview; }
    [[nodiscard]] const std::vector<std::shared_ptr<View>>& subviews() const { return _subviews; }

    // The layout pass: puts the subviews where they belong within the bounds.
    virtual void layoutSubviews() {}

    // Gives the keyboard back. True when the view does not have it any more.
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
