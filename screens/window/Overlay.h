#pragma once

#include "screens/window/KeyboardUse.h"

#include <QWidget>

namespace orvane
{

// A card over a window whose other parts are shaded and out of reach, by touch and by keyboard,
// while it is shown. Fills its parent.
class Overlay : public QWidget
{
public:
    explicit Overlay(QWidget* parent);

    // Gives the keyboard to the card's text field, else to the first part that takes it; with a
    // focus ring where the user works with the keyboard.
    void takeKeyboard();

protected:
    // The card's place within the given size.
    [[nodiscard]] virtual QRect cardPlace(const QSize& size) const = 0;
    // A press beside the card, or on what is empty of it.
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
