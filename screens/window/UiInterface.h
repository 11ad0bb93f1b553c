#pragma once

#include "screens/toolkit/Control.h"
#include "screens/toolkit/Interface.h"

#include <QWidget>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// A screen made from an interface file: the widgets of the file, and a toolkit view for each table,
// text field and button among them and for the whole. The views get the user's input; the widgets
// show changes of the views after sync().
class UiInterface
{
public:
    // Loads the resource NAME.ui. If it is missing or not an interface, logs an error and returns
    // null.
    static std::unique_ptr<UiInterface> load(const std::string& name);
    ~UiInterface();
    UiInterface(const UiInterface&) = delete;
    UiInterface& operator=(const UiInterface&) = delete;

    // The views for the toolkit: the root view, and outlets named after the widgets. To be called
    // once. This object is needed for as long as the root view exists.
    [[nodiscard]] std::unique_ptr<Interface> takeInterface();
    [[nodiscard]] bool isAlive() const { return !_view.expired(); }
    [[nodiscard]] bool isOf(const View* view) const { return view && _view.lock().get() == view; }

    [[nodiscard]] QWidget& widget() const { return *_widget; }
    void sync();
    // The user has pressed an empty place.
    void pressBackground() const;
    // Presses the button of that name. Does nothing if there is none.
    void pressButton(const char* name) const;

private:
    UiInterface() = default;
    void bind(QWidget& widget);

    std::unique_ptr<QWidget> _widget;
    std::weak_ptr<Control> _view;
    std::vector<std::function<void()>> _syncs;
    // Until the interface is taken.
    std::shared_ptr<Control> _root;
    std::map<std::string, std::shared_ptr<View>> _outlets;
};

} // namespace orvane
