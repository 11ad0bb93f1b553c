#pragma once

#include "screens/toolkit/View.h"

#include <functional>
#include <string>
#include <utility>

namespace orvane
{

// A view with an action for a press.
class Control : public View
{
public:
    using Action = std::function<void()>;

    void setAction(Action action) { _action = std::move(action); }
    // The user has pressed it. Does nothing without an action. The action may destroy the control.
    void press() const
    {
        if (const Action action = _action)
            action();
    }

private:
    Action _action;
};

class Button : public Control
{
public:
    explicit Button(std::string title) : _title(std::move(title)) {}
    [[nodiscard]] const std::string& title() const { return _title; }

private:
    std::string _title;
};

} // namespace orvane
