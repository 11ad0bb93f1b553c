#include "screens/terminal/VirtualTerminal.h"

#include "screens/terminal/LineWidth.h"

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdlib>
#include <poll.h>
#include <pty.h>
#include <stdexcept>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <termios.h>
#include <unistd.h>
#include <utility>
#include <vterm.h>

namespace orvane
{

struct VirtualTerminal::State {
    State(int lineCount, int columnCount)
        : lines(lineCount), columns(columnCount), terminal(vterm_new(lines, columns)),
          screen(vterm_obtain_screen(terminal))
    {
        vterm_set_utf8(terminal, 1);
        vterm_screen_set_callbacks(screen, &kCallbacks, this);
        vterm_screen_enable_altscreen(screen, 1);
        vterm_screen_reset(screen, 1);
    }
    ~State()
    {
        vterm_free(terminal);
        if (descriptor >= 0)
            ::close(descriptor);
    }
    State(const State&) = delete;
    State& operator=(const State&) = delete;

    static int setProperty(VTermProp property, VTermValue* value, void* user)
    {
        auto& state = *static_cast<State*>(user);
        if (property == VTERM_PROP_ALTSCREEN)
            state.isOnOtherScreen = value->boolean != 0;
        else if (property == VTERM_PROP_CURSORVISIBLE)
            state.isCursorVisible = value->boolean != 0;
        return 1;
    }

    [[nodiscard]] VTermScreenCell cell(int line, int column) const
    {
        VTermScreenCell cell{};
        vterm_screen_get_cell(screen, {line, column}, &cell);
        return cell;
    }
    // The cell of the text's first character; nullopt if the text is not on the screen.
    [[nodiscard]] std::optional<VTermScreenCell> cellOf(const VirtualTerminal& terminalOf,
                                                        const std::string& text) const
    {
        for (int line = 0; line < lines; ++line) {
            const std::string shown = terminalOf.line(line);
            if (const auto place = shown.find(text); place != std::string::npos)
                return cell(line, columnsOf(shown.substr(0, place)));
        }
        return std::nullopt;
    }

    static const VTermScreenCallbacks kCallbacks;

    int lines;
    int columns;
    VTerm* terminal;
    VTermScreen* screen;
    int descriptor = -1;
    pid_t process = -1;
    std::optional<int> status;
    std::string received;
    bool isClosed = false; // by the program
    bool isOnOtherScreen = false;
    bool isCursorVisible = true;
};

const VTermScreenCallbacks VirtualTerminal::State::kCallbacks = [] {
    VTermScreenCallbacks callbacks{};
    callbacks.settermprop = setProperty;
    return callbacks;
}();

namespace
{

[[noreturn]] void becomeProgram(std::vector<char*>& arguments,
                                const std::vector<std::string>& environment)
{
    for (const std::string& entry : environment) {
        const std::size_t equals = entry.find('=');
        if (equals == std::string::npos)
            ::unsetenv(entry.c_str());
        else
            ::setenv(entry.substr(0, equals).c_str(), entry.substr(equals + 1).c_str(), 1);
    }
    ::execvp(arguments[0], arguments.data());
    ::_exit(127);
}

winsize sizeOf(int lines, int columns)
{
    winsize size{};
    size.ws_row = static_cast<unsigned short>(lines);
    size.ws_col = static_cast<unsigned short>(columns);
    return size;
}

} // namespace

VirtualTerminal::VirtualTerminal(const std::vector<std::string>& arguments,
                                 const std::vector<std::string>& environment, int lines,
                                 int columns)
    : _state(std::make_unique<State>(lines, columns))
{
    std::vector<char*> pointers;
    for (const std::string& argument : arguments)
        pointers.push_back(const_cast<char*>(argument.c_str()));
    pointers.push_back(nullptr);
    winsize size = sizeOf(lines, columns);
    _state->process = ::forkpty(&_state->descriptor, nullptr, nullptr, &size);
    if (_state->process < 0)
        throw std::runtime_error("no pseudo-terminal");
    if (_state->process == 0)
        becomeProgram(pointers, environment);
}

VirtualTerminal::~VirtualTerminal()
{
    if (_state->status)
        return;
    ::kill(_state->process, SIGKILL);
    ::waitpid(_state->process, nullptr, 0);
}

void VirtualTerminal::send(const std::string& keys) const
{
    [[maybe_unused]] const auto written = ::write(_state->descriptor, keys.data(), keys.size());
}

void VirtualTerminal::resize(int lines, int columns)
{
    _state->lines = lines;
    _state->columns = columns;
    vterm_set_size(_state->terminal, lines, columns);
    const winsize size = sizeOf(lines, columns);
    ::ioctl(_state->descriptor, TIOCSWINSZ, &size);
}

void VirtualTerminal::sendSignal(int signal) const { ::kill(_state->process, signal); }

bool VirtualTerminal::readSome(std::chrono::milliseconds timeout)
{
    pollfd waiting{_state->descriptor, POLLIN, 0};
    if (::poll(&waiting, 1, static_cast<int>(timeout.count())) <= 0)
        return true;
    std::array<char, 4096> block{};
    const ssize_t count = ::read(_state->descriptor, block.data(), block.size());
    if (count <= 0) {
        _state->isClosed = true;
        return false;
    }
    _state->received.append(block.data(), static_cast<std::size_t>(count));
    vterm_input_write(_state->terminal, block.data(), static_cast<std::size_t>(count));
    vterm_screen_flush_damage(_state->screen);
    return true;
}

bool VirtualTerminal::waitUntil(const std::function<bool()>& isTrue,
                                std::chrono::milliseconds timeout)
{
    const auto end = std::chrono::steady_clock::now() + timeout;
    while (!isTrue()) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(
            end - std::chrono::steady_clock::now());
        if (left.count() <= 0 || !readSome(left))
            return isTrue();
    }
    return true;
}

