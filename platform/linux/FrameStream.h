#pragma once

#include "platform/base/Bytes.h"
#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/FileDescriptor.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SendQueue.h"
#include "platform/ports/Frame.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace orvane
{

// The implementation of SocketConnection. A class of its own, since a callback may destroy the
// connection: whoever calls one holds the stream until the callback has returned.
class FrameStream : public std::enable_shared_from_this<FrameStream>
{
public:
    using FrameCallback = std::function<void(const FrameReader::View&)>;

    explicit FrameStream(FileDescriptor socket) : _socket(std::move(socket)) {}
    // Starts watching the socket. Not in the constructor, where there is no shared pointer yet.
    void start();

    void setFrameCallback(FrameCallback callback);
    void setClosedCallback(std::function<void()> callback);
    void setDrainedCallback(std::function<void()> callback);
    [[nodiscard]] bool isOpen() const { return _socket && !_writeFailed && !_ended; }
    bool send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
              ByteView data);
    bool withdrawLast() { return _out.withdrawLast(); }
    [[nodiscard]] std::size_t queuedBytes() const { return _out.size(); }
    [[nodiscard]] std::optional<std::uint64_t> unfinishedFrame() const
    {
        return isOpen() ? _in.unfinishedFrame() : std::nullopt;
    }
    bool waitUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout);
    void close();
    // close(), after which the connection must not be called any more.
    void abandon();

private:
    enum class Received { Something, Nothing };

    void readable();
    void writable();
    void endOfTurn();
    Received receive();
    // Hands frames to the callback until there are none or `done` says so; returns what it says.
    bool deliver(const std::function<bool()>* done);
    void settle(Received last);
    void flush();
    void finish();
    void tellClosed();
    void tellDrained();
    void later(void (FrameStream::*step)());
    short waitForEvents(std::chrono::steady_clock::time_point deadline) const;
    // Called before a wait inside a frame callback reads more: keeps that frame's bytes in place.
    void keepDeliveredFrame();

    FileDescriptor _socket; // none once closed
    std::unique_ptr<DescriptorWatcher> _readWatcher;
    std::unique_ptr<DescriptorWatcher> _writeWatcher;
    FrameReader _in;
    SendQueue _out;
    std::shared_ptr<const FrameCallback> _frameCallback;
    std::function<void()> _closedCallback;
    std::function<void()> _drainedCallback;

    bool _ended = false;       // the peer sends no more
    bool _writeFailed = false; // the peer takes no more; what it has sent is still to be read
    bool _writeBlocked = false;
    bool _turnEndQueued = false;
    bool _closedIsDue = false;
    bool _abandoned = false;
    int _waits = 0;             // calls of waitUntil() under way
    int _deliveries = 0;        // calls of the frame callback under way
    std::size_t _heldBytes = 0; // read while there was no frame callback
    // The bytes of frames that are being delivered while a wait inside their callback reads more.
    std::vector<FrameReader> _keptReaders;

    QtMainQueue _queue; // what is put off until the loop's next turn
};

} // namespace orvane
