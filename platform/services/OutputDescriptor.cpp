#include "platform/services/OutputDescriptor.h"

#include <algorithm>
#include <cerrno>
#include <climits>
#include <cstring>
#include <poll.h>
#include <unistd.h>

namespace orvane
{

OutputDescriptor::State OutputDescriptor::write(std::string_view data)
{
    while (_state == State::Open && !data.empty()) {
        // Waits in poll(2), which every signal ends, and not in write(2).
        pollfd waiting{_descriptor, POLLOUT, 0};
        if (::poll(&waiting, 1, -1) < 0) {
            _error = errno;
            _state = errno == EINTR ? State::Interrupted : State::Failed;
            break;
        }
        // A pipe that is ready takes this much without waiting.
        const std::size_t count = std::min<std::size_t>(data.size(), PIPE_BUF);
        const ssize_t written = ::write(_descriptor, data.data(), count);
        if (written >= 0) {
            data.remove_prefix(static_cast<std::size_t>(written));
        } else if (errno != EINTR && errno != EAGAIN) {
            _error = errno;
            _state = errno == EPIPE ? State::Closed : State::Failed;
        }
    }
    return _state;
}

const char* OutputDescriptor::failure() const { return _error == 0 ? "" : std::strerror(_error); }

} // namespace orvane
