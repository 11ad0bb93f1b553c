#include "screens/window/KeyboardUse.h"

#include <QCoreApplication>
#include <QEvent>

namespace orvane
{

KeyboardUse::KeyboardUse() { QCoreApplication::instance()->installEventFilter(this); }

bool KeyboardUse::eventFilter(QObject*, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::ShortcutOverride: // the only event for the key of a shortcut
        _isUnderWay = true;
        break;
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        _isUnderWay = false;
        break;
    default:
        break;
    }
    return false;
}

} // namespace orvane
