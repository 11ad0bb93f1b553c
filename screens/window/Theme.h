#pragma once

#include <QColor>

class QWidget;

namespace orvane
{

// The colours of the window, light or dark as the desktop's own palette is.
struct Theme {
    QColor background; // behind rows and on cards
    QColor bar;        // behind the title, the toolbar and the playback controls
    QColor shade;      // over what a card covers
    QColor text;
    QColor quietText;
    QColor line; // between rows and along the bars
    QColor pressed;
    QColor accent; // what can be pressed, and the focus
    QColor onAccent;
    QColor badge;

    // That of the widget's palette.
    static const Theme& of(const QWidget& widget);
};

} // namespace orvane
