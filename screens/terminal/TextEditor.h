#pragma once

#include "screens/terminal/Canvas.h"

#include <cstddef>
#include <string>

namespace orvane
{

// A line of text that is being typed. The cursor is never between a character and one that combines
// with it.
class TextEditor
{
public:
    // The most characters that can be typed.
    static constexpr std::size_t kLongest = 1000;

    [[nodiscard]] std::string text() const;
    // Puts the cursor at the end. Does nothing if the text is the same.
    void setText(const std::string& text);

    // Takes typed and pasted characters, Backspace, Delete, Left, Right, Home, End, and with Ctrl:
    // A and E (to the ends), U and K (erase to the ends), W (erase a word). False for any other
    // key.
    bool take(const Key& key);

    // Draws the part around the cursor that fits, and places the screen's cursor.
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
