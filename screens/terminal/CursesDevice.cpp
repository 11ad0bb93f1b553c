#include "screens/terminal/CursesDevice.h"

#include "screens/terminal/CursesKeys.h"
#include "screens/terminal/CursesStyle.h"
#include "screens/terminal/LineWidth.h"
#include "screens/terminal/RestoreGuard.h"
#include "screens/terminal/TerminalKind.h"

#include <array>
#include <clocale>
#include <csignal>
#include <ncurses.h>
#include <poll.h>
#include <stdexcept>
#include <sys/ioctl.h>
#include <termios.h>
#include <unistd.h>
#include <vector>

namespace orvane
{

namespace
{

// Keeps the handlers of signals that ncurses would handle in an unsafe way.
class SignalsKept
{
public:
    SignalsKept()
    {
        for (std::size_t i = 0; i < kSignals.size(); ++i)
            ::sigaction(kSignals[i], nullptr, &_actions[i]);
    }
    ~SignalsKept()
    {
        for (std::size_t i = 0; i < kSignals.size(); ++i)
            ::sigaction(kSignals[i], &_actions[i], nullptr);
    }
    SignalsKept(const SignalsKept&) = delete;
    SignalsKept& operator=(const SignalsKept&) = delete;

private:
    static constexpr std::array kSignals{SIGINT, SIGTERM, SIGTSTP, SIGWINCH};
    std::array<struct sigaction, kSignals.size()> _actions{};
};

SCREEN* startCurses()
{
    if (const auto problem = terminalProblem())
        throw std::runtime_error(*problem);
    // Only where the user's locale has UTF-8 is anything beyond ASCII sent.
    std::setlocale(LC_CTYPE, "C.UTF-8");
    const SignalsKept kept;
    SCREEN* screen = newterm(nullptr, stdout, stdin);
    if (!screen)
        throw std::runtime_error("the terminal cannot be taken: use --ui text");
    return screen;
}

// The terminal itself handles only the keys that end programs. Ctrl-S must not stop the output for
// good. Ctrl-Z arrives as a key: ncurses drops the signal while it writes, which on a slow line is
// most of the time.
void takeModes()
{
    cbreak();
    noecho();
    nonl();
    intrflush(stdscr, FALSE);
    typeahead(-1);
    termios modes{};
    if (::tcgetattr(STDIN_FILENO, &modes) == 0) {
        modes.c_iflag &= ~static_cast<tcflag_t>(IXON);
        modes.c_lflag &= ~static_cast<tcflag_t>(IEXTEN);
        modes.c_cc[VSUSP] = _POSIX_VDISABLE;
        ::tcsetattr(STDIN_FILENO, TCSANOW, &modes);
    }
    def_prog_mode();
}

// Whether another job of the shell has the terminal.
bool isInBackground()
{
    const pid_t group = ::tcgetpgrp(STDIN_FILENO);
    return group > 0 && group != ::getpgrp();
}

} // namespace

struct CursesDevice::State {
    RestoreGuard guard{STDOUT_FILENO};
    SCREEN* screen = startCurses();
    TerminalKind kind;
    CursesKeys keys;
    CursesStyle style;
    CellGrid shown; // empty while unknown
    CursorPlace cursor;
    std::vector<cchar_t> line;
    bool isTaken = false;

