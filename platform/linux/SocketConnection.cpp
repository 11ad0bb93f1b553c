#include "platform/linux/SocketConnection.h"

#include "platform/base/Bytes.h"
#include "platform/linux/FrameStream.h"

namespace orvane
{

SocketConnection::SocketConnection(FileDescriptor socket)
    : _stream(std::make_shared<FrameStream>(std::move(socket)))
{
    _stream->start();
}

SocketConnection::~SocketConnection() { _stream->abandon(); }

void SocketConnection::setFrameCallback(std::function<void(const FrameReader::View&)> callback)
{
    _stream->setFrameCallback(std::move(callback));
}

void SocketConnection::setClosedCallback(std::function<void()> callback)
{
    _stream->setClosedCallback(std::move(callback));
}

void SocketConnection::setDrainedCallback(std::function<void()> callback)
{
    _stream->setDrainedCallback(std::move(callback));
}

bool SocketConnection::isOpen() const { return _stream->isOpen(); }

bool SocketConnection::send(std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                            bool isReply, ByteView data)
{
    return _stream->send(messageId, serial, wantsReply, isReply, data);
}

bool SocketConnection::withdrawLast() { return _stream->withdrawLast(); }

std::size_t SocketConnection::queuedBytes() const { return _stream->queuedBytes(); }

std::optional<std::uint64_t> SocketConnection::unfinishedFrame() const
{
    return _stream->unfinishedFrame();
}

bool SocketConnection::waitUntil(const std::function<bool()>& done,
                                 std::chrono::milliseconds timeout)
{
    const auto stream = _stream; // a callback may destroy the connection
    return stream->waitUntil(done, timeout);
}

void SocketConnection::close() { _stream->close(); }

} // namespace orvane
