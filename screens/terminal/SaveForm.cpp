#include "screens/terminal/SaveForm.h"

#include "screens/terminal/LineWidth.h"
#include "screens/terminal/RowContent.h"

#include <algorithm>

namespace orvane
{

namespace
{

// From this height on there is room for empty lines between the parts.
constexpr int kRoomy = 12;
constexpr int kWidestField = 70;

} // namespace

SaveForm::SaveForm()
    : _view(std::make_shared<View>()), _background(std::make_shared<Control>()),
      _contents(std::make_shared<TableView>()), _description(std::make_shared<TextField>()),
      _save(std::make_shared<Button>("Save")), _cancel(std::make_shared<Button>("Cancel"))
{
    for (const std::shared_ptr<View>& part :
         {std::shared_ptr<View>(_background), std::shared_ptr<View>(_contents),
          std::shared_ptr<View>(_description), std::shared_ptr<View>(_save),
          std::shared_ptr<View>(_cancel)})
        _view->addSubview(part);
    _description->becomeFirstResponder();
}

std::unique_ptr<Interface> SaveForm::interface() const
{
    auto made = std::make_unique<Interface>(_view);
    made->setOutlet("background", _background);
    made->setOutlet("saveContentTable", _contents);
    made->setOutlet("saveDescription", _description);
    made->setOutlet("saveButton", _save);
    made->setOutlet("cancelButton", _cancel);
    return made;
}

void SaveForm::draw(Canvas& canvas, Lines area)
{
    canvas.grid.clear(area.first, area.count);
    canvas.onClick(area, canvas.grid.wholeLine(), [this](int) { _background->press(); });
    // The field may have lost the keyboard.
    if (isTyping() && !_description->isFirstResponder())
        _focus = Focus::Save;

    const bool isRoomy = area.count >= kRoomy;
    int line = area.first + (isRoomy ? 1 : 0);
    drawDescription(canvas, line++);
    if (isRoomy) {
        ++line;
        canvas.grid.put(line++, 1, "What will be saved:", {Ink::Quiet, false});
    }
    const int gap = isRoomy ? 1 : 0;
    const int room = std::max(area.end() - line - 1 - 2 * gap, 0);
    drawContents(canvas, {line, room});
    const int buttons = line + std::min(static_cast<int>(_rows.count()), room) + gap;
    drawButton(canvas, buttons, 1, *_save, Focus::Save);
    drawButton(canvas, buttons, 12, *_cancel, Focus::Cancel);
}

void SaveForm::drawDescription(Canvas& canvas, int line)
{
    const int start = canvas.grid.put(line, 1, "Description: ", {Ink::Key, false});
    const CellGrid::Span field{start, std::min(canvas.columns() - 1, start + kWidestField)};
    _editor.setText(_description->text());
    const CursorPlace elsewhere = canvas.cursor;
    _editor.draw(canvas, line, field, {Ink::BarQuiet, false});
    if (!isTyping())
        canvas.cursor = elsewhere;
    canvas.onClick({line, 1}, {0, field.end}, [this](int) { setFocus(Focus::Description); });
}

void SaveForm::drawContents(Canvas& canvas, Lines area)
{
    _rows.update(*_contents, std::min(canvas.columns(), TableRows::kReadableColumns), area.count);
    for (int i = 0; i < area.count; ++i) {
        const std::size_t place = _rows.top() + static_cast<std::size_t>(i);
        if (place >= _rows.count())
            return;
        // The list has no selection.
        if (const auto cell = cellOfRow(*_contents, _rows.rowAt(place)))
            drawRow(canvas, area.first + i, _rows.columns(), *cell, {});
    }
}

void SaveForm::drawButton(Canvas& canvas, int line, int column, const Button& button, Focus place)
{
    const bool hasFocus = _focus == place;
    const int end = canvas.grid.put(line, column, "[ " + button.title() + " ]",
                                    {hasFocus ? Ink::Key : Ink::Plain, hasFocus});
    if (hasFocus)
        canvas.cursor = {line, column, false};
    canvas.onClick({line, 1}, {column, end}, [&button](int) { button.press(); });
}

std::vector<Hint> SaveForm::hints(const Marks&) const
{
    std::vector<Hint> hints;
    if (isTyping())
        hints.push_back({"Enter", "done", keyOfKind(Key::Kind::Enter)});
    else
        hints.push_back(
            {"Enter", _focus == Focus::Save ? "save" : "cancel", keyOfKind(Key::Kind::Enter)});
    hints.push_back({"Tab", "next", keyOfKind(Key::Kind::Tab)});
    hints.push_back({"Esc", "cancel", keyOfKind(Key::Kind::Escape)});
    return hints;
}

bool SaveForm::take(const Key& key)
{
    switch (key.kind) {
    case Key::Kind::Escape:
        _cancel->press();
        return true;
    case Key::Kind::Tab:
    case Key::Kind::Down:
        moveFocus(true);
        return true;
    case Key::Kind::BackTab:
    case Key::Kind::Up:
        moveFocus(false);
        return true;
    case Key::Kind::PageUp:
    case Key::Kind::WheelUp:
        _rows.scrollBy(-_rows.page());
        return true;
    case Key::Kind::PageDown:
    case Key::Kind::WheelDown:
        _rows.scrollBy(_rows.page());
        return true;
    default:
        break;
    }
    if (isTyping())
        return takeInDescription(key);
    if (key.kind == Key::Kind::Left || key.kind == Key::Kind::Right)
        moveFocus(key.kind == Key::Kind::Right);
    else if (key.kind == Key::Kind::Enter ||
             (key.kind == Key::Kind::Character && key.character == ' '))
        (_focus == Focus::Save ? _save : _cancel)->press();
    return true;
}

bool SaveForm::takeInDescription(const Key& key)
{
    if (key.kind == Key::Kind::Enter) {
        _description->pressReturn();
        return true;
    }
    if (!_editor.take(key))
        return false;
    _description->setText(_editor.text());
    return true;
}

void SaveForm::moveFocus(bool isForward)
{
    const int next = (static_cast<int>(_focus) + (isForward ? 1 : 2)) % 3;
    setFocus(static_cast<Focus>(next));
}

void SaveForm::setFocus(Focus focus)
{
    _focus = focus;
    if (isTyping())
        _description->becomeFirstResponder();
    else
        _description->resignFirstResponder();
}

} // namespace orvane
