#pragma once

#include "platform/window/Overlay.h"

#include <functional>

class QLabel;

namespace orvane
{

class AlertView;
class FlatButton;

// The alert in front, with its one button.
class AlertWidget final : public Overlay
{
public:
    AlertWidget(QWidget* parent, std::function<void()> dismiss);

    // Null for none.
    void sync(const AlertView* alert);
    [[nodiscard]] FlatButton& button() const { return *_button; }

protected:
    [[nodiscard]] QRect cardPlace(const QSize& size) const override;

private:
    QLabel* _title; // children
    QLabel* _message;
    FlatButton* _button;
};

} // namespace orvane