    void take()
    {
        takeModes();
        kind.send(kind.pasteOn);
        guard.arm(kind.restoring(keys.hasMouse()));
        isTaken = true;
    }
    void giveBack()
    {
        if (isTaken && !isInBackground()) {
            kind.send(kind.pasteOff);
            endwin();
        }
        isTaken = false;
        guard.disarm();
    }
    void putLine(const CellGrid& grid, int number);
};

CursesDevice::CursesDevice() : _state(std::make_unique<State>())
{
    _state->take();
    updateSize();
}

CursesDevice::~CursesDevice()
{
    _state->giveBack();
    delscreen(_state->screen);
}

void CursesDevice::giveBack() { _state->giveBack(); }

int CursesDevice::lines() const { return LINES; }

int CursesDevice::columns() const { return COLS; }

bool CursesDevice::hasMarks() const { return _state->kind.hasUtf8 && !_state->kind.isPlainConsole; }

void CursesDevice::State::putLine(const CellGrid& grid, int number)
{
    line.clear();
    for (int column = 0; column < grid.columns(); ++column) {
        const CellGrid::Cell& cell = grid.at(number, column);
        std::u32string text = decoded(cell.text);
        if (!kind.hasUtf8 && (text.empty() || text.front() > 0x7E))
            text = text.empty() ? U" " : U"?";
        if (text.empty())
            continue; // the second column of a wide character
        if (!kind.hasUtf8)
            text.resize(1);
        std::array<wchar_t, CCHARW_MAX + 1> characters{};
        for (std::size_t i = 0; i < text.size() && i < CCHARW_MAX; ++i)
            characters[i] = static_cast<wchar_t>(text[i]);
        cchar_t character{};
        setcchar(&character, characters.data(), style.attributes(cell.style),
                 style.pair(cell.style), nullptr);
        line.push_back(character);
    }
    mvadd_wchnstr(number, 0, line.data(), static_cast<int>(line.size()));
}

void CursesDevice::show(const CellGrid& grid, CursorPlace cursor)
{
    if (!_state->isTaken)
        return;
    const bool isNew =
        _state->shown.lines() != grid.lines() || _state->shown.columns() != grid.columns();
    for (int line = 0; line < grid.lines(); ++line) {
        bool isSame = !isNew;
        for (int column = 0; isSame && column < grid.columns(); ++column)
            isSame = grid.at(line, column) == _state->shown.at(line, column);
        if (!isSame)
            _state->putLine(grid, line);
    }
    _state->shown = grid;
    if (isNew || _state->cursor.isVisible != cursor.isVisible)
        curs_set(cursor.isVisible ? 1 : 0);
    _state->cursor = cursor;
    move(cursor.line, cursor.column);
    refresh();
    _state->guard.heldErrors().collect();
}

std::optional<Key> CursesDevice::readKey()
{
    return _state->isTaken ? _state->keys.read() : std::nullopt;
}

bool CursesDevice::isGone() const
{
    pollfd input{STDIN_FILENO, POLLIN, 0};
    int waiting = 0;
    return ::poll(&input, 1, 0) > 0 &&
           ((input.revents & (POLLHUP | POLLERR)) ||
            (_state->isTaken && (input.revents & POLLIN) &&
             ::ioctl(STDIN_FILENO, FIONREAD, &waiting) == 0 && waiting == 0));
}

void CursesDevice::updateSize()
{
    winsize size{};
    if (::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0 ||
        (size.ws_row == LINES && size.ws_col == COLS))
        return;
    resizeterm(size.ws_row, size.ws_col);
    _state->shown = {};
}

void CursesDevice::suspend()
{
    _state->giveBack();
    struct sigaction plain {
    };
    plain.sa_handler = SIG_DFL;
    struct sigaction earlierStop {
    };
    struct sigaction earlierContinue {
    };
    // Stops all processes of the job, as Ctrl-Z does. Unlike SIGSTOP, the system ignores this
    // signal where nobody could let the job go on. The SIGCONT that follows is not handled: the
    // terminal is retaken here.
    ::sigaction(SIGTSTP, &plain, &earlierStop);
    ::sigaction(SIGCONT, &plain, &earlierContinue);
    ::kill(0, SIGTSTP);
    ::sigaction(SIGTSTP, &earlierStop, nullptr);
    ::sigaction(SIGCONT, &earlierContinue, nullptr);
    retake();
}

void CursesDevice::retake()
{
    if (isInBackground()) {
        // Changing the modes would stop the process before it has handled other signals.
        _state->isTaken = false;
        _state->guard.disarm();
        return;
    }
    if (!_state->isTaken) {
        _state->guard.rememberModes();
        def_shell_mode();
    }
    reset_prog_mode();
    _state->take();
    updateSize();
    clearok(curscr, TRUE);
    _state->shown = {};
}

bool CursesDevice::hasTerminal() const { return _state->isTaken; }

} // namespace orvane
