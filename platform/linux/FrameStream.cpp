#include "platform/linux/FrameStream.h"

#include "platform/base/Bytes.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <cerrno>
#include <limits>
#include <poll.h>
#include <sys/socket.h>

namespace orvane
{

namespace
{

using SteadyClock = std::chrono::steady_clock;

// Read at most by one wake-up. With larger blocks timers would wait longer for the frames in them.
constexpr std::size_t kReadBlockBytes = 128U * 1024;
// Bytes held at most while there is no frame callback.
constexpr std::size_t kHeldBytesLimit = 256U * 1024;
// From here on the frames of one turn are written before its end.
constexpr std::size_t kWriteTogetherBytes = 64U * 1024;

// One block serves all connections of a thread: its bytes are copied out after each read.
Bytes& readBlock()
{
    thread_local Bytes block(kReadBlockBytes);
    return block;
}

} // namespace

void FrameStream::start()
{
    _readWatcher = std::make_unique<DescriptorWatcher>(
        _socket.get(), DescriptorWatcher::For::Reading, [weak = weak_from_this()] {
            if (const auto stream = weak.lock())
                stream->readable();
        });
}

// The plain pointer is safe until the step begins: the queue ends with the stream.
void FrameStream::later(void (FrameStream::*step)())
{
    _queue.async([this, step] {
        const auto keep = shared_from_this();
        (this->*step)();
    });
}

void FrameStream::setFrameCallback(FrameCallback callback)
{
    _frameCallback =
        callback ? std::make_shared<const FrameCallback>(std::move(callback)) : nullptr;
    if (!_frameCallback || !_socket)
        return;
    _heldBytes = 0;
    _readWatcher->setEnabled(true);
    later(&FrameStream::readable); // for frames that have waited for a callback
}

void FrameStream::setClosedCallback(std::function<void()> callback)
{
    _closedCallback = std::move(callback);
    if (_closedIsDue && _closedCallback)
        later(&FrameStream::tellClosed);
}

void FrameStream::setDrainedCallback(std::function<void()> callback)
{
    _drainedCallback = std::move(callback);
}

bool FrameStream::send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
                       ByteView data)
{
    if (!isOpen())
        return false;
    _out.add(messageId, serial, wantsReply, isReply, data);
    if (_out.size() >= kWriteTogetherBytes && !_writeBlocked)
        flush();
    if (!_turnEndQueued && isOpen()) {
        _turnEndQueued = true;
        later(&FrameStream::endOfTurn);
    }
    return isOpen();
}

void FrameStream::endOfTurn()
{
    _turnEndQueued = false;
    writable();
}

void FrameStream::flush()
{
    if (!_socket || _writeFailed)
        return;
    const auto result = _out.writeTo(_socket.get());
    const bool isBlocked = result == SendQueue::Result::Blocked;
    if (isBlocked && !_writeWatcher)
        _writeWatcher = std::make_unique<DescriptorWatcher>(
            _socket.get(), DescriptorWatcher::For::Writing, [weak = weak_from_this()] {
                if (const auto stream = weak.lock())
                    stream->writable();
            });
    else if (isBlocked != _writeBlocked && _writeWatcher)
        _writeWatcher->setEnabled(isBlocked);
    _writeBlocked = isBlocked;
    if (result == SendQueue::Result::Failed) {
        _writeFailed = true;
        _out.clear();
        later(&FrameStream::readable);
    }
}

void FrameStream::writable()
{
    const std::size_t before = _out.size();
    flush();
    if (_out.size() < before)
        tellDrained();
}

void FrameStream::tellDrained()
{
    if (const auto callback = _drainedCallback; callback && !_abandoned)
        callback();
}

FrameStream::Received FrameStream::receive()
{
    if (!_socket || _ended)
        return Received::Nothing;
    Bytes& block = readBlock();
    const auto count = ::recv(_socket.get(), block.data(), block.size(), 0);
    if (count < 0 && (errno == EAGAIN || errno == EINTR))
        return Received::Nothing;
    if (count <= 0) {
        _ended = true;
        return Received::Nothing;
    }
    const auto bytes = static_cast<std::size_t>(count);
    _in.append(ByteView(block).first(bytes));
    if (!_frameCallback)
        _heldBytes += bytes;
    if (_heldBytes >= kHeldBytesLimit && _readWatcher)
        _readWatcher->setEnabled(false);
    return Received::Something;
}

