#include "screens/terminal/CursesKeys.h"

#include "screens/terminal/Canvas.h"

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

// If the mark at the end of a paste is lost, a pause ends the paste.
constexpr std::chrono::seconds kPastePause{1};
constexpr int kBell = 7;
constexpr int kLongestString = 4096;

// The codes of common terminals, which are recognised whatever TERM says.
struct Code {
    const char* sent;
    int key;
};
constexpr Code kCodes[] = {
    {"\033[200~", kPasteBegins},
    {"\033[201~", kPasteEnds  },
    {"\033[A",    KEY_UP      },
    {"\033OA",    KEY_UP      },
    {"\033[B",    KEY_DOWN    },
    {"\033OB",    KEY_DOWN    },
    {"\033[C",    KEY_RIGHT   },
    {"\033OC",    KEY_RIGHT   },
    {"\033[D",    KEY_LEFT    },
    {"\033OD",    KEY_LEFT    },
    {"\033[H",    KEY_HOME    },
    {"\033OH",    KEY_HOME    },
    {"\033[1~",   KEY_HOME    },
    {"\033[7~",   KEY_HOME    },
    {"\033[F",    KEY_END     },
    {"\033OF",    KEY_END     },
    {"\033[4~",   KEY_END     },
    {"\033[8~",   KEY_END     },
    {"\033[3~",   KEY_DC      },
    {"\033[5~",   KEY_PPAGE   },
    {"\033[6~",   KEY_NPAGE   },
};

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

// Unlike reading from a window, reading from a pad does not draw.
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
    for (const Code& code : kCodes)
        define_key(code.sent, code.key);
    mouseinterval(0);
    _hasMouse = mousemask(BUTTON1_PRESSED | BUTTON4_PRESSED | BUTTON5_PRESSED, nullptr) != 0;
}

CursesKeys::~CursesKeys() = default;

std::optional<Key> CursesKeys::read()
{
    std::wint_t character = 0;
    const int result = wget_wch(_pad->window, &character);
    if (result == ERR)
        return std::nullopt;
    const auto now = std::chrono::steady_clock::now();
    if (now - _lastRead > kPastePause)
        endPaste();
    _lastRead = now;
    switch (result) {
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
        return keyOfKind(Key::Kind::Enter);
    case KEY_BACKSPACE:
        return keyOfKind(Key::Kind::Backspace);
    case KEY_DC:
        return keyOfKind(Key::Kind::Delete);
    case KEY_BTAB:
        return keyOfKind(Key::Kind::BackTab);
    case KEY_UP:
        return keyOfKind(Key::Kind::Up);
    case KEY_DOWN:
        return keyOfKind(Key::Kind::Down);
    case KEY_LEFT:
        return keyOfKind(Key::Kind::Left);
    case KEY_RIGHT:
        return keyOfKind(Key::Kind::Right);
    case KEY_PPAGE:
        return keyOfKind(Key::Kind::PageUp);
    case KEY_NPAGE:
        return keyOfKind(Key::Kind::PageDown);
    case KEY_HOME:
        return keyOfKind(Key::Kind::Home);
    case KEY_END:
        return keyOfKind(Key::Kind::End);
    default:
        return {};
    }
}

Key CursesKeys::keyOfCharacter(char32_t character)
{
    Key key = keyOfKind(_isPasting ? Key::Kind::Pasted : Key::Kind::Character);
    key.character = character;
    if (_isPasting)
        return key;
    switch (character) {
    case kEscapeCharacter:
        return readAfterEscape();
    case '\n':
    case '\r':
        return keyOfKind(Key::Kind::Enter);
    case '\t':
        return keyOfKind(Key::Kind::Tab);
    case '\b':
    case kDeleteCharacter:
        return keyOfKind(Key::Kind::Backspace);
    default:
        return key;
    }
}

// Escape alone, or the start of a code for a key without a name here, such as Ctrl with an arrow.
Key CursesKeys::readAfterEscape()
{
    std::wint_t character = 0;
    const auto next = [&] { return wget_wch(_pad->window, &character); };
    const int result = next();
    if (result == ERR)
        return keyOfKind(Key::Kind::Escape);
    if (result == KEY_CODE_YES || character == kEscapeCharacter) {
        if (result == OK)
            unget_wch(static_cast<wchar_t>(character));
        else
            ungetch(static_cast<int>(character));
        return keyOfKind(Key::Kind::Escape);
    }
    if (character == ']' || character == 'P' || character == '_' || character == '^' ||
        character == 'X')
        skipString();
    else if (character == '[' || character == 'O')
        while (next() == OK && (character < 0x40 || character > 0x7E)) {
        }
    return {};
}

// Skips an answer of the terminal, or a forged one, up to BEL or Escape and a backslash.
void CursesKeys::skipString()
{
    wtimeout(_pad->window, kEscapeDelayMs); // the answer may arrive in parts
    std::wint_t character = 0;
    for (int i = 0; i < kLongestString; ++i) {
        const int result = wget_wch(_pad->window, &character);
        if (result == ERR || (result == OK && character == kBell))
            break;
        if (result == OK && character == kEscapeCharacter) {
            wget_wch(_pad->window, &character);
            break;
        }
    }
    nodelay(_pad->window, TRUE);
}

} // namespace orvane
