#include "screens/window/QtScreen.h"

#include "screens/window/Fonts.h"
#include "screens/window/PlainText.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/UiInterface.h"
#include "screens/window/WindowFrame.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>
#include <utility>
#include <vector>

namespace orvane
{

namespace
{

constexpr QSize kUsualSize(420, 760);
constexpr int kPhoneWidth = 480; // a screen narrower than this is a phone's

WindowFrame::Settings frameSettings(const QtScreen::Settings& settings)
{
    WindowFrame::Settings result;
    if (settings.isSimulated)
        result.mark = QStringLiteral("Simulated phone");
    result.waitingHint = QString::fromStdString(settings.waitingHint);
    result.isAnimated = settings.isAnimated;
    result.onClose = settings.onClose;
    return result;
}

bool isPhone(const QScreen& screen)
{
    const QSize size = screen.size();
    return std::min(size.width(), size.height()) < kPhoneWidth;
}

} // namespace

struct QtScreen::Interfaces {
    std::vector<std::unique_ptr<UiInterface>> loaded;

    UiInterface* find(const View* view) const
    {
        const auto found = std::find_if(loaded.begin(), loaded.end(),
                                        [view](const auto& one) { return one->isOf(view); });
        return found == loaded.end() ? nullptr : found->get();
    }
    void dropDead()
    {
        std::erase_if(loaded, [](const auto& one) { return !one->isAlive(); });
    }
};

QtScreen::QtScreen(Settings settings)
    : _settings(std::move(settings)), _interfaces(std::make_unique<Interfaces>()),
      _frame(std::make_unique<WindowFrame>(*this, frameSettings(_settings)))
{
    if (const QScreen* screen = QGuiApplication::primaryScreen()) {
        _settings.isFullScreen = _settings.isFullScreen || isPhone(*screen);
        _frame->resize(_settings.isFullScreen ? screen->size()
                                              : kUsualSize.boundedTo(screen->availableSize()));
    }
    setMain(this);
}

QtScreen::~QtScreen()
{
    // The sheet must not destroy widgets that belong to an interface.
    _frame->sheet().sync(nullptr);
}

Rect QtScreen::bounds() const
{
    return {0, 0, static_cast<double>(_frame->width()), static_cast<double>(_frame->height())};
}

Size QtScreen::sizeWithFont(std::string_view text, const Font& font) const
{
    const QSizeF size = sizeOfLine(lineOf(text), fontFor(font));
    return {size.width(), size.height()};
}

std::unique_ptr<Interface> QtScreen::loadInterface(const std::string& name)
{
    auto loaded = UiInterface::load(name);
    if (!loaded)
        return nullptr;
    auto interface = loaded->takeInterface();
    _interfaces->loaded.push_back(std::move(loaded));
    return interface;
}

void QtScreen::setNeedsUpdate()
{
    // Changes made during an update, such as new cells, are drawn by that update.
    if (_isUpdating || std::exchange(_isUpdateQueued, true))
        return;
    QMetaObject::invokeMethod(
        _frame.get(), [this] { update(); }, Qt::QueuedConnection);
}

void QtScreen::hide() { _frame->hide(); }

void QtScreen::update()
{
    _isUpdateQueued = false;
    _isUpdating = true;
    _frame->sync([this](const View* view) { return _interfaces->find(view); });
    _interfaces->dropDead();
    showFrame();
    _isUpdating = false;
}

void QtScreen::showFrame()
{
    const bool isWanted = keyWindow() != nullptr;
    if (isWanted == _frame->isVisible())
        return;
    if (!isWanted)
        _frame->hide();
    else if (_settings.isFullScreen)
        _frame->showFullScreen();
    else
        _frame->show();
}

} // namespace orvane
