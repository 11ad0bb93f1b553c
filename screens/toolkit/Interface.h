#pragma once

#include "screens/toolkit/View.h"

#include <map>
#include <memory>
#include <string>
#include <utility>

namespace orvane
{

// The contents of an interface file as a front end loaded it: a view, and its named parts.
class Interface
{
public:
    explicit Interface(std::shared_ptr<View> view) : _view(std::move(view)) {}

    [[nodiscard]] const std::shared_ptr<View>& view() const { return _view; }
    void setOutlet(const std::string& name, std::shared_ptr<View> view)
    {
        _outlets[name] = std::move(view);
    }
    // Null if there is no part of that name and kind.
    template <typename Kind>
    [[nodiscard]] std::shared_ptr<Kind> outlet(const std::string& name) const
    {
        const auto found = _outlets.find(name);
        return found == _outlets.end() ? nullptr : std::dynamic_pointer_cast<Kind>(found->second);
    }

private:
    std::shared_ptr<View> _view;
    std::map<std::string, std::shared_ptr<View>> _outlets;
};

} // namespace orvane
