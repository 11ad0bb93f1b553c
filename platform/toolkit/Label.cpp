#include "platform/toolkit/Label.h"

#include "platform/toolkit/Screen.h"

#include <utility>

namespace orvane
{

void Label::setText(std::optional<std::string> text)
{
    _text = std::move(text).value_or("");
    changed();
}

void Label::setFont(Font font)
{
    _font = std::move(font);
    changed();
}

void Label::setAlignment(TextAlignment alignment)
{
    _alignment = alignment;
    changed();
}

void Label::setTextColour(Colour colour)
{
    _textColour = colour;
    changed();
}

void Label::setBackgroundColour(Colour colour)
{
    _backgroundColour = colour;
    changed();
}

void Label::sizeToFit()
{
    const Size size = Screen::main().sizeWithFont(_text, _font);
    setFrame({frame().x, frame().y, size.width, size.height});
}

} // namespace orvane
