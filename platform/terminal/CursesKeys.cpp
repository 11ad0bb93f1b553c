#include "platform/terminal/CursesKeys.h"

#include <cwchar>
#include <ncurses.h>

namespace orvane
{

namespace
{

constexpr int kEscapeCharacter = 27;
constexpr int kDeleteCharacter = 127;
constexpr int kPasteBegins = KEY_MAX + 1;
constexpr int kPasteEnds = KEY_MAX + 2;
constexpr int kEscapeDelayMs = 25;

Key plainKey(Key::Kind kind)
{
    Key key;
    key.kind = kind;
    return key;
}

Key mouseKey()
{
    MEVENT event{};
    Key key;
    if (getmouse(&event) != OK)
        return key;
    key.line = event.y;
    key.column = event.x;
    if (event.bstate & BUTTON1_PRESSED)
        key.kind = Key::Kind::Click;
    else if (event.bstate & BUTTON4_PRESSED)
        key.kind = Key::Kind::WheelUp;
    else if (event.bstate & BUTTON5_PRESSED)
        key.kind = Key::Kind::WheelDown;
    return key;
}

} // namespace

// Reading from a pad draws nothing by the way.
struct CursesKeys::Pad {
    Pad() : window(newpad(1, 1)) {}
    ~Pad() { delwin(window); }
    Pad(const Pad&) = delete;
    Pad& operator=(const Pad&) = delete;
    WINDOW* window;
};

CursesKeys::CursesKeys() : _pad(std::make_unique<Pad>())
{
    keypad(_pad->window, TRUE);
    nodelay(_pad->window, TRUE);
    set_escdelay(kEscapeDelayMs);
    define_key("\033[200~", kPasteBegins);
    define_key("\033[201~", kPasteEnds);
    mouseinterval(0);
    _hasMouse = mousemask(BUTTON1_PRESSED | BUTTON4_PRESSED | BUTTON5_PRESSED, nullptr) != 0;
}

CursesKeys::~CursesKeys() = default;

std::optional<Key> CursesKeys::read()
{
    std::wint_t character = 0;
    switch (wget_wch(_pad->window, &character)) {
    case KEY_CODE_YES:
        return keyOfCode(static_cast<int>(character));
    case OK:
        return keyOfCharacter(static_cast<char32_t>(character));
    default:
        return std::nullopt;
    }
}

Key CursesKeys::keyOfCode(int code)
{
    switch (code) {
    case kPasteBegins:
    case kPasteEnds:
        _isPasting = code == kPasteBegins;
        return {};
    case KEY_MOUSE:
        return mouseKey();
    case KEY_ENTER:
        return plainKey(Key::Kind::Enter);
    case KEY_BACKSPACE:
        return plainKey(Key::Kind::Backspace);
    case KEY_DC:
        return plainKey(Key::Kind::Delete);
    case KEY_BTAB:
        return plainKey(Key::Kind::BackTab);
    case KEY_UP:
        return plainKey(Key::Kind::Up);
    case KEY_DOWN:
        return plainKey(Key::Kind::Down);
    case KEY_LEFT:
        return plainKey(Key::Kind::Left);
    case KEY_RIGHT:
        return plainKey(Key::Kind::Right);
    case KEY_PPAGE:
        return plainKey(Key::Kind::PageUp);
    case KEY_NPAGE:
        return plainKey(Key::Kind::PageDown);
    case KEY_HOME:
        return plainKey(Key::Kind::Home);
    case KEY_END:
        return plainKey(Key::Kind::End);
    default:
        return {};
    }
}

Key CursesKeys::keyOfCharacter(char32_t character)
{
    Key key = plainKey(_isPasting ? Key::Kind::Pasted : Key::Kind::Character);
    key.character = character;
    if (_isPasting)
        return key;
    switch (character) {
    case kEscapeCharacter:
        return readAfterEscape();
    case '\n':
    case '\r':
        return plainKey(Key::Kind::Enter);
    case '\t':
        return plainKey(Key::Kind::Tab);
    case '\b':
    case kDeleteCharacter:
        return plainKey(Key::Kind::Backspace);
    default:
        return key;
    }
}

// Escape alone, or with what follows at once a key that has no name here, such as Ctrl with an
// arrow.
Key CursesKeys::readAfterEscape()
{
    std::wint_t character = 0;
    const auto next = [&] { return wget_wch(_pad->window, &character); };
    const int result = next();
    if (result == ERR)
        return plainKey(Key::Kind::Escape);
    if (result == KEY_CODE_YES || character == kEscapeCharacter) {
        if (result == OK)
            unget_wch(static_cast<wchar_t>(character));
        else
            ungetch(static_cast<int>(character));
        return plainKey(Key::Kind::Escape);
    }
    if (character == '[' || character == 'O')
        while (next() == OK && (character < 0x40 || character > 0x7E)) {
        }
    return {};
}

} // namespace orvane
