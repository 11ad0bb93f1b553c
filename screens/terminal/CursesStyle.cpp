#include "screens/terminal/CursesStyle.h"

#include <cstdlib>

namespace orvane
{

namespace
{

constexpr short kBarPair = 1;
constexpr short kChangedPair = 2;
constexpr short kWarningPair = 3;
constexpr short kKeyPair = 4;

} // namespace

CursesStyle::CursesStyle()
{
    const char* refused = std::getenv("NO_COLOR");
    _hasColours = has_colors() && !(refused && *refused) && start_color() == OK;
    if (!_hasColours)
        return;
    use_default_colors();
    init_pair(kBarPair, COLOR_WHITE, COLOR_BLUE);
    init_pair(kChangedPair, COLOR_GREEN, -1);
    init_pair(kWarningPair, COLOR_RED, -1);
    init_pair(kKeyPair, COLOR_CYAN, -1);
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
            return A_BOLD;
        case Ink::Bar:
            return _hasColours ? A_BOLD : A_BOLD | A_REVERSE;
        case Ink::BarQuiet:
            return _hasColours ? A_NORMAL : A_REVERSE;
        }
        return A_NORMAL;
    };
    return style.isSelected ? usual() | A_REVERSE : usual();
}

short CursesStyle::pair(Style style) const
{
    if (!_hasColours)
        return 0;
    switch (style.ink) {
    case Ink::Bar:
    case Ink::BarQuiet:
        return kBarPair;
    case Ink::Changed:
        return kChangedPair;
    case Ink::Warning:
        return kWarningPair;
    case Ink::StatusKey:
        return kKeyPair;
    default:
        return 0;
    }
}

} // namespace orvane
