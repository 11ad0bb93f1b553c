#include "screens/terminal/Canvas.h"

namespace orvane
{

Marks Marks::of(bool isBeautiful)
{
    Marks marks;
    if (isBeautiful) {
        marks.disclosure = "›";
        marks.cut = "…";
        marks.check = "✓";
        marks.leftArrow = "←";
        marks.rightArrow = "→";
        marks.upDown = "↑↓";
        marks.play = "▶";
        marks.pause = "‖";
        marks.barDone = "━";
        marks.barLeft = "─";
        marks.indicator = {"⠋", "⠙", "⠹", "⠸", "⠼", "⠴", "⠦", "⠧", "⠇", "⠏"};
    } else {
        marks.disclosure = ">";
        marks.cut = "~";
        marks.check = "x";
        marks.leftArrow = "Left";
        marks.rightArrow = "Right";
        marks.upDown = "Up/Down";
        marks.play = ">";
        marks.pause = "=";
        marks.barDone = "#";
        marks.barLeft = "-";
        marks.indicator = {"|", "/", "-", "\\"};
    }
    return marks;
}

Key keyOfKind(Key::Kind kind)
{
    Key key;
    key.kind = kind;
    return key;
}

Key keyOfCharacter(char32_t character)
{
    Key key = keyOfKind(Key::Kind::Character);
    key.character = character;
    return key;
}

} // namespace orvane
