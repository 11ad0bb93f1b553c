#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/FrameConnection.h"
#include "platform/ports/MessagePort.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace orvane
{

// A named port, to which any number of others send. Messages are delivered in order of arrival.
//
// Messages that come before there is a dispatch queue are held, at most 32 MiB of them; the
// connection that brings more is closed with an error line. A message is still delivered when its
// sender has closed in the meantime. Frames marked as replies are dropped: nothing was asked here.
class LocalMessagePort final : public MessagePort
{
public:
    // Takes one message and returns the reply's data, if any. `data` holds only during the call,
    // which may destroy the port.
    using ReceiveCallback = std::function<std::optional<Bytes>(
        LocalMessagePort& port, std::int32_t messageId, ByteView data)>;
    // What is to live as long as the port is valid.
    using Kept = std::vector<std::shared_ptr<void>>;

    // Made by MessagePorts.
    LocalMessagePort(std::unique_ptr<FrameListener> listener, ReceiveCallback callback,
                     MainQueue& mainQueue);
    ~LocalMessagePort() override;

    [[nodiscard]] bool isValid() const override { return _listener != nullptr; }
    void invalidate() override;
    // From here on messages are delivered on this queue; none before.
    void setDispatchQueue(MainQueue& queue);
    // Expired once the port is invalid.
    [[nodiscard]] std::weak_ptr<Kept> kept() const { return _kept; }

private:
    class Inbox;

    void end();

    std::shared_ptr<Kept> _kept = std::make_shared<Kept>();
    std::unique_ptr<FrameListener> _listener; // null once invalid
    std::shared_ptr<Inbox> _inbox;
};

} // namespace orvane
