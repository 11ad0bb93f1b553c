#include "platform/ports/RemoteMessagePort.h"

namespace orvane
{

RemoteMessagePort::RemoteMessagePort(std::unique_ptr<FrameConnection> connection,
                                     MainQueue& mainQueue)
    : MessagePort(mainQueue), _requester(std::move(connection))
{
    _requester.setClosedCallback([this] { hasBecomeInvalid(); });
}

void RemoteMessagePort::invalidate()
{
    _requester.close();
    hasBecomeInvalid();
}

SendStatus RemoteMessagePort::send(std::int32_t messageId, ByteView data,
                                   std::chrono::milliseconds sendTimeout,
                                   std::chrono::milliseconds receiveTimeout, Bytes* reply)
{
    const SendStatus status = _requester.send(messageId, data, sendTimeout, receiveTimeout, reply);
    if (!isValid())
        hasBecomeInvalid();
    return status;
}

} // namespace orvane
