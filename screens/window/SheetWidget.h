#pragma once

#include "screens/window/Overlay.h"

namespace orvane
{

class UiInterface;

// Shows an interface in front of the panes: over the whole width on a phone, as a card in the
// middle of a larger window.
class SheetWidget final : public Overlay
{
public:
    explicit SheetWidget(QWidget* parent);

    // Shows that interface until the next call; null hides the sheet. The interface is not owned.
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
