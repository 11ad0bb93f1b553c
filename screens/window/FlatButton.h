#pragma once

#include "screens/window/Drawing.h"

#include <QAbstractButton>

#include <optional>

namespace orvane
{

// A button without a frame: a sign, a text, or a sign and then a text. At least 44 points high and
// wide. Its text is what a screen reader speaks unless it has another name. Return and Enter press
// it as Space does.
class FlatButton final : public QAbstractButton
{
public:
    static constexpr int kSize = 44;

    explicit FlatButton(QWidget* parent);

    [[nodiscard]] std::optional<Sign> sign() const { return _sign; }
    void setSign(Sign sign);
    // Shows the text as it is: an "&" in it gives the button no shortcut.
    void setText(const QString& text);
    // For a button of a sign alone: what it does, for screen readers and as a tool tip.
    void setName(const QString& name);

    // Whether the ring is drawn while it has the focus: for those who use the keyboard.
    [[nodiscard]] bool hasRing() const { return _hasRing; }

    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override { return {kSize, kSize}; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;

private:
    std::optional<Sign> _sign;
    bool _hasRing = false;
};

} // namespace orvane
