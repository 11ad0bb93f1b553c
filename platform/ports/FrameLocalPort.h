#pragma once

#include "platform/ports/FrameConnection.h"
#include "platform/ports/InvalidationNotice.h"
#include "platform/ports/MessagePort.h"

#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// A local port on a frame listener: any number of connections, whose messages it delivers in order
// of arrival.
//
// Messages that come before there is a dispatch queue are held, at most 32 MiB of them; the
// connection that brings more is closed with an error line. A message is still delivered when its
// sender has closed in the meantime. Frames marked as replies are dropped: nothing was asked here.
class FrameLocalPort final : public LocalMessagePort
{
public:
    // What lives as long as the port is valid, for FramePorts::keepWhileValid().
    struct Lifetime {
        std::string portName;
        bool valid = true;
        std::vector<std::shared_ptr<void>> kept;
    };

    FrameLocalPort(const std::string& name, std::unique_ptr<FrameListener> listener,
                   ReceiveCallback callback, MainQueue& mainQueue);
    ~FrameLocalPort() override;
    FrameLocalPort(const FrameLocalPort&) = delete;
    FrameLocalPort& operator=(const FrameLocalPort&) = delete;

    [[nodiscard]] bool isValid() const override;
    void invalidate() override;
    void setInvalidationCallback(std::function<void(MessagePort&)> callback) override;
    void setDispatchQueue(MainQueue& queue) override;

    [[nodiscard]] const std::shared_ptr<Lifetime>& lifetime() const { return _lifetime; }

private:
    class Inbox;

    void end();

    InvalidationNotice _notice;
    std::shared_ptr<Lifetime> _lifetime;
    std::unique_ptr<FrameListener> _listener;
    std::shared_ptr<Inbox> _inbox;
};

} // namespace orvane
