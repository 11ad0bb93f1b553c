#include "platform/linux/QtEventLoop.h"

#include <QAbstractEventDispatcher>
#include <QCoreApplication>
#include <QTimer>

#include <algorithm>
#include <clocale>
#include <optional>

namespace orvane
{

namespace
{

void discardMessage(QtMsgType, const QMessageLogContext&, const QString&) {}

// Drops Qt's line on standard error about changing to a locale with UTF-8. The programs' standard
// error is for their users.
std::unique_ptr<QCoreApplication> makeApplication(int& argumentCount, char** arguments)
{
    const QtMessageHandler earlier = qInstallMessageHandler(discardMessage);
    auto application = std::make_unique<QCoreApplication>(argumentCount, arguments);
    qInstallMessageHandler(earlier);
    return application;
}

} // namespace

struct QtEventLoop::Application {
    // Qt keeps references to these.
    int argumentCount = 1;
    char name[7] = "orvane";
    char* arguments[2] = {name, nullptr};
    std::unique_ptr<QCoreApplication> owned;
    bool isRunning = false;
    std::optional<int> code; // of a quit() before run()
};

QtEventLoop::QtEventLoop() : _application(std::make_unique<Application>())
{
    if (!QCoreApplication::instance())
        _application->owned = makeApplication(_application->argumentCount, _application->arguments);
    // Qt has taken over the user's locale, in which printf may write "1,5".
    std::setlocale(LC_NUMERIC, "C");
}

QtEventLoop::~QtEventLoop() = default;

int QtEventLoop::run()
{
    if (!_application->code) {
        _application->isRunning = true;
        _application->code = QCoreApplication::exec();
        _application->isRunning = false;
    }
    const int code = *_application->code;
    _application->code.reset();
    return code;
}

void QtEventLoop::quit(int code)
{
    if (_application->isRunning)
        QCoreApplication::exit(code);
    else
        _application->code = code;
}

bool QtEventLoop::runUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout)
{
    QTimer alarm;
    alarm.setSingleShot(true);
    alarm.setTimerType(Qt::PreciseTimer);
    alarm.start(std::clamp(timeout, std::chrono::milliseconds{0},
                           std::chrono::milliseconds{std::chrono::hours(24)}));
    // Some dispatchers do not return after the task that made `done` true.
    auto* dispatcher = QAbstractEventDispatcher::instance();
    QObject::connect(dispatcher, &QAbstractEventDispatcher::aboutToBlock, &alarm, [&] {
        if (done())
            dispatcher->wakeUp();
    });
    while (!done() && alarm.isActive())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    return done();
}

} // namespace orvane
