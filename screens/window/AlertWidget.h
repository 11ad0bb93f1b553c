#pragma once

#include "screens/window/Overlay.h"

#include <functional>

namespace orvane
{

class AlertView;
class FlatButton;
class WrappedText;

// The alert in front, with its one button.
class AlertWidget final : public Overlay
{
public:
    AlertWidget(QWidget* parent, std::function<void()> dismiss);

    // Shows that alert; null hides it.
    void sync(const AlertView* alert);
    [[nodiscard]] FlatButton& button() const { return *_button; }

protected:
    [[nodiscard]] QRect cardPlace(const QSize& size) const override;

private:
    WrappedText* _title; // children
    WrappedText* _message;
    FlatButton* _button;
};

} // namespace orvane
