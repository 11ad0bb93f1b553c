#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/FrameRequester.h"
#include "platform/ports/MessagePort.h"

namespace orvane
{

// A connection to somebody's local port. Valid until the peer closes or the transport fails.
class RemoteMessagePort final : public MessagePort
{
public:
    // Made by MessagePorts.
    RemoteMessagePort(std::unique_ptr<FrameConnection> connection, MainQueue& mainQueue);

    [[nodiscard]] bool isValid() const override { return _requester.isOpen(); }
    void invalidate() override;
    // As FrameRequester::send().
    SendStatus send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
                    std::chrono::milliseconds receiveTimeout, Bytes* reply);

private:
    FrameRequester _requester;
};

} // namespace orvane
