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

// A screen that an interface file describes: the file's widgets, and a toolkit view for each table,
// text field and button among them, and for the whole. What the user does to a widget its view
// hears of; what is done to a view its widget shows after sync().
class UiInterface
{
public:
    // Reads the resource NAME.ui. Null, with an error line, where it is missing or no interface.
    static std::unique_ptr<UiInterface> load(const std::string& name);
    ~UiInterface();
    UiInterface(const UiInterface&) = delete;
    UiInterface& operator=(const UiInterface&) = delete;

    // The toolkit's side, once: the root view, and outlets by the widgets' names. This lives as
    // long as anybody has the root view.
    [[nodiscard]] std::unique_ptr<Interface> takeInterface();
    [[nodiscard]] bool isAlive() const { return !_view.expired(); }
    [[nodiscard]] bool isOf(const View* view) const { return view && _view.lock().get() == view; }

    [[nodiscard]] QWidget& widget() const { return *_widget; }
    void sync();
    // The user has pressed where there is nothing.
    void pressBackground() const;
    // Does what a press on the button of that name does. Nothing where there is none.
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
