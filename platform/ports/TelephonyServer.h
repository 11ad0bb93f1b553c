#pragma once

#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// What a request for a log channel came to.
struct LogChannelResult {
    std::int32_t error = 0;          // 0 = success
    std::optional<std::string> port; // name of the server's port for the channel
};

// A connection to the telephony server. Releasing it right after the channel is made is fine: the
// platform keeps what notifications need until the ports of that channel are gone.
class TelephonyServerConnection
{
public:
    virtual ~TelephonyServerConnection() = default;
    // Asks for a network-monitor log channel to the local port of that name. Takes at most 1.0 s to
    // send and 1.0 s to be answered: error -2 when no answer comes in time, -4 when it is unusable.
    virtual LogChannelResult createNetworkMonitorLogChannel(const std::string& localPortName) = 0;
};

class TelephonyServer
{
public:
    // Name and info (absent where there is none) of a notification, on the main queue.
    using NotificationCallback =
        std::function<void(const std::string& name, const PropertyValue& info)>;

    virtual ~TelephonyServer() = default;
    // Null when there is no server.
    virtual std::unique_ptr<TelephonyServerConnection>
    createConnection(NotificationCallback callback) = 0;
};

} // namespace orvane
