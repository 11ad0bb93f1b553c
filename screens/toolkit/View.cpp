#include "screens/toolkit/View.h"

#include "screens/toolkit/Screen.h"

#include <algorithm>
#include <utility>

namespace orvane
{

View::~View()
{
    for (const auto& view : _subviews)
        view->_superview = nullptr;
}

void View::setFrame(const Rect& frame)
{
    if (_frame == frame)
        return;
    _frame = frame;
    changed();
}

void View::setHidden(bool isHidden)
{
    if (_isHidden == isHidden)
        return;
    _isHidden = isHidden;
    changed();
}

void View::addSubview(std::shared_ptr<View> view)
{
    if (!view)
        return;
    view->removeFromSuperview();
    view->_superview = this;
    _subviews.push_back(std::move(view));
    changed();
}

void View::removeFromSuperview()
{
    if (!_superview)
        return;
    auto& siblings = std::exchange(_superview, nullptr)->_subviews;
    const auto found = std::find_if(siblings.begin(), siblings.end(),
                                    [this](const auto& view) { return view.get() == this; });
    // This may release the last owner.
    const std::shared_ptr<View> self = *found;
    siblings.erase(found);
    changed();
}

void View::changed() { Screen::main().setNeedsUpdate(); }

} // namespace orvane
