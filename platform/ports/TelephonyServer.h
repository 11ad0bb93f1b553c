#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/ports/MessagePorts.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// The result of a request for a log channel.
struct LogChannelResult {
    std::int32_t error = 0;          // 0 = success
    std::optional<std::string> port; // name of the server's port for the channel
};

// A connection to the telephony server.
//
// One that has got a channel may be released at once: notifications go on until the local port of
// the channel is invalidated or destroyed. Where the port was not made by the same MessagePorts,
// they go on as long as this object lives.
class TelephonyServerConnection
{
public:
    // Name and info (absent where there is none) of a notification, on the main queue.
    using NotificationCallback =
        std::function<void(const std::string& name, const PropertyValue& info)>;

    // Made by TelephonyServer.
    TelephonyServerConnection(std::unique_ptr<FrameConnection> connection, MessagePorts& ports,
                              MainQueue& mainQueue, NotificationCallback callback);

    // Asks for a network-monitor log channel to the local port of that name. Takes at most 1.0 s to
    // send and 1.0 s to be answered.
    //
    // Errors beside the server's own: -1 not taken in time, -2 no answer in time, -3 and -5 the
    // connection is or becomes closed, -4 an answer that cannot be used, or a failed transport.
    LogChannelResult createNetworkMonitorLogChannel(const std::string& localPortName);

private:
    class Link;

    std::shared_ptr<Link> _link;
    MessagePorts& _ports;
};

// The telephony server of a frame transport.
class TelephonyServer
{
public:
    // None of them is owned; all must outlive the connections.
    TelephonyServer(FrameTransport& transport, MessagePorts& ports, MainQueue& mainQueue)
        : _transport(transport), _ports(ports), _mainQueue(mainQueue)
    {
    }

    // Returns null when there is no server.
    std::unique_ptr<TelephonyServerConnection>
    createConnection(TelephonyServerConnection::NotificationCallback callback);

private:
    FrameTransport& _transport;
    MessagePorts& _ports;
    MainQueue& _mainQueue;
};

} // namespace orvane
