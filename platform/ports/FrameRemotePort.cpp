#include "platform/ports/FrameRemotePort.h"

#include "platform/base/Bytes.h"

namespace orvane
{

FrameRemotePort::FrameRemotePort(std::unique_ptr<FrameConnection> connection, MainQueue& mainQueue)
    : _notice(mainQueue, *this), _requester(std::move(connection))
{
    _requester.setClosedCallback([this] { _notice.portIsInvalid(); });
}

void FrameRemotePort::invalidate()
{
    _requester.close();
    _notice.portIsInvalid();
}

void FrameRemotePort::setInvalidationCallback(std::function<void(MessagePort&)> callback)
{
    _notice.setCallback(std::move(callback));
}

SendStatus FrameRemotePort::send(std::int32_t messageId, ByteView data,
                                 std::chrono::milliseconds sendTimeout,
                                 std::chrono::milliseconds receiveTimeout, Bytes* reply)
{
    const SendStatus status = _requester.send(messageId, data, sendTimeout, receiveTimeout, reply);
    if (!isValid())
        _notice.portIsInvalid();
    return status;
}

} // namespace orvane
