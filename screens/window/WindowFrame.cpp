#include "screens/window/WindowFrame.h"

#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Window.h"
#include "screens/window/AlertWidget.h"
#include "screens/window/PaneDeck.h"
#include "screens/window/PlainText.h"
#include "screens/window/PlaybackBar.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/TableWidget.h"
#include "screens/window/TitleBar.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/UiInterface.h"

#include <QCloseEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QShortcut>
#include <QVBoxLayout>

#include <utility>

namespace orvane
{

namespace
{

constexpr QSize kSmallest(280, 240);

const View* frontModalView(NavigationController& stack)
{
    ViewController* front = &stack;
    if (!stack.modalViewController() && stack.topViewController())
        front = stack.topViewController();
    while (front->modalViewController())
        front = front->modalViewController().get();
    return front == &stack || front == stack.topViewController() ? nullptr : front->view().get();
}

} // namespace

WindowFrame::WindowFrame(Screen& screen, Settings settings)
    : _screen(screen), _settings(std::move(settings)),
      _titleBar(new TitleBar(this, _settings.mark, [this] { goBack(); })),
      _deck(new PaneDeck(this, _settings.waitingHint, _settings.isAnimated, [this] { popPane(); })),
      _playback(new PlaybackBar(this, screen)),
      _toolbar(new ToolbarWidget(this, [this](std::size_t index) { pressToolbarItem(index); })),
      _sheet(new SheetWidget(this)),
      _alert(new AlertWidget(this, [this] { _screen.dismissAlert(); }))
{
    setMinimumSize(kSmallest);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(_titleBar);
    column->addWidget(_deck, 1);
    column->addWidget(_playback);
    column->addWidget(_toolbar);
    addShortcuts();
}

WindowFrame::~WindowFrame() = default;

void WindowFrame::addShortcuts()
{
    const auto add = [this](const QKeySequence& keys, auto action) {
        auto* shortcut = new QShortcut(keys, this);
        connect(shortcut, &QShortcut::activated, this, std::move(action));
    };
    add(QKeySequence(Qt::ALT | Qt::Key_Left), [this] { goBack(); });
    add(QKeySequence(Qt::Key_Back), [this] { goBack(); });
    add(QKeySequence(Qt::CTRL | Qt::Key_S), [this] { pressSave(); });
    add(QKeySequence(Qt::CTRL | Qt::Key_Q), [this] { close(); });
}

NavigationController* WindowFrame::navigation() const
{
    const Window* window = _screen.keyWindow();
    return window ? dynamic_cast<NavigationController*>(window->rootViewController().get())
                  : nullptr;
}

void WindowFrame::sync(const std::function<UiInterface*(const View*)>& findInterface)
{
    if (Window* window = _screen.keyWindow())
        window->setFrame(_screen.bounds());
    NavigationController* stack = navigation();
    const PaneWidget* const before = _deck->top();
    syncTitle(stack);
    _toolbar->setVisible(stack && !stack->isToolbarHidden());
    if (stack && stack->topViewController())
        _toolbar->sync(stack->topViewController()->toolbarItems());
    _playback->sync();
    layout()->activate();
    _deck->sync(stack);
    UiInterface* modal = stack ? findInterface(frontModalView(*stack)) : nullptr;
    const bool wasAlerted = _alert->isVisible();
    const bool wasCovered = _sheet->isVisible() || wasAlerted;
    _sheet->sync(modal);
    _alert->sync(_screen.alert());
    const bool isCovered = _sheet->isVisible() || _alert->isVisible();
    if (!isCovered && (wasCovered || _deck->top() != before))
        giveKeyboard();
    else if (_sheet->isVisible() && wasAlerted && !_alert->isVisible())
        _sheet->takeKeyboard();
}

void WindowFrame::syncTitle(NavigationController* stack)
{
    if (!stack || !stack->topViewController())
        return _titleBar->show({}, false, {});
    const auto& controllers = stack->viewControllers();
    const QString title = lineOf(controllers.back()->title());
    const QString root = lineOf(controllers.front()->title());
    const bool canGoBack = controllers.size() > 1;
    const QString back =
        canGoBack ? lineOf(controllers[controllers.size() - 2]->title()) : QString();
    _titleBar->show(title, canGoBack, back);
    const QString whole = canGoBack ? QStringLiteral("%1 \u2014 %2").arg(title, root) : root;
    setPlainWindowTitle(*this, _settings.mark.isEmpty() ? whole
                                                        : QStringLiteral("%1 (%2)").arg(
                                                              whole, _settings.mark.toLower()));
}

void WindowFrame::giveKeyboard()
{
    if (PaneWidget* top = _deck->top())
        top->table().setFocus(Qt::OtherFocusReason);
}

void WindowFrame::goBack()
{
    if (_screen.alert())
        _screen.dismissAlert();
    else if (_sheet->interface())
        _sheet->interface()->pressButton("cancelButton");
    else
        popPane();
}

void WindowFrame::popPane()
{
    if (NavigationController* stack = navigation())
        stack->popViewController(true);
}

void WindowFrame::pressSave()
{
    NavigationController* stack = navigation();
    if (_screen.alert() || _sheet->interface() || !stack || !stack->topViewController())
        return;
    const auto items = stack->topViewController()->toolbarItems();
    for (const auto& item : items)
        if (item->kind() == BarButtonItem::Kind::Save)
            return item->press();
}

void WindowFrame::pressToolbarItem(std::size_t index)
{
    NavigationController* stack = navigation();
    if (!stack || !stack->topViewController())
        return;
    const auto items = stack->topViewController()->toolbarItems();
    if (index < items.size())
        items[index]->press();
}

void WindowFrame::closeEvent(QCloseEvent* event)
{
    // The program ends and closes its window itself.
    event->ignore();
    if (_settings.onClose)
        _settings.onClose();
}

void WindowFrame::resizeEvent(QResizeEvent*) { _screen.setNeedsUpdate(); }

void WindowFrame::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape)
        goBack();
    else
        QWidget::keyPressEvent(event);
}

void WindowFrame::mousePressEvent(QMouseEvent* event)
{
    if (event->button() == Qt::BackButton)
        goBack();
    else
        QWidget::mousePressEvent(event);
}

} // namespace orvane
