#include "dlf/FileWindow.h"

#include "platform/base/Bytes.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

constexpr std::size_t kWindowBytes = 1 << 20;

} // namespace

std::shared_ptr<FileWindow> FileWindow::open(const std::string& path, std::string& error)
{
    // Opening a named pipe without O_NONBLOCK would wait for a writer.
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor < 0) {
        error = std::strerror(errno);
        return nullptr;
    }
    struct stat status {
    };
    if (::fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        error = S_ISDIR(status.st_mode) ? std::strerror(EISDIR) : "Not a regular file";
        ::close(descriptor);
        return nullptr;
    }
    return std::shared_ptr<FileWindow>(
        new FileWindow(descriptor, static_cast<std::uint64_t>(status.st_size)));
}

std::shared_ptr<FileWindow> FileWindow::another() const
{
    const int descriptor = ::fcntl(_descriptor, F_DUPFD_CLOEXEC, 0);
    if (descriptor < 0)
        return nullptr;
    return std::shared_ptr<FileWindow>(new FileWindow(descriptor, _size));
}

FileWindow::~FileWindow() { ::close(_descriptor); }

ByteView FileWindow::bytes(std::uint64_t position, std::size_t count)
{
    if (position >= _size)
        return {};
    count = static_cast<std::size_t>(std::min<std::uint64_t>(count, _size - position));
    if (position < _start || position - _start > _window.size() ||
        count > _window.size() - (position - _start))
        moveTo(position, count);
    const std::uint64_t skipped = position - _start;
    return skipped < _window.size() ? ByteView(_window).subspan(skipped) : ByteView();
}

// Makes the window begin at the position, with `count` bytes or more unless the file has become
// shorter.
void FileWindow::moveTo(std::uint64_t position, std::size_t count)
{
    const std::uint64_t most = std::max<std::uint64_t>(kWindowBytes, count);
    _start = position;
    _window.resize(static_cast<std::size_t>(std::min(most, _size - position)));
    std::size_t have = 0;
    while (have < _window.size()) {
        const ssize_t got = ::pread(_descriptor, _window.data() + have, _window.size() - have,
                                    static_cast<off_t>(position + have));
        if (got < 0 && errno == EINTR)
            continue;
        if (got <= 0) {
            _window.resize(have);
            _size = position + have;
        } else {
            have += static_cast<std::size_t>(got);
        }
    }
}

} // namespace orvane
