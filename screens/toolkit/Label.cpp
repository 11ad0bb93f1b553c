#include "screens/toolkit/Label.h"

#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

namespace
{

// Assigns the value. Returns whether it differs from the one before.
template <typename Value>
bool replace(Value& old, Value value)
{
    if (old == value)
        return false;
    old = std::move(value);
    return true;
}

} // namespace

void Label::setText(std::optional<std::string> text)
{
    if (replace(_text, std::move(text).value_or("")))
        changed();
}

void Label::setFont(Font font)
{
    if (replace(_font, std::move(font)))
        changed();
}

void Label::setAlignment(TextAlignment alignment)
{
    if (replace(_alignment, alignment))
        changed();
}

void Label::setTextColour(Colour colour)
{
    if (replace(_textColour, colour))
        changed();
}

void Label::setBackgroundColour(Colour colour)
{
    if (replace(_backgroundColour, colour))
        changed();
}

void Label::sizeToFit()
{
    const Size size = Screen::main().sizeWithFont(_text, _font);
    setFrame({frame().x, frame().y, size.width, size.height});
}

} // namespace orvane
