#include "platform/ports/TelephonyServer.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/FrameRequester.h"
#include "platform/services/SystemLog.h"

#include <limits>

namespace orvane
{

namespace
{

constexpr auto kSendTimeout = std::chrono::milliseconds(1000);
constexpr auto kReceiveTimeout = std::chrono::milliseconds(1000);

constexpr LogChannelResult kUnusableAnswer{static_cast<std::int32_t>(SendStatus::TransportError),
                                           std::nullopt};

LogChannelResult parseAnswer(ByteView data)
{
    const PropertyValue answer = readPropertyList(data).value;
    const auto error = answer[kLogChannelErrorKey].asInteger();
    if (!error || *error < std::numeric_limits<std::int32_t>::min() ||
        *error > std::numeric_limits<std::int32_t>::max())
        return kUnusableAnswer;
    const PropertyValue& port = answer[kLogChannelPortKey];
    if (*error == 0 && port && !port.asString())
        return kUnusableAnswer;
    LogChannelResult result{static_cast<std::int32_t>(*error), std::nullopt};
    if (*error == 0 && port)
        result.port = *port.asString();
    return result;
}

} // namespace

// The connection with its notification callback, shared by the client's object and by the local
// port that it was opened for.
class TelephonyServerConnection::Link : public std::enable_shared_from_this<Link>
{
public:
    Link(std::unique_ptr<FrameConnection> connection, MainQueue& queue,
         NotificationCallback callback)
        : _requester(std::move(connection)), _queue(queue), _callback(std::move(callback))
    {
        _requester.setMessageCallback([this](const FrameReader::View& frame) { take(frame); });
    }

    LogChannelResult requestChannel(const std::string& localPortName)
    {
        const auto request = xmlPropertyListBytes(PropertyValue::dictionaryOf({
            {kCreateLogChannelKey, localPortName}
        }));
        if (!request)
            return kUnusableAnswer; // the name is not even text
        Bytes answer;
        const SendStatus status = _requester.send(kCreateLogChannelMessage, *request, kSendTimeout,
                                                  kReceiveTimeout, &answer);
        if (status != SendStatus::Success)
            return {static_cast<std::int32_t>(status), std::nullopt};
        return parseAnswer(answer);
    }

private:
    // How many notifications may wait for the main queue: bounds the memory that a server can take
    // while the program is busy.
    static constexpr std::size_t kWaitingLimit = 1000;

    void take(const FrameReader::View& frame)
    {
        if (frame.messageId != kNotificationMessage)
            return;
        const PropertyValue notification = readPropertyList(frame.data).value;
        const std::string* name = notification[kNotificationNameKey].asString();
        if (!name) {
            logError("Ignoring an ill-formed notification of the telephony server");
            return;
        }
        if (_waiting == kWaitingLimit) {
            logError("Ignoring a notification of the telephony server: %zu wait already",
                     kWaitingLimit);
            return;
        }
        ++_waiting;
        // Queued, since it may come while the request for a channel waits for its answer.
        _queue.async(
            [weak = weak_from_this(), text = *name, info = notification[kNotificationInfoKey]] {
                const auto link = weak.lock();
                if (!link)
                    return;
                --link->_waiting;
                if (link->_callback)
                    link->_callback(text, info);
            });
    }

    FrameRequester _requester;
    MainQueue& _queue;
    const NotificationCallback _callback;
    std::size_t _waiting = 0;
};

TelephonyServerConnection::TelephonyServerConnection(std::unique_ptr<FrameConnection> connection,
                                                     MessagePorts& ports, MainQueue& mainQueue,
                                                     NotificationCallback callback)
    : _link(std::make_shared<Link>(std::move(connection), mainQueue, std::move(callback))),
      _ports(ports)
{
}

LogChannelResult
TelephonyServerConnection::createNetworkMonitorLogChannel(const std::string& localPortName)
{
    LogChannelResult result = _link->requestChannel(localPortName);
    if (result.error == 0)
        _ports.keepWhileValid(localPortName, _link);
    return result;
}

std::unique_ptr<TelephonyServerConnection>
TelephonyServer::createConnection(TelephonyServerConnection::NotificationCallback callback)
{
    std::string error;
    auto connection = _transport.connect(kTelephonyServerPort, error);
    if (!connection)
        return nullptr;
    return std::make_unique<TelephonyServerConnection>(std::move(connection), _ports, _mainQueue,
                                                       std::move(callback));
}

} // namespace orvane
