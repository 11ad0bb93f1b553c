#pragma once

#include "platform/ports/FramePorts.h"
#include "platform/ports/TelephonyServer.h"

namespace orvane
{

// The telephony server's client over a frame transport.
//
// A connection that has got a channel lives on, when its object is released, until the local port
// of the channel is invalidated or destroyed; until then notifications reach the callback, queued
// on the main queue. Where no such port was made by `ports`, it lives as long as its object.
//
// Errors of a request for a channel, beside the server's own: -2 no answer in time, -4 an answer
// that cannot be used (or a failed transport), -1 not taken in time, -3 and -5 the connection is or
// becomes closed.
class FrameTelephonyServer final : public TelephonyServer
{
public:
    // None of them is owned; all must outlive the connections.
    FrameTelephonyServer(FrameTransport& transport, FramePorts& ports, MainQueue& mainQueue);

    std::unique_ptr<TelephonyServerConnection>
    createConnection(NotificationCallback callback) override;

private:
    FrameTransport& _transport;
    FramePorts& _ports;
    MainQueue& _mainQueue;
};

} // namespace orvane
