#pragma once

#include "screens/window/Overlay.h"

namespace orvane
{

class UiInterface;

// The sheet over the panes on which an interface stands: over the whole width of a phone, a card in
// the middle of a larger window.
class SheetWidget final : public Overlay
{
public:
    explicit SheetWidget(QWidget* parent);

    // Null for none. Not owned; shown until another call.
    void sync(UiInterface* interface);
    [[nodiscard]] UiInterface* interface() const { return _interface; }

protected:
    [[nodiscard]] QRect cardPlace(const QSize& size) const override;
    void pressBackground() override;
    void changeEvent(QEvent* event) override;

private:
    void applyTheme();

    UiInterface* _interface = nullptr;
};

} // namespace orvane
