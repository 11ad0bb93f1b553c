#pragma once

#include "screens/terminal/Canvas.h"

#include <cstddef>
#include <string>

namespace orvane
{

// One line of text as it is typed. The cursor stands between characters, never between one and what
// combines with it.
class TextEditor
{
public:
    // As many characters as one may type.
    static constexpr std::size_t kLongest = 1000;

    [[nodiscard]] std::string text() const;
    // With the cursor at its end. Nothing changes for the text that is there already.
    void setText(const std::string& text);

    // Characters and pasted ones, Backspace, Delete, Left, Right, Home, End, and with Ctrl: A and E
    // (to the ends), U and K (erase to them), W (erase a word). False for any other key.
    bool take(const Key& key);

    // Draws as much as fits, always with the cursor, which becomes the screen's.
    void draw(Canvas& canvas, int line, CellGrid::Span span, Style style);

private:
    bool takeCharacter(char32_t character);
    void insert(char32_t character);
    void erase(std::size_t from, std::size_t end);
    [[nodiscard]] std::size_t before(std::size_t place) const;
    [[nodiscard]] std::size_t after(std::size_t place) const;
    [[nodiscard]] std::size_t startOfWord() const;

    std::u32string _text;
    std::size_t _cursor = 0;
    int _firstColumn = 0; // of the text, that is drawn
};

} // namespace orvane
