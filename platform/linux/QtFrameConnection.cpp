#include "platform/linux/QtFrameConnection.h"

#include "platform/base/Bytes.h"
#include "platform/linux/FrameStream.h"

namespace orvane
{

QtFrameConnection::QtFrameConnection(FileDescriptor socket)
    : _stream(std::make_shared<FrameStream>(std::move(socket)))
{
    _stream->start();
}

QtFrameConnection::~QtFrameConnection() { _stream->abandon(); }

void QtFrameConnection::setFrameCallback(std::function<void(const FrameReader::View&)> callback)
{
    _stream->setFrameCallback(std::move(callback));
}

void QtFrameConnection::setClosedCallback(std::function<void()> callback)
{
    _stream->setClosedCallback(std::move(callback));
}

void QtFrameConnection::setDrainedCallback(std::function<void()> callback)
{
    _stream->setDrainedCallback(std::move(callback));
}

bool QtFrameConnection::isOpen() const { return _stream->isOpen(); }

bool QtFrameConnection::send(std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                             bool isReply, ByteView data)
{
    return _stream->send(messageId, serial, wantsReply, isReply, data);
}

bool QtFrameConnection::withdrawLast() { return _stream->withdrawLast(); }

std::size_t QtFrameConnection::queuedBytes() const { return _stream->queuedBytes(); }

bool QtFrameConnection::waitUntil(const std::function<bool()>& done,
                                  std::chrono::milliseconds timeout)
{
    const auto stream = _stream; // a callback may destroy the connection
    return stream->waitUntil(done, timeout);
}

void QtFrameConnection::close() { _stream->close(); }

} // namespace orvane
