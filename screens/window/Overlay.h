#pragma once

#include "screens/window/KeyboardUse.h"

#include <QWidget>

namespace orvane
{

// A card in front of the window. While it is shown, the rest of the window is shaded and cannot be
// reached by touch or keyboard. Fills its parent.
class Overlay : public QWidget
{
public:
    explicit Overlay(QWidget* parent);

    // Gives the keyboard to the card's text field, or to the first part that takes it. Shows a
    // focus ring if the user works with the keyboard.
    void takeKeyboard();

protected:
    // The rectangle of the card in an overlay of that size.
    [[nodiscard]] virtual QRect cardPlace(const QSize& size) const = 0;
    // A press beside the card, or on an empty part of it.
    virtual void pressBackground() {}

    [[nodiscard]] QWidget& card() const { return *_card; }
    void placeCard();

    bool eventFilter(QObject* watched, QEvent* event) override;
    bool focusNextPrevChild(bool isNext) override;
    void showEvent(QShowEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    [[nodiscard]] QWidget* partAfter(QWidget* start, bool isNext) const;

    KeyboardUse _keyboard;
    QWidget* _card; // a child
};

} // namespace orvane