bool FrameStream::deliver(const std::function<bool()>* done)
{
    bool isDone = false;
    ++_deliveries;
    while (_socket && _frameCallback && !isDone) {
        const auto frame = _in.next();
        if (!frame)
            break;
        const auto callback = _frameCallback; // it may set another
        (*callback)(*frame);
        isDone = done && !_abandoned && (*done)();
    }
    if (--_deliveries == 0)
        _keptReaders.clear();
    return isDone;
}

void FrameStream::readable()
{
    const auto received = receive();
    deliver(nullptr);
    settle(received);
}

// Called once all frames read so far are delivered: ends the stream where nothing more can come.
void FrameStream::settle(Received last)
{
    if (!_socket)
        return;
    if (_in.hasFailed()) {
        logError("%s\n", _in.failureText().c_str());
        finish();
        return;
    }
    if (_writeFailed && last == Received::Nothing)
        _ended = true; // the reading has caught up with what the peer sent before it closed
    if (_ended && _heldBytes == 0)
        finish();
    else if (_ended)
        _readWatcher->setEnabled(false); // frames still wait for a callback
    else if (_writeFailed)
        later(&FrameStream::readable);
}

void FrameStream::finish()
{
    _readWatcher.reset();
    _writeWatcher.reset();
    _socket.reset();
    _out.clear();
    _closedIsDue = true;
    if (_waits > 0)
        later(&FrameStream::tellClosed);
    else
        tellClosed();
}

void FrameStream::tellClosed()
{
    if (!_closedIsDue || !_closedCallback)
        return;
    _closedIsDue = false;
    const auto callback = _closedCallback; // it may set another
    callback();
}

void FrameStream::close()
{
    flush();
    _readWatcher.reset();
    _writeWatcher.reset();
    _socket.reset();
    _out.clear();
    _closedIsDue = false;
}

void FrameStream::abandon()
{
    close();
    _abandoned = true;
    _frameCallback = nullptr;
    _closedCallback = nullptr;
    _drainedCallback = nullptr;
}

// Returns the events on the socket, waiting until the deadline; 0 if there were none.
short FrameStream::waitForEvents(SteadyClock::time_point deadline) const
{
    using std::chrono::milliseconds;
    const auto remaining = std::chrono::ceil<milliseconds>(deadline - SteadyClock::now());
    pollfd watched{_socket.get(), static_cast<short>(_writeBlocked ? POLLIN | POLLOUT : POLLIN), 0};
    const int result = ::poll(&watched, 1,
                              static_cast<int>(std::clamp<milliseconds::rep>(
                                  remaining.count(), 0, std::numeric_limits<int>::max())));
    return result > 0 ? watched.revents : static_cast<short>(0);
}

void FrameStream::keepDeliveredFrame()
{
    if (_deliveries == 0)
        return;
    FrameReader copy = _in;
    std::swap(copy, _in); // the frame keeps its place, and the copy takes what is read next
    _keptReaders.push_back(std::move(copy));
}

bool FrameStream::waitUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout)
{
    constexpr std::chrono::milliseconds kLongest = std::chrono::hours(24 * 365);
    const auto deadline = SteadyClock::now() + std::min(timeout, kLongest);
    keepDeliveredFrame();
    ++_waits;
    const std::size_t queuedBefore = _out.size();
    flush();
    bool mayHaveLeft = false; // frames that are read and not delivered
    bool isDone = done() || (mayHaveLeft = deliver(&done));
    bool isLate = false;
    while (!isDone && !isLate && _socket && !_ended && !_abandoned &&
           _heldBytes < kHeldBytesLimit) {
        if (!_writeBlocked)
            flush(); // what callbacks have sent meanwhile

        // One more look after the deadline: what has arrived by then counts.
        isLate = SteadyClock::now() >= deadline;
        const short events = waitForEvents(deadline);
        if ((events & POLLOUT) != 0)
            flush();
        Received received = Received::Nothing;
        if ((events & ~POLLOUT) != 0 || _writeFailed)
            received = receive();
        isDone = mayHaveLeft = deliver(&done);
        if (!isDone) {
            settle(received);
            isDone = !_abandoned && done();
        }
    }
    --_waits;
    if (_abandoned)
        return false; // with the connection, what `done` looks at may be gone
    if (_drainedCallback && _out.size() < queuedBefore)
        later(&FrameStream::tellDrained);
    if (_socket && mayHaveLeft)
        later(&FrameStream::readable);
    return isDone || done();
}

} // namespace orvane
