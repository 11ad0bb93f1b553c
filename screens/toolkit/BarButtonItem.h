#pragma once

#include "screens/toolkit/View.h"

#include <functional>
#include <memory>
#include <utility>

namespace orvane
{

// One item of a toolbar: a view, a space that takes the remaining width, or a standard button. An
// item is never changed after it was made.
class BarButtonItem
{
public:
    enum class Kind { CustomView, FlexibleSpace, Save };
    using Action = std::function<void()>;

    explicit BarButtonItem(std::shared_ptr<View> view)
        : _kind(Kind::CustomView), _customView(std::move(view))
    {
    }
    explicit BarButtonItem(Kind kind, Action action = nullptr)
        : _kind(kind), _action(std::move(action))
    {
    }

    [[nodiscard]] Kind kind() const { return _kind; }
    // Null unless the item is a view.
    [[nodiscard]] const std::shared_ptr<View>& customView() const { return _customView; }
    // The user has pressed it. Does nothing without an action.
    void press() const
    {
        if (const Action action = _action)
            action();
    }

private:
    Kind _kind;
    std::shared_ptr<View> _customView;
    Action _action;
};

} // namespace orvane
