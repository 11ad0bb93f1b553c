#include "screens/window/QtWindowApplication.h"

#include "platform/services/SystemLog.h"
#include "screens/window/Accessibility.h"
#include "screens/window/DesktopColours.h"

#include <QApplication>

#include <clocale>
#include <cstdio>
#include <cstdlib>

namespace orvane
{

namespace
{

// Messages of Qt go to the log. Standard error is for messages to the user.
void logMessage(QtMsgType type, const QMessageLogContext&, const QString& text)
{
    logLine(type == QtCriticalMsg || type == QtFatalMsg ? LogPriority::Error : LogPriority::Info,
            "Qt: %s\n", qPrintable(text));
    if (type != QtFatalMsg)
        return;
    // Qt would abort, for example if there is no display.
    std::fputs(
        "orvane: the window cannot be opened: try --ui terminal, or --log stderr to see why\n",
        stderr);
    std::_Exit(1);
}

} // namespace

struct QtWindowApplication::Parts {
    // Qt keeps references to these.
    int argumentCount = 1;
    char name[7] = "orvane";
    char* arguments[2] = {name, nullptr};
    QtMessageHandler earlierHandler = qInstallMessageHandler(logMessage);
    QApplication application{argumentCount, arguments};
    DesktopColours colours;

    ~Parts() { qInstallMessageHandler(earlierHandler); }
};

QtWindowApplication::QtWindowApplication() : _parts(std::make_unique<Parts>())
{
    // Qt has taken over the user's locale, in which printf may write "1,5".
    std::setlocale(LC_NUMERIC, "C");
    QGuiApplication::setDesktopFileName(QStringLiteral("org.orvane.Orvane"));
    // The program decides when it ends.
    QGuiApplication::setQuitOnLastWindowClosed(false);
    installAccessibility();
}

QtWindowApplication::~QtWindowApplication() = default;

} // namespace orvane
