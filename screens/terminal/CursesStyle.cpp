#include "screens/terminal/CursesStyle.h"

#include <cstdlib>

namespace orvane
{

namespace
{

constexpr short kMarkPair = 1;

} // namespace

CursesStyle::CursesStyle()
{
    const char* refused = std::getenv("NO_COLOR");
    _hasColours = has_colors() && !(refused && *refused) && start_color() == OK;
    if (!_hasColours)
        return;
    use_default_colors();
    init_pair(kMarkPair, COLOR_CYAN, -1);
}

attr_t CursesStyle::attributes(Style style) const
{
    const auto usual = [&]() -> attr_t {
        switch (style.ink) {
        case Ink::Plain:
        case Ink::Status:
            return A_NORMAL;
        case Ink::Quiet:
            return style.isSelected ? A_NORMAL : A_DIM;
        case Ink::Key:
        case Ink::Changed:
        case Ink::StatusKey:
        case Ink::Warning:
        case Ink::Mark:
            return A_BOLD;
        case Ink::Bar:
            return A_BOLD | A_REVERSE;
        case Ink::BarQuiet:
            return A_REVERSE;
        }
        return A_NORMAL;
    };
    // On a reversed bar, the selected part is the one that is not reversed.
    return style.isSelected ? usual() ^ A_REVERSE : usual();
}

short CursesStyle::pair(Style style) const
{
    return _hasColours && style.ink == Ink::Mark && !style.isSelected ? kMarkPair : 0;
}

} // namespace orvane
