#pragma once

#include "screens/toolkit/Font.h"
#include "screens/toolkit/View.h"

#include <optional>
#include <string>

namespace orvane
{

enum class TextAlignment { Left, Centre, Right };

// Front ends choose the shades, light and dark.
enum class Colour { Clear, Default, DarkText };

// One line of text.
class Label : public View
{
public:
    [[nodiscard]] const std::string& text() const { return _text; }
    // nullopt sets an empty text.
    void setText(std::optional<std::string> text);
    [[nodiscard]] const Font& font() const { return _font; }
    void setFont(Font font);
    [[nodiscard]] TextAlignment alignment() const { return _alignment; }
    void setAlignment(TextAlignment alignment);
    [[nodiscard]] Colour textColour() const { return _textColour; }
    void setTextColour(Colour colour);
    [[nodiscard]] Colour backgroundColour() const { return _backgroundColour; }
    void setBackgroundColour(Colour colour);

    // Makes the frame as large as the text. Its place stays.
    void sizeToFit();

private:
    std::string _text;
    Font _font;
    TextAlignment _alignment = TextAlignment::Left;
    Colour _textColour = Colour::Default;
    Colour _backgroundColour = Colour::Default;
};

} // namespace orvane
