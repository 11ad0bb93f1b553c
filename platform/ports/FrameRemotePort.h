#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/FrameRequester.h"
#include "platform/ports/InvalidationNotice.h"
#include "platform/ports/MessagePort.h"

namespace orvane
{

// A remote port on a frame connection.
class FrameRemotePort final : public RemoteMessagePort
{
public:
    FrameRemotePort(std::unique_ptr<FrameConnection> connection, MainQueue& mainQueue);

    [[nodiscard]] bool isValid() const override { return _requester.isOpen(); }
    void invalidate() override;
    void setInvalidationCallback(std::function<void(MessagePort&)> callback) override;
    SendStatus send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
                    std::chrono::milliseconds receiveTimeout, Bytes* reply) override;

private:
    InvalidationNotice _notice;
    FrameRequester _requester;
};

} // namespace orvane