std::optional<int> VirtualTerminal::waitForEnd(std::chrono::milliseconds timeout)
{
    // Until the program closes its end. Its output is kept.
    waitUntil([this] { return _state->isClosed; }, timeout);
    int status = 0;
    if (!_state->status &&
        ::waitpid(_state->process, &status, _state->isClosed ? 0 : WNOHANG) == _state->process)
        _state->status = WIFSIGNALED(status) ? -WTERMSIG(status) : WEXITSTATUS(status);
    return _state->status;
}

std::string VirtualTerminal::line(int number) const
{
    std::string text;
    for (int column = 0; column < _state->columns; ++column) {
        const VTermScreenCell cell = _state->cell(number, column);
        if (cell.chars[0] == static_cast<std::uint32_t>(-1))
            continue; // the second half of a wide character
        if (cell.chars[0] == 0)
            text += ' ';
        for (std::size_t i = 0; i < VTERM_MAX_CHARS_PER_CELL && cell.chars[i] != 0; ++i) {
            const auto character = static_cast<char32_t>(cell.chars[i]);
            text += encoded({&character, 1});
        }
    }
    return text.substr(0, text.find_last_not_of(' ') + 1);
}

std::string VirtualTerminal::screen() const
{
    std::string text;
    for (int number = 0; number < _state->lines; ++number)
        text += line(number) + "\n";
    return text;
}

bool VirtualTerminal::shows(const std::string& text) const
{
    return screen().find(text) != std::string::npos;
}

bool VirtualTerminal::isBold(const std::string& text) const
{
    const auto cell = _state->cellOf(*this, text);
    return cell && cell->attrs.bold;
}

bool VirtualTerminal::isReversed(const std::string& text) const
{
    const auto cell = _state->cellOf(*this, text);
    return cell && cell->attrs.reverse;
}

bool VirtualTerminal::isColoured(const std::string& text) const
{
    const auto cell = _state->cellOf(*this, text);
    return cell && (!VTERM_COLOR_IS_DEFAULT_FG(&cell->fg) || !VTERM_COLOR_IS_DEFAULT_BG(&cell->bg));
}

bool VirtualTerminal::isOnOtherScreen() const { return _state->isOnOtherScreen; }

bool VirtualTerminal::isCursorVisible() const { return _state->isCursorVisible; }

bool VirtualTerminal::tellsOfMouse() const
{
    const auto on = _state->received.rfind("1000h");
    const auto off = _state->received.rfind("1000l");
    return on != std::string::npos && (off == std::string::npos || on > off);
}

bool VirtualTerminal::isInLineMode() const
{
    termios modes{};
    return ::tcgetattr(_state->descriptor, &modes) == 0 && (modes.c_lflag & ECHO) &&
           (modes.c_lflag & ICANON) && (modes.c_iflag & IXON);
}

const std::string& VirtualTerminal::received() const { return _state->received; }

} // namespace orvane
