#include "screens/terminal/TextEditor.h"

#include "screens/terminal/LineWidth.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr char32_t control(char letter) { return static_cast<char32_t>(letter) & 0x1F; }

bool isCombining(char32_t character) { return columnsOf(character) == 0; }

} // namespace

std::string TextEditor::text() const { return encoded(_text); }

void TextEditor::setText(const std::string& text)
{
    std::u32string other = decoded(text);
    if (other == _text)
        return;
    _text = std::move(other);
    _cursor = _text.size();
}

bool TextEditor::take(const Key& key)
{
    switch (key.kind) {
    case Key::Kind::Character:
        return takeCharacter(key.character);
    case Key::Kind::Pasted:
        insert(key.character == '\n' || key.character == '\r' || key.character == '\t'
                   ? U' '
                   : key.character);
        return true;
    case Key::Kind::Backspace:
        erase(before(_cursor), _cursor);
        return true;
    case Key::Kind::Delete:
        erase(_cursor, after(_cursor));
        return true;
    case Key::Kind::Left:
        _cursor = before(_cursor);
        return true;
    case Key::Kind::Right:
        _cursor = after(_cursor);
        return true;
    case Key::Kind::Home:
        _cursor = 0;
        return true;
    case Key::Kind::End:
        _cursor = _text.size();
        return true;
    default:
        return false;
    }
}

bool TextEditor::takeCharacter(char32_t character)
{
    switch (character) {
    case control('A'):
        _cursor = 0;
        return true;
    case control('E'):
        _cursor = _text.size();
        return true;
    case control('U'):
        erase(0, _cursor);
        return true;
    case control('K'):
        erase(_cursor, _text.size());
        return true;
    case control('W'):
        erase(startOfWord(), _cursor);
        return true;
    default:
        if (columnsOf(character) < 0)
            return false;
        insert(character);
        return true;
    }
}

void TextEditor::insert(char32_t character)
{
    if (_text.size() >= kLongest || columnsOf(character) < 0)
        return;
    _text.insert(_cursor++, 1, character);
}

void TextEditor::erase(std::size_t from, std::size_t end)
{
    _text.erase(from, end - from);
    _cursor = from;
}

std::size_t TextEditor::before(std::size_t place) const
{
    if (place > 0)
        --place;
    while (place > 0 && isCombining(_text[place]))
        --place;
    return place;
}

std::size_t TextEditor::after(std::size_t place) const
{
    if (place < _text.size())
        ++place;
    while (place < _text.size() && isCombining(_text[place]))
        ++place;
    return place;
}

std::size_t TextEditor::startOfWord() const
{
    std::size_t place = _cursor;
    while (place > 0 && _text[place - 1] == ' ')
        --place;
    while (place > 0 && _text[place - 1] != ' ')
        --place;
    return place;
}

void TextEditor::draw(Canvas& canvas, int line, CellGrid::Span span, Style style)
{
    const int width = std::max(span.end - span.first, 1);
    const int cursor = columnsOf(encoded(_text.substr(0, _cursor)));
    // Room for the cursor behind the last character.
    _firstColumn = std::clamp(_firstColumn, std::max(cursor - width + 1, 0), cursor);
    canvas.grid.fill(line, span, style);
    canvas.grid.put(line, span.first - _firstColumn, text(), style, span);
    canvas.cursor = {line, span.first + cursor - _firstColumn, true};
}

} // namespace orvane
