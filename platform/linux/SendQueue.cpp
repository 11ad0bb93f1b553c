#include "platform/linux/SendQueue.h"

#include "platform/base/Bytes.h"

#include <cerrno>
#include <sys/socket.h>

namespace orvane
{

namespace
{

// A buffer that has grown larger than this is given back once it is empty.
constexpr std::size_t kKeptCapacity = 256U * 1024;

} // namespace

void SendQueue::add(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
                    ByteView data)
{
    // Only once half is written: the bytes moved stay in proportion to those written.
    if (_start > _bytes.size() / 2) {
        _bytes.erase(_bytes.begin(), _bytes.begin() + static_cast<std::ptrdiff_t>(_start));
        _start = 0;
    }
    const std::size_t before = _bytes.size();
    appendFrame(_bytes, messageId, serial, wantsReply, isReply, data);
    _lastFrameBytes = _bytes.size() - before;
}

bool SendQueue::withdrawLast()
{
    if (_lastFrameBytes == 0 || size() < _lastFrameBytes)
        return false;
    _bytes.resize(_bytes.size() - _lastFrameBytes);
    _lastFrameBytes = 0;
    return true;
}

SendQueue::Result SendQueue::writeTo(int socket)
{
    while (size() > 0) {
        const auto written = ::send(socket, _bytes.data() + _start, size(), MSG_NOSIGNAL);
        if (written >= 0)
            _start += static_cast<std::size_t>(written);
        else if (errno == EAGAIN)
            return Result::Blocked;
        else if (errno != EINTR)
            return Result::Failed;
    }
    clear();
    return Result::Done;
}

void SendQueue::clear()
{
    if (_bytes.capacity() > kKeptCapacity)
        _bytes = Bytes();
    else
        _bytes.clear();
    _start = 0;
    _lastFrameBytes = 0;
}

} // namespace orvane
