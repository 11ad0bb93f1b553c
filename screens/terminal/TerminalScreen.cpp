#include "screens/terminal/TerminalScreen.h"

#include "screens/terminal/Chrome.h"
#include "screens/terminal/Dialogs.h"
#include "screens/terminal/LineWidth.h"
#include "screens/terminal/Metrics.h"
#include "screens/toolkit/Window.h"

#include <algorithm>
#include <chrono>
#include <utility>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

constexpr auto kIndicatorInterval = 150ms;
// As a rule longer than a refresh period.
constexpr auto kMarkTime = 5s;
constexpr const char* kSimulated = "simulated phone";
constexpr const char* kShortSimulated = "simulated"; // leaves more room for the path
constexpr int kNarrow = 60;
constexpr char32_t kRedraw = 'L' & 0x1F;  // Ctrl-L
constexpr char32_t kSuspend = 'Z' & 0x1F; // Ctrl-Z

NavigationController* navigationOf(const Screen& screen)
{
    return screen.keyWindow()
               ? dynamic_cast<NavigationController*>(screen.keyWindow()->rootViewController().get())
               : nullptr;
}

} // namespace

TerminalScreen::TerminalScreen(TerminalDevice& device, MainQueue& queue, Settings settings)
    : _device(device), _queue(queue), _settings(std::move(settings)), _stack(_settings.waitingHint)
{
    setMain(this);
    setNeedsUpdate();
}

TerminalScreen::~TerminalScreen() = default;

// As wide as the rows, because new cells are laid out in it.
Rect TerminalScreen::bounds() const
{
    return rectOfCells(_stack.rowColumns(_device.columns()), _device.lines());
}

Size TerminalScreen::sizeWithFont(std::string_view text, const Font&) const
{
    return {pointsOfColumns(columnsOf(text)), kPointsOfText};
}

std::unique_ptr<Interface> TerminalScreen::loadInterface(const std::string& name)
{
    if (name != SaveForm::kInterfaceName)
        return nullptr;
    _canvas.zones.clear(); // they may refer to the form before
    _form = std::make_unique<SaveForm>();
    return _form->interface();
}

void TerminalScreen::setNeedsUpdate()
{
    if (_isUpdating || _isUpdateQueued)
        return;
    _isUpdateQueued = true;
    _queue.async(_lifetime.whileAlive([this] {
        _isUpdateQueued = false;
        update();
    }));
}

void TerminalScreen::update()
{
    draw();
    show();
}

void TerminalScreen::draw()
{
    // Drawing adapts the toolkit's objects to the screen. That needs no further update.
    _isUpdating = true;
    _canvas.grid = CellGrid(_device.lines(), _device.columns());
    _canvas.marks = Marks::of(_device.hasMarks());
    _canvas.turn = _turn;
    _canvas.cursor = {};
    _canvas.zones.clear();
    drawPages();
    _isUpdating = false;
    markForAMoment();
    turnIndicator();
}

void TerminalScreen::show() { _device.show(_canvas.grid, _canvas.cursor); }

void TerminalScreen::drawPages()
{
    _stack.show(navigationOf(*this), playback());
    const Lines area{1, _device.lines() - 2};
    std::vector<Crumb> crumbs = _stack.crumbs();
    if (area.count > 0)
        _stack.draw(_canvas, area);
    if (shownForm()) {
        crumbs.push_back({"Save", nullptr});
        _form->draw(_canvas, area);
    }
    if (!_isHelpWanted)
        _help.reset();
    if (_help) {
        crumbs = {
            {"Keys", nullptr}
        };
        _help->draw(_canvas, area);
    }
    _alert.reset();
    if (const AlertView* shown = alert()) {
        _alert = std::make_unique<AlertPage>(shown->title(), shown->message(), shown->buttonTitle(),
                                             [this] { dismissAlert(); });
        _alert->draw(_canvas, area);
    }
    const char* mark = _canvas.columns() < kNarrow ? kShortSimulated : kSimulated;
    drawTitle(_canvas, 0, crumbs, _settings.isSimulated ? mark : "");
    const int foot = _device.lines() - 1;
    if (foot < 1 || front().drawPrompt(_canvas, foot))
        return;
    std::vector<Hint> hints = front().hints(_canvas.marks);
    if (&front() == &_stack) {
        hints.push_back({"?", "keys", keyOfCharacter('?')});
        hints.push_back({"q", "quit", keyOfCharacter('q')});
    }
    drawHints(_canvas, foot, hints, [this](const Key& key) { take(key); });
}

Page& TerminalScreen::front()
{
    if (_alert)
        return *_alert;
    if (_help)
        return *_help;
    if (SaveForm* form = shownForm())
        return *form;
    return _stack;
}

SaveForm* TerminalScreen::shownForm() const
{
    const NavigationController* stack = navigationOf(*this);
    const auto modal = stack ? stack->modalViewController() : nullptr;
    return modal && _form && modal->view().get() == _form->view() ? _form.get() : nullptr;
}

// Changed values stay marked until the next refresh, or for a while if there is none.
void TerminalScreen::markForAMoment()
{
    const std::size_t changes = _stack.changeCount();
    if (_changesMarked == changes)
        return;
    _changesMarked = changes;
    _queue.after(kMarkTime, _lifetime.whileAlive([this, changes] {
        if (_changesMarked != changes)
            return;
        _stack.forgetChanges();
        setNeedsUpdate();
    }));
}

void TerminalScreen::turnIndicator()
{
    if (!_stack.isBusy()) {
        _indicatorTimer.reset();
    } else if (!_indicatorTimer) {
        _indicatorTimer = _queue.repeatingTimer(kIndicatorInterval, [this] {
            ++_turn;
            setNeedsUpdate();
        });
    }
}

void TerminalScreen::inputIsReady()
{
    bool hasRead = false;
    while (const auto key = _device.readKey()) {
        hasRead = true;
        if (key->kind == Key::Kind::Click)
            click(*key);
        else
            take(*key);
        // The next key belongs to the state that this one has led to.
        draw();
    }
    if (hasRead)
        show();
    else if (_device.isGone() && _settings.onQuit)
        _settings.onQuit();
}

void TerminalScreen::take(const Key& key)
{
    if (key.kind == Key::Kind::Character && key.character == kSuspend)
        _device.suspend();
    else if (key.kind == Key::Kind::Character && key.character == kRedraw)
        _device.retake();
    else if (!front().take(key) && &front() == &_stack)
        takeCommand(key);
}

void TerminalScreen::takeCommand(const Key& key)
{
    if (key.kind != Key::Kind::Character)
        return;
    if (key.character == 'q' && _settings.onQuit) {
        _settings.onQuit();
    } else if (key.character == '?') {
        _isHelpWanted = true;
        _help = std::make_unique<HelpPage>(_stack.keys(), [this] { _isHelpWanted = false; });
    }
}

void TerminalScreen::click(const Key& key)
{
    const auto isHit = [&](const Canvas::Zone& zone) {
        return key.line >= zone.lines.first && key.line < zone.lines.end() &&
               key.column >= zone.columns.first && key.column < zone.columns.end;
    };
    const auto found = std::find_if(_canvas.zones.rbegin(), _canvas.zones.rend(), isHit);
    if (found == _canvas.zones.rend())
        return;
    const auto zone = *found;
    zone.click(key.column - zone.columns.first);
}

void TerminalScreen::sizeHasChanged()
{
    _device.updateSize();
    update();
}

void TerminalScreen::suspend()
{
    _device.suspend();
    update();
}

void TerminalScreen::wasContinued()
{
    _device.retake();
    update();
}

} // namespace orvane
