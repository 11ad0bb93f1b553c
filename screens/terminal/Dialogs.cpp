#include "screens/terminal/Dialogs.h"

#include "screens/terminal/LineWidth.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

constexpr int kWidestAlert = 56;
constexpr int kKeyColumns = 18;

} // namespace

AlertPage::AlertPage(std::string title, std::string message, std::string button,
                     std::function<void()> dismiss)
    : _title(std::move(title)), _message(std::move(message)), _button(std::move(button)),
      _dismiss(std::move(dismiss))
{
}

void AlertPage::draw(Canvas& canvas, Lines area)
{
    const int width = std::min(canvas.columns() - 4, kWidestAlert);
    const int left = (canvas.columns() - width) / 2;
    const std::vector<std::string> lines = wrapped(_message, std::max(width - 4, 1));
    const int height = std::min(static_cast<int>(lines.size()) + 4, area.count);
    const int first = area.first + (area.count - height) / 2;
    const CellGrid::Span box{left, left + width};
    for (int line = first; line < first + height; ++line)
        canvas.grid.fill(line, box, {Ink::BarQuiet, false});
    canvas.grid.put(first, left + 2, shortened(_title, width - 4, canvas.marks.cut),
                    {Ink::Bar, false});
    for (int i = 0; i < std::min(static_cast<int>(lines.size()), height - 3); ++i)
        canvas.grid.put(first + 1 + i, left + 2, lines[static_cast<std::size_t>(i)],
                        {Ink::BarQuiet, false});
    const std::string button = "[ " + _button + " ]";
    const int column = left + (width - columnsOf(button)) / 2;
    const int end = canvas.grid.put(first + height - 1, column, button, {Ink::Bar, true});
    canvas.onClick({first + height - 1, 1}, {column, end}, [this](int) { _dismiss(); });
    canvas.cursor = {first + height - 1, column, false};
}

bool AlertPage::take(const Key& key)
{
    if (key.kind == Key::Kind::Enter || key.kind == Key::Kind::Escape ||
        (key.kind == Key::Kind::Character && key.character == ' '))
        _dismiss();
    return true;
}

std::vector<Hint> AlertPage::hints(const Marks&) const
{
    return {
        {"Enter", _button, keyOfKind(Key::Kind::Enter)}
    };
}

HelpPage::HelpPage(std::vector<KeyHelp> keys, std::function<void()> close)
    : _keys(std::move(keys)), _close(std::move(close))
{
}

void HelpPage::draw(Canvas& canvas, Lines area)
{
    _most = std::max(static_cast<int>(_keys.size()) - area.count, 0);
    _first = std::clamp(_first, 0, _most);
    canvas.grid.clear(area.first, area.count);
    const int keyColumns = std::min(kKeyColumns, canvas.columns() / 2);
    const int count = std::min(area.count, static_cast<int>(_keys.size()) - _first);
    for (int i = 0; i < count; ++i) {
        const KeyHelp& help = _keys[static_cast<std::size_t>(_first + i)];
        const int line = area.first + i;
        canvas.grid.put(line, 1, shortened(help.keys, keyColumns - 2, canvas.marks.cut),
                        {Ink::StatusKey, false});
        canvas.grid.put(line, keyColumns,
                        shortened(help.what, canvas.columns() - keyColumns, canvas.marks.cut),
                        {Ink::Plain, false});
    }
    canvas.cursor = {area.first, 0, false};
}

bool HelpPage::take(const Key& key)
{
    const bool isUp = key.kind == Key::Kind::Up || key.kind == Key::Kind::WheelUp ||
                      key.kind == Key::Kind::PageUp;
    const bool isDown = key.kind == Key::Kind::Down || key.kind == Key::Kind::WheelDown ||
                        key.kind == Key::Kind::PageDown;
    if (isUp || isDown)
        _first = std::clamp(_first + (isUp ? -1 : 1), 0, _most);
    else
        _close();
    return true;
}

std::vector<Hint> HelpPage::hints(const Marks& marks) const
{
    std::vector<Hint> hints;
    if (_most > 0)
        hints.push_back({marks.upDown, "scroll", keyOfKind(Key::Kind::Down)});
    hints.push_back({"Esc", "close", keyOfKind(Key::Kind::Escape)});
    return hints;
}

} // namespace orvane
