#pragma once

#include <QObject>

namespace orvane
{

// Tells whether the user works with the keyboard: whether the last input was a key, not a touch or
// the mouse.
class KeyboardUse final : public QObject
{
public:
    KeyboardUse();

    [[nodiscard]] bool isUnderWay() const { return _isUnderWay; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool _isUnderWay = false;
};

} // namespace orvane
