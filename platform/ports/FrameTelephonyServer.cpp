#include "platform/ports/FrameTelephonyServer.h"

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

// The connection with its notification callback, shared by the client's object and by the local
// port that it was opened for.
class Link : public std::enable_shared_from_this<Link>
{
public:
    Link(std::unique_ptr<FrameConnection> connection, MainQueue& queue,
         TelephonyServer::NotificationCallback callback)
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
    // Notifications that may wait for the main queue, so that a server gone wild takes no endless
    // memory while the program is busy.
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
    const TelephonyServer::NotificationCallback _callback;
    std::size_t _waiting = 0;
};

class FrameTelephonyServerConnection final : public TelephonyServerConnection
{
public:
    FrameTelephonyServerConnection(std::shared_ptr<Link> link, FramePorts& ports)
        : _link(std::move(link)), _ports(ports)
    {
    }

    LogChannelResult createNetworkMonitorLogChannel(const std::string& localPortName) override
    {
        LogChannelResult result = _link->requestChannel(localPortName);
        if (result.error == 0)
            _ports.keepWhileValid(localPortName, _link);
        return result;
    }

private:
    std::shared_ptr<Link> _link;
    FramePorts& _ports;
};

} // namespace

FrameTelephonyServer::FrameTelephonyServer(FrameTransport& transport, FramePorts& ports,
                                           MainQueue& mainQueue)
    : _transport(transport), _ports(ports), _mainQueue(mainQueue)
{
}

std::unique_ptr<TelephonyServerConnection>
FrameTelephonyServer::createConnection(NotificationCallback callback)
{
    std::string error;
    auto connection = _transport.connect(kTelephonyServerPort, error);
    if (!connection)
        return nullptr;
    return std::make_unique<FrameTelephonyServerConnection>(
        std::make_shared<Link>(std::move(connection), _mainQueue, std::move(callback)), _ports);
}

} // namespace orvane
