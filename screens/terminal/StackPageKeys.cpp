// What keys and clicks do on the navigation stack.

#include "screens/terminal/StackPage.h"
#include "screens/terminal/Toolbar.h"
#include "screens/toolkit/TableViewController.h"

namespace orvane
{

namespace
{

constexpr std::ptrdiff_t kWheelRows = 3;

} // namespace

std::vector<Hint> StackPage::hints(const Marks& marks) const
{
    std::vector<Hint> hints;
    const TableRows* shown = rows();
    const RowContent* selected = shown ? shown->selected() : nullptr;
    if (selected && selected->isGroup)
        hints.push_back({"Enter", "open", keyOfKind(Key::Kind::Enter)});
    if (selected && shown->canScrollSideways(true))
        hints.push_back({marks.rightArrow, "more", keyOfKind(Key::Kind::Right)});
    if (selected && shown->canScrollSideways(false))
        hints.push_back({marks.leftArrow, "scroll back", keyOfKind(Key::Kind::Left)});
    else if (shown && !shown->filter().empty())
        hints.push_back({"Esc", "all rows", keyOfKind(Key::Kind::Escape)});
    else if (canGoBack())
        hints.push_back({marks.leftArrow, "back", keyOfKind(Key::Kind::Left)});
    if (top() && saveItem(*top()))
        hints.push_back({"s", "save", keyOfCharacter('s')});
    PlaybackLine::addHints(hints, _playback);
    if (shown && shown->total() > 0)
        hints.push_back({"/", "filter", keyOfCharacter('/')});
    return hints;
}

std::vector<KeyHelp> StackPage::keys() const
{
    std::vector<KeyHelp> keys;
    const auto addIf = [&keys](bool works, const char* names, const char* what) {
        if (works)
            keys.push_back({names, what});
    };
    const TableRows* shown = rows();
    const bool isFiltered = shown && !shown->filter().empty();
    const bool hasMoreRows = shown && shown->count() > 1;
    addIf(hasMoreRows, "Up Down k j", "a row up, down");
    addIf(hasMoreRows, "PgUp PgDn", "a screen up, down");
    addIf(hasMoreRows, "Home End", "first row, last row");
    addIf(shown && shown->hasGroup(), "Enter Right l", "open the row");
    addIf(canGoBack(), "Left h Backspace", "back");
    addIf(isFiltered, "Escape", canGoBack() ? "all rows, then back" : "all rows");
    addIf(!isFiltered && canGoBack(), "Escape", "back");
    addIf(shown && shown->hasLongValue(), "Right Left", "scroll a long value");
    addIf(shown && shown->total() > 0, "/", "filter as you type");
    addIf(top() && saveItem(*top()), "s", "save a snapshot");
    PlaybackLine::addKeys(keys, _playback);
    addIf(true, "?", "these keys");
    addIf(true, "q Ctrl-C", "quit");
    addIf(true, "Ctrl-Z", "suspend, fg goes on");
    addIf(true, "Ctrl-L", "draw the screen again");
    addIf(true, "Mouse", "click and wheel");
    return keys;
}

bool StackPage::take(const Key& key)
{
    if (_playbackLine.hasPrompt())
        return _playbackLine.take(key, _playback);
    if (_filterEditor) {
        takeInFilter(key);
        return true;
    }
    TableRows* shown = rows();
    if (!shown)
        return false;
    switch (key.kind) {
    case Key::Kind::Up:
        shown->moveBy(-1);
        return true;
    case Key::Kind::Down:
        shown->moveBy(1);
        return true;
    case Key::Kind::PageUp:
        shown->moveBy(-shown->page());
        return true;
    case Key::Kind::PageDown:
        shown->moveBy(shown->page());
        return true;
    case Key::Kind::WheelUp:
        shown->scrollBy(-kWheelRows);
        return true;
    case Key::Kind::WheelDown:
        shown->scrollBy(kWheelRows);
        return true;
    case Key::Kind::Home:
        shown->select(0);
        return true;
    case Key::Kind::End:
        shown->select(SIZE_MAX);
        return true;
    case Key::Kind::Enter:
        return openSelected();
    case Key::Kind::Right:
        return shown->scrollSideways(true) || openSelected();
    case Key::Kind::Left:
        return shown->scrollSideways(false) || goBack();
    case Key::Kind::Backspace:
        return goBack();
    case Key::Kind::Escape:
        return leave();
    case Key::Kind::Character:
        return takeCharacter(key.character);
    default:
        return false;
    }
}

bool StackPage::takeCharacter(char32_t character)
{
    switch (character) {
    case 'j':
        return take(keyOfKind(Key::Kind::Down));
    case 'k':
        return take(keyOfKind(Key::Kind::Up));
    case 'h':
        return take(keyOfKind(Key::Kind::Left));
    case 'l':
        return take(keyOfKind(Key::Kind::Right));
    case 's':
        return save();
    case '/':
        openFilter();
        return true;
    default:
        return _playbackLine.take(keyOfCharacter(character), _playback);
    }
}

void StackPage::openFilter()
{
    _filterEditor.emplace();
    _filterEditor->setText(rows()->filter());
}

void StackPage::takeInFilter(const Key& key)
{
    TableRows* shown = rows();
    if (!shown) {
        _filterEditor.reset();
        return;
    }
    switch (key.kind) {
    case Key::Kind::Enter:
        _filterEditor.reset();
        return;
    case Key::Kind::Escape:
        _filterEditor.reset();
        shown->setFilter("");
        return;
    case Key::Kind::Up:
        shown->moveBy(-1);
        return;
    case Key::Kind::Down:
        shown->moveBy(1);
        return;
    default:
        if (_filterEditor->take(key))
            shown->setFilter(_filterEditor->text());
    }
}

bool StackPage::openSelected()
{
    const TableRows* shown = rows();
    if (!shown || shown->count() == 0)
        return false;
    top()->tableView().selectRow(shown->rowAt(shown->selection()));
    return true;
}

void StackPage::clickPlace(std::size_t place)
{
    TableRows* shown = rows();
    if (!shown || place >= shown->count())
        return;
    shown->select(place);
    openSelected();
}

bool StackPage::canGoBack() const { return _stack && _stack->viewControllers().size() > 1; }

bool StackPage::goBack()
{
    if (!canGoBack())
        return false;
    _stack->popViewController(true);
    return true;
}

bool StackPage::leave()
{
    TableRows* shown = rows();
    if (!shown || shown->filter().empty())
        return goBack();
    shown->setFilter("");
    return true;
}

bool StackPage::save() const
{
    if (!top())
        return false;
    const BarButtonItem* item = saveItem(*top());
    if (item)
        item->press();
    return item != nullptr;
}

} // namespace orvane
