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
    case QEvent::ShortcutOverride: // all that comes of a shortcut's key
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
