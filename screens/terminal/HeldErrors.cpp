#include "screens/terminal/HeldErrors.h"

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

bool areSameTerminal(int one, int other)
{
    struct stat first {
    };
    struct stat second {
    };
    return ::isatty(one) && ::isatty(other) && ::fstat(one, &first) == 0 &&
           ::fstat(other, &second) == 0 && first.st_rdev == second.st_rdev;
}

void writeAll(std::string_view text)
{
    while (!text.empty()) {
        const ssize_t written = ::write(STDERR_FILENO, text.data(), text.size());
        if (written < 0 && errno != EINTR)
            return;
        text.remove_prefix(written < 0 ? 0 : static_cast<std::size_t>(written));
    }
}

} // namespace

void HeldErrors::hold(int terminal)
{
    std::array<int, 2> ends{};
    if (_terminal >= 0 || !areSameTerminal(terminal, STDERR_FILENO) ||
        ::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0)
        return;
    _readEnd = ends[0];
    _terminal = ::fcntl(STDERR_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
    if (_terminal >= 0)
        ::dup2(ends[1], STDERR_FILENO);
    else
        ::close(_readEnd);
    ::close(ends[1]);
}

void HeldErrors::collect()
{
    std::array<char, 4096> part{};
    ssize_t count = 0;
    while (_terminal >= 0 && (count = ::read(_readEnd, part.data(), part.size())) > 0)
        for (ssize_t i = 0; i < count; ++i) {
            _held[(_start + _size) % kMost] = part[static_cast<std::size_t>(i)];
            if (_size < kMost) {
                ++_size;
            } else {
                _start = (_start + 1) % kMost;
                _isIncomplete = true;
            }
        }
}

void HeldErrors::release()
{
    if (_terminal < 0)
        return;
    collect();
    ::dup2(_terminal, STDERR_FILENO);
    ::close(_terminal);
    ::close(_readEnd);
    _terminal = -1;
    writeHeld();
    _start = _size = 0;
    _isIncomplete = false;
}

void HeldErrors::writeHeld()
{
    if (_isIncomplete) {
        // Starts with the first whole line.
        while (_size > 0 && _held[_start] != '\n') {
            _start = (_start + 1) % kMost;
            --_size;
        }
        writeAll("(earlier lines were too many to keep)");
    }
    const std::size_t first = std::min(_size, kMost - _start);
    writeAll({_held.data() + _start, first});
    writeAll({_held.data(), _size - first});
}

} // namespace orvane
