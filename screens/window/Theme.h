#pragma once

#include <QColor>

class QWidget;

namespace orvane
{

// The colours of the window. Texts have a contrast of at least 4.5 : 1 to everything that is drawn
// behind them; signs that can be pressed and the focus ring have it too.
struct Theme {
    QColor background; // behind rows and on cards
    QColor bar;        // behind the title, the toolbar and the playback controls
    QColor shade;      // over everything that a card covers
    QColor text;
    QColor quietText;
    QColor line; // between rows and along the bars
    QColor pressed;
    QColor accent; // signs and texts that can be pressed, and the focus
    QColor badge;
    QColor warning;  // of a text that says what is wrong
    QColor disabled; // of a button that cannot be pressed now

    static const Theme& light();
    static const Theme& dark();
    // The dark one if the widget's palette is dark, else the light one.
    static const Theme& of(const QWidget& widget);
};

} // namespace orvane
